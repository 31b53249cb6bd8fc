#include "file/compression.h"

#include <cdf.h>

#include <string>

#include "constants/checked_values.h"
#include "constants/value_names.h"
#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library_calls.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

struct Compression {
  long type = 0;
  long parameters[CDF_MAX_PARMS] = {};  // the library may fill all; the first one counts
  long percentage = 0;
};

const std::string& typeName(const Compression& compression) {
  return lookupValueName(CompressionNames, compression.type, "COMPRESSION");
}

/// "RLE", "HUFF" or "AHUFF".
std::string shortTypeName(const Compression& compression) {
  const std::string& name = typeName(compression);
  return name.substr(0, name.find('_'));
}

qvArray* emptyDouble() {
  return qvCreateNumericMatrix(0, 0, qvDOUBLE_CLASS, qvREAL);
}

qvArray* fileParameter(const Compression& compression) {
  switch (compression.type) {
    case RLE_COMPRESSION:
      return qvCreateString("RLE_OF_ZEROS");
    case HUFF_COMPRESSION:
    case AHUFF_COMPRESSION:
      return qvCreateString("OPTIMAL_ENCODING_TREES");
    case GZIP_COMPRESSION:
      return makeDoubleScalar(compression.parameters[0]);
    default:
      return emptyDouble();
  }
}

// Results differ from those of a file: the parameter is checked, and "RLE_OF_ZEROs" ends in a small
// s. Programs can compare these texts.
qvArray* variableParameter(const Compression& compression) {
  const long parameter = compression.parameters[0];
  if (compression.type == NO_COMPRESSION) return emptyDouble();
  if (compression.type == GZIP_COMPRESSION) return makeDoubleScalar(parameter);
  if (parameter != 0) {
    qvWarningMsgId(cdflib::invalidCompressionParameter(parameter, shortTypeName(compression)));
    return makeDoubleScalar(parameter);
  }
  return qvCreateString(compression.type == RLE_COMPRESSION ? "RLE_OF_ZEROs"
                                                            : "OPTIMAL_ENCODING_TREES");
}

// Parameters beyond 32 bits become one that no type accepts.
long libraryParameter(long parameter) {
  return libraryNumber(parameter, kBadNumber);
}

}  // namespace

void getCompression(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  Compression found;
  callOnFile("CDFgetCompression", file, GET_,  //
             CDF_COMPRESSION_, &found.type, found.parameters, &found.percentage);
  const std::string& name = typeName(found);
  setOutputs(outputs, {qvCreateString(name.c_str()), fileParameter(found),
                       makeDoubleScalar(found.percentage)});
}

void getVarCompression(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                       const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  Compression found;
  VariableOperation(file, variableNumber, "CDFgetzVarCompression")
      .call(GET_, zVAR_COMPRESSION_, &found.type, found.parameters, &found.percentage);
  const std::string& name = typeName(found);
  setOutputs(outputs, {qvCreateString(name.c_str()), variableParameter(found),
                       makeDoubleScalar(found.percentage)});
}

// A gzip level outside 1 to 9 has an error of its own here. Without the check the library would
// refuse it (BAD_COMPRESSION_PARM), as it does for a variable.
void setCompression(int, qvArray*[], std::int32_t argumentCount, const qvArray* arguments[],
                    const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long type = getLongScalarArg(arguments[1], "TYPE");
  checkCompressionType(type);
  long parameters[CDF_MAX_PARMS] = {};
  if (argumentCount > 2) {
    parameters[0] = getLongScalarArg(arguments[2], "CPARM");
    if (type == GZIP_COMPRESSION && (parameters[0] < 1 || parameters[0] > 9)) {
      raiseError(cdflib::invalidCompressionParameter(parameters[0], "GZIP"));
    }
  } else if (type == GZIP_COMPRESSION) {
    raiseError(cdflib::unspecifiedGzipCompressionLevel());
  }
  parameters[0] = libraryParameter(parameters[0]);
  callOnFile("CDFsetCompression", file, PUT_, CDF_COMPRESSION_, type, parameters);
}

// The gzip level is left to the library, which refuses one outside 1 to 9 (BAD_COMPRESSION_PARM).
void setVarCompression(int, qvArray*[], std::int32_t argumentCount, const qvArray* arguments[],
                       const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long type = getLongScalarArg(arguments[2], "CTYPE");
  checkCompressionType(type);
  long parameters[CDF_MAX_PARMS] = {};
  if (argumentCount > 3) {
    parameters[0] = libraryParameter(getLongScalarArg(arguments[3], "CPARM"));
  } else if (type == GZIP_COMPRESSION) {
    raiseError(cdflib::unspecifiedGzipCompressionLevel());
  }
  VariableOperation(file, variableNumber, "CDFsetzVarCompression")
      .call(PUT_, zVAR_COMPRESSION_, type, parameters);
}

}  // namespace TOLVEX::ambrix
