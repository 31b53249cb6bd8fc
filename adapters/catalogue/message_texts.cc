#include "adapters/catalogue/message_texts.h"

namespace ambrix::catalogue {
namespace {

struct MessageText {
  std::string_view identifier;  // component, colon, name
  std::string_view text;        // what is wrong, then what to do
};

// Each text takes its values in the order in which the message carries them.
constexpr MessageText kTexts[] = {
    {"TOLVEX:ambrix:cdflib:badDimSpec",
     "Variable \"{2}\" has {1} dimensions: give one number for each of them, in every vector of "
     "indices, starts, counts or intervals."},
    {"TOLVEX:ambrix:cdflib:badDimensionExtent",
     "Variable \"{1}\" has {2} dimensions: give one index for each of them."},
    {"TOLVEX:ambrix:cdflib:badEpoch16Modulus",
     "Each EPOCH16 time is two numbers, seconds and picoseconds: give an even number of elements."},
    {"TOLVEX:ambrix:cdflib:badEpochVector",
     "Each time takes {1} components: give a double array whose number of elements is a multiple "
     "of {1}."},
    {"TOLVEX:ambrix:cdflib:badPutAttrEntryDatatype",
     "A value of class {1} can't be written as an entry of datatype {2}: convert the value to the "
     "class of the datatype, or give the datatype that fits the value."},
    {"TOLVEX:ambrix:cdflib:badVarianceDatatype",
     "A variance must be a logical or a double array: -1 or true where values vary, else 0 or "
     "false."},
    {"TOLVEX:ambrix:cdflib:cannotOmitDimSpec",
     "The indices can be left out only for a variable without dimensions: give one index for each "
     "dimension."},
    {"TOLVEX:ambrix:cdflib:closingFileHandle",
     "Files were still open when the module was unloaded; they are being closed now. Close each "
     "file when it is no longer needed."},
    {"TOLVEX:ambrix:cdflib:datatypeMismatch",
     "Data of class {1} don't fit a variable of datatype {2}: convert them to the class of the "
     "variable first."},
    {"TOLVEX:ambrix:cdflib:dimSizeTooLarge",
     "A count is greater than the size of its dimension: ask for no more values than the variable "
     "has along each dimension."},
    {"TOLVEX:ambrix:cdflib:fileCreateError",
     "The file could not be created: see that its name is valid, that its folder exists and can be "
     "written to, and that there is no such file yet."},
    {"TOLVEX:ambrix:cdflib:fileOpenError",
     "The file could not be opened: see that it exists, that it can be read and that it is a CDF "
     "file."},
    {"TOLVEX:ambrix:cdflib:illegalEpochValue",
     "The components are not a valid time: check that each is in its range."},
    {"TOLVEX:ambrix:cdflib:invalidCharError",
     "The file name has a character that file names can't have here: see that it is valid text."},
    {"TOLVEX:ambrix:cdflib:invalidCompressionParameter",
     "{2} compression has no parameter {1}: GZIP takes a level from 1 to 9, the other types 0."},
    {"TOLVEX:ambrix:cdflib:invalidFileId",
     "The file identifier is not open: use one that \"open\" or \"create\" has returned and that "
     "has not been closed or deleted since."},
    {"TOLVEX:ambrix:cdflib:invalidOperation",
     "There is no command \"{1}\": see that it is spelled exactly, upper and lower case included."},
    {"TOLVEX:ambrix:cdflib:libraryFailure", "The CDF library reports in {1}: {2}"},
    {"TOLVEX:ambrix:cdflib:mismatchedVarianceSize",
     "There are {1} dimension variances for {2} dimensions: give one variance for each dimension."},
    {"TOLVEX:ambrix:cdflib:unrecognizedConstantName",
     "There is no constant \"{1}\": \"getConstantNames\" lists all constants."},
    {"TOLVEX:ambrix:cdflib:unrecognizedValue",
     "The value {1} has no meaning as {2}: use one of the CDF library's constants, which "
     "\"getConstantValue\" gives by name."},
    {"TOLVEX:ambrix:cdflib:unspecifiedGzipCompressionLevel",
     "GZIP compression needs a level: give a number from 1 (fast) to 9 (small)."},
    {"TOLVEX:ambrix:cdflib:varCacheSizeOpInappropriate",
     "Variables have cache sizes of their own only in multi-file CDFs; in a single-file CDF set "
     "the cache size of the file."},
    {"TOLVEX:ambrix:cdflib:wrongNumberOfHyperPutVarDataElements",
     "Counts {1} in {2} records of variable \"{3}\" take {4} values: give exactly as many."},
    {"TOLVEX:ambrix:cdflib:wrongNumberOfPadValueElements",
     "The pad value of variable \"{1}\" must have the number of elements {2}."},
    {"TOLVEX:ambrix:cdflib:wrongNumberOfPutVarDataElements",
     "One value of variable \"{1}\" has the number of elements {2}: give exactly as many."},
    {"TOLVEX:ambrix:cdflib:wrongNumberOfPutVarRecordDataElements",
     "One record of variable \"{1}\" has the number of elements {2}: give exactly as many."},
    {"TOLVEX:ambrix:validate:argumentNotDoublePrecision",
     "Argument {1} must be of class double: convert it first."},
    {"TOLVEX:ambrix:validate:argumentNotDoubleScalar",
     "Argument {1} must be a single number of class double."},
    {"TOLVEX:ambrix:validate:argumentNotUint64Scalar",
     "Argument {1} must be a single number of class uint64: use the identifier as \"open\" or "
     "\"create\" has returned it."},
    {"TOLVEX:ambrix:validate:argumentOutOfBounds",
     "A number is too large for a signed 64-bit integer: give one between -2^63 and 2^63."},
    {"TOLVEX:ambrix:validate:wrongNumberOfInputs",
     "The number of arguments is wrong: see the description of the command."},
    {"TOLVEX:host:badDimension",
     "An array can't have a negative size: see that every count asked for is 0 or more."},
    {"TOLVEX:host:outOfMemory",
     "There is not enough memory: ask for less at a time, or raise the limit on array sizes."},
    {"TOLVEX:host:unexpectedFailure",
     "The command failed in an unforeseen way ({1}): see that its name and file names are texts."},
};

bool isFor(const MessageText& entry, std::string_view component, std::string_view identifier) {
  const std::string_view whole = entry.identifier;
  return whole.size() == component.size() + 1 + identifier.size() && whole.ends_with(identifier) &&
         whole.starts_with(component) && whole[component.size()] == ':';
}

}  // namespace

std::string_view findText(std::string_view component, std::string_view identifier) {
  for (const MessageText& entry : kTexts) {
    if (isFor(entry, component, identifier)) return entry.text;
  }
  return {};
}

}  // namespace ambrix::catalogue
