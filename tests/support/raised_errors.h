// Every error class of the module, made on demand.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "gateway/errors.h"

namespace ambrix_test {

/// Makes an error with the integers 7 and 8 and these texts as its values, as far as it has any.
using ErrorMaker =
    std::function<TOLVEX::ambrix::MessageId(const std::string& first, const std::string& second)>;

inline std::vector<ErrorMaker> errorMakers() {
  namespace cdf = TOLVEX::ambrix::cdflib;
  namespace check = TOLVEX::ambrix::validate;
  using Text = const std::string&;
  return {
      [](Text a, Text) { return cdf::badDimSpec(7, a); },
      [](Text a, Text) { return cdf::badDimensionExtent(a, 7); },
      [](Text, Text) { return cdf::badEpoch16Modulus(); },
      [](Text, Text) { return cdf::badEpochVector(7); },
      [](Text a, Text b) { return cdf::badPutAttrEntryDatatype(a, b); },
      [](Text, Text) { return cdf::badVarianceDatatype(); },
      [](Text, Text) { return cdf::cannotOmitDimSpec(); },
      [](Text, Text) { return cdf::closingFileHandle(); },
      [](Text a, Text b) { return cdf::datatypeMismatch(a, b); },
      [](Text, Text) { return cdf::dimSizeTooLarge(); },
      [](Text, Text) { return cdf::fileCreateError(); },
      [](Text, Text) { return cdf::fileOpenError(); },
      [](Text, Text) { return cdf::illegalEpochValue(); },
      [](Text, Text) { return cdf::invalidCharError(); },
      [](Text a, Text) { return cdf::invalidCompressionParameter(7, a); },
      [](Text, Text) { return cdf::invalidFileId(); },
      [](Text a, Text) { return cdf::invalidOperation(a); },
      [](Text a, Text b) { return cdf::libraryFailure(a, b); },
      [](Text, Text) { return cdf::mismatchedVarianceSize(7, 8); },
      [](Text a, Text) { return cdf::unrecognizedConstantName(a); },
      [](Text a, Text) { return cdf::unrecognizedValue(7, a); },
      [](Text, Text) { return cdf::unspecifiedGzipCompressionLevel(); },
      [](Text, Text) { return cdf::varCacheSizeOpInappropriate(); },
      [](Text a, Text b) { return cdf::wrongNumberOfHyperPutVarDataElements(a, 7, b, 8); },
      [](Text a, Text) { return cdf::wrongNumberOfPadValueElements(a, 7); },
      [](Text a, Text) { return cdf::wrongNumberOfPutVarDataElements(a, 7); },
      [](Text a, Text) { return cdf::wrongNumberOfPutVarRecordDataElements(a, 7); },
      [](Text a, Text) { return check::argumentNotDoublePrecision(a); },
      [](Text a, Text) { return check::argumentNotDoubleScalar(a); },
      [](Text a, Text) { return check::argumentNotUint64Scalar(a); },
      [](Text, Text) { return check::argumentOutOfBounds(); },
      [](Text, Text) { return check::wrongNumberOfInputs(); },
  };
}

}  // namespace ambrix_test
