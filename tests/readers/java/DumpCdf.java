import java.io.*;
import java.lang.reflect.Array;
import uk.ac.bristol.star.cdf.*;

/**
 * Prints what jcdf finds in CDF files: an object of JSON per line and file. Run it with
 * -Dfile.encoding=ISO-8859-1, which makes a character of each byte of a text.
 */
public class DumpCdf {
  private final StringBuilder out = new StringBuilder();

  public static void main(String[] files) throws UnsupportedEncodingException {
    PrintStream stream = new PrintStream(System.out, false, "US-ASCII");
    for (String file : files) {
      DumpCdf dump = new DumpCdf();
      try {
        stream.println(dump.dump(new File(file)));
      } catch (IOException | RuntimeException exception) {
        dump.out.setLength(0);
        dump.out.append("{\"error\":");
        dump.text(exception.toString());
        stream.println(dump.out.append('}'));
      }
    }
    stream.flush();
  }

  private String dump(File file) throws IOException {
    CdfContent content = new CdfContent(new CdfReader(file));
    out.append("{\"rowMajor\":").append(content.getCdfInfo().getRowMajor());
    out.append(",\"variables\":[");
    String separator = "";
    for (Variable variable : content.getVariables()) {
      out.append(separator);
      dump(variable);
      separator = ",";
    }
    out.append("],\"attributes\":[");
    dumpAttributes(content);
    return out.append("]}").toString();
  }

  private void dump(Variable variable) throws IOException {
    out.append("{\"name\":");
    text(variable.getName());
    out.append(",\"datatype\":\"").append(variable.getDataType().getName());
    out.append("\",\"sizes\":");
    value(variable.getShaper().getDimSizes());
    out.append(",\"varies\":");
    value(variable.getShaper().getDimVarys());
    out.append(",\"zVariable\":").append(variable.isZVariable());
    out.append(",\"elements\":").append(variable.getDescriptor().numElems);
    out.append(",\"recordVaries\":").append(variable.getRecordVariance());
    out.append(",\"records\":[");
    Object work = variable.createRawValueArray();
    String error = "";
    try {
      for (int record = 0; record < variable.getRecordCount(); record++) {
        Object values = variable.readShapedRecord(record, true, work);
        out.append(record == 0 ? "" : ",");
        value(values);
      }
    } catch (RuntimeException exception) {
      error = exception.toString();
    }
    out.append("],\"error\":");
    text(error);
    out.append('}');
  }

  private void dumpAttributes(CdfContent content) {
    String separator = "";
    for (GlobalAttribute attribute : content.getGlobalAttributes()) {
      out.append(separator).append("{\"name\":");
      separator = ",";
      text(attribute.getName());
      out.append(",\"global\":true,\"entries\":[");
      AttributeEntry[] entries = attribute.getEntries();
      for (int entry = 0; entry < entries.length; entry++) {
        out.append(entry == 0 ? "" : ",");
        dump(entries[entry]);
      }
      out.append("]}");
    }
    for (VariableAttribute attribute : content.getVariableAttributes()) {
      out.append(separator).append("{\"name\":");
      separator = ",";
      text(attribute.getName());
      out.append(",\"global\":false,\"entries\":[");
      Variable[] variables = content.getVariables();
      for (int variable = 0; variable < variables.length; variable++) {
        out.append(variable == 0 ? "" : ",");
        dump(attribute.getEntry(variables[variable]));
      }
      out.append("]}");
    }
  }

  private void dump(AttributeEntry entry) {
    if (entry == null) {
      out.append("null");
      return;
    }
    out.append("[\"").append(entry.getDataType().getName()).append("\",");
    value(entry.getShapedValue());
    out.append(']');
  }

  /** A number, a text or an array of these. */
  private void value(Object value) {
    if (value == null) {
      out.append("null");
    } else if (value.getClass().isArray()) {
      out.append('[');
      for (int index = 0; index < Array.getLength(value); index++) {
        out.append(index == 0 ? "" : ",");
        value(Array.get(value, index));
      }
      out.append(']');
    } else if (value instanceof Double || value instanceof Float) {
      number(((Number) value).doubleValue());
    } else if (value instanceof Number || value instanceof Boolean) {
      out.append(value);
    } else {
      text(value.toString());
    }
  }

  private void number(double number) {
    boolean finite = !Double.isNaN(number) && !Double.isInfinite(number);
    out.append(finite ? Double.toString(number) : "\"" + number + "\"");
  }

  private void text(String text) {
    out.append('"');
    for (char unit : text.toCharArray()) {
      out.append(String.format("\\u%04x", (int) unit));
    }
    out.append('"');
  }
}
