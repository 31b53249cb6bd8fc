#include "tests/support/known_messages.h"

namespace ambrix_test {

const std::vector<KnownMessage>& knownMessages() {
  constexpr const char* kCdflib = "TOLVEX:ambrix:cdflib";
  constexpr const char* kValidate = "TOLVEX:ambrix:validate";
  constexpr const char* kHost = "TOLVEX:host";
  static const std::vector<KnownMessage> kAll = {
      {{kCdflib, "badDimSpec", {7, "first"}}, {"\"first\"", "has 7 dimensions"}},
      {{kCdflib, "badDimensionExtent", {"first", 7}}, {"\"first\"", "has 7 dimensions"}},
      {{kCdflib, "badEpoch16Modulus"}, {}},
      {{kCdflib, "badEpochVector", {7}}, {"takes 7 components", "multiple of 7"}},
      {{kCdflib, "badPutAttrEntryDatatype", {"first", "second"}}, {"first", "second"}},
      {{kCdflib, "badVarianceDatatype"}, {}},
      {{kCdflib, "cannotOmitDimSpec"}, {}},
      {{kCdflib, "closingFileHandle"}, {}},
      {{kCdflib, "datatypeMismatch", {"first", "second"}}, {"first", "second"}},
      {{kCdflib, "dimSizeTooLarge"}, {}},
      {{kCdflib, "fileCreateError"}, {}},
      {{kCdflib, "fileOpenError"}, {}},
      {{kCdflib, "illegalEpochValue"}, {}},
      {{kCdflib, "invalidCharError"}, {}},
      {{kCdflib, "invalidCompressionParameter", {7, "first"}}, {"first", "7"}},
      {{kCdflib, "invalidFileId"}, {}},
      {{kCdflib, "invalidOperation", {"first"}}, {"\"first\""}},
      {{kCdflib, "libraryFailure", {"first", "second"}}, {"first", "second"}},
      {{kCdflib, "mismatchedVarianceSize", {7, 8}}, {"7 dimension variances", "8 dimensions"}},
      {{kCdflib, "unrecognizedConstantName", {"first"}}, {"\"first\""}},
      {{kCdflib, "unrecognizedValue", {7, "first"}}, {"7", "first"}},
      {{kCdflib, "unspecifiedGzipCompressionLevel"}, {}},
      {{kCdflib, "varCacheSizeOpInappropriate"}, {}},
      {{kCdflib, "wrongNumberOfHyperPutVarDataElements", {"first", 7, "second", 8}},
       {"first", "7 records", "\"second\"", "8 values"}},
      {{kCdflib, "wrongNumberOfPadValueElements", {"first", 7}}, {"\"first\"", "7"}},
      {{kCdflib, "wrongNumberOfPutVarDataElements", {"first", 7}}, {"\"first\"", "7"}},
      {{kCdflib, "wrongNumberOfPutVarRecordDataElements", {"first", 7}}, {"\"first\"", "7"}},
      {{kValidate, "argumentNotDoublePrecision", {"first"}}, {"first"}},
      {{kValidate, "argumentNotDoubleScalar", {"first"}}, {"first"}},
      {{kValidate, "argumentNotUint64Scalar", {"first"}}, {"first"}},
      {{kValidate, "argumentOutOfBounds"}, {}},
      {{kValidate, "wrongNumberOfInputs"}, {}},
      {{kHost, "badDimension"}, {}},
      {{kHost, "outOfMemory"}, {}},
      {{kHost, "unexpectedFailure", {"first"}}, {"first"}},
  };
  return kAll;
}

}  // namespace ambrix_test
