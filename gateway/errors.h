// One class per kind of failure, named by its identifier. The constructor's parameters are the
// values of its message, in order; the texts belong to the host.
#pragma once

#include <cstdint>
#include <string>
#include <utility>

#include "host/message_id.h"

namespace TOLVEX::ambrix {

/// Values are moved into their places; a list in braces would copy each text.
struct ComponentError : MessageId {
  template <typename... Values>
  ComponentError(const char* component_, const char* name, Values&&... given)
      : MessageId(component_, name) {
    values.reserve(sizeof...(given));
    (values.emplace_back(std::forward<Values>(given)), ...);
  }
};

}  // namespace TOLVEX::ambrix

namespace TOLVEX::ambrix::cdflib {

struct Error : ComponentError {
  template <typename... Values>
  explicit Error(const char* name, Values&&... given)
      : ComponentError("TOLVEX:ambrix:cdflib", name, std::forward<Values>(given)...) {}
};

struct badDimSpec : Error {
  badDimSpec(std::int64_t dimensions, std::string variable)
      : Error("badDimSpec", dimensions, std::move(variable)) {}
};

// The same two values as badDimSpec in the opposite order: a catalogue's text takes values by their
// position.
struct badDimensionExtent : Error {
  badDimensionExtent(std::string variable, std::int64_t dimensions)
      : Error("badDimensionExtent", std::move(variable), dimensions) {}
};

struct badEpoch16Modulus : Error {
  badEpoch16Modulus() : Error("badEpoch16Modulus") {}
};

struct badEpochVector : Error {
  explicit badEpochVector(std::int64_t components) : Error("badEpochVector", components) {}
};

struct badPutAttrEntryDatatype : Error {
  badPutAttrEntryDatatype(std::string className, std::string datatype)
      : Error("badPutAttrEntryDatatype", std::move(className), std::move(datatype)) {}
};

struct badVarianceDatatype : Error {
  badVarianceDatatype() : Error("badVarianceDatatype") {}
};

struct cannotOmitDimSpec : Error {
  cannotOmitDimSpec() : Error("cannotOmitDimSpec") {}
};

struct datatypeMismatch : Error {
  datatypeMismatch(std::string className, std::string datatype)
      : Error("datatypeMismatch", std::move(className), std::move(datatype)) {}
};

struct dimSizeTooLarge : Error {
  dimSizeTooLarge() : Error("dimSizeTooLarge") {}
};

struct fileCreateError : Error {
  fileCreateError() : Error("fileCreateError") {}
};

struct fileOpenError : Error {
  fileOpenError() : Error("fileOpenError") {}
};

struct illegalEpochValue : Error {
  illegalEpochValue() : Error("illegalEpochValue") {}
};

struct invalidCharError : Error {
  invalidCharError() : Error("invalidCharError") {}
};

/// Also issued as a warning.
struct invalidCompressionParameter : Error {
  invalidCompressionParameter(std::int64_t parameter, std::string shortTypeName)
      : Error("invalidCompressionParameter", parameter, std::move(shortTypeName)) {}
};

struct invalidFileId : Error {
  invalidFileId() : Error("invalidFileId") {}
};

struct invalidOperation : Error {
  explicit invalidOperation(std::string command) : Error("invalidOperation", std::move(command)) {}
};

struct libraryFailure : Error {
  libraryFailure(std::string routine, std::string statusText)
      : Error("libraryFailure", std::move(routine), std::move(statusText)) {}
};

struct mismatchedVarianceSize : Error {
  mismatchedVarianceSize(std::int64_t variances, std::int64_t dimensions)
      : Error("mismatchedVarianceSize", variances, dimensions) {}
};

struct unrecognizedConstantName : Error {
  explicit unrecognizedConstantName(std::string name)
      : Error("unrecognizedConstantName", std::move(name)) {}
};

struct unrecognizedValue : Error {
  unrecognizedValue(std::int64_t value, std::string kind)
      : Error("unrecognizedValue", value, std::move(kind)) {}
};

struct unspecifiedGzipCompressionLevel : Error {
  unspecifiedGzipCompressionLevel() : Error("unspecifiedGzipCompressionLevel") {}
};

struct varCacheSizeOpInappropriate : Error {
  varCacheSizeOpInappropriate() : Error("varCacheSizeOpInappropriate") {}
};

struct wrongNumberOfHyperPutVarDataElements : Error {
  wrongNumberOfHyperPutVarDataElements(std::string counts, std::int64_t records,
                                       std::string variable, std::int64_t expected)
      : Error("wrongNumberOfHyperPutVarDataElements", std::move(counts), records,
              std::move(variable), expected) {}
};

struct wrongNumberOfPadValueElements : Error {
  wrongNumberOfPadValueElements(std::string variable, std::int64_t expected)
      : Error("wrongNumberOfPadValueElements", std::move(variable), expected) {}
};

struct wrongNumberOfPutVarDataElements : Error {
  wrongNumberOfPutVarDataElements(std::string variable, std::int64_t expected)
      : Error("wrongNumberOfPutVarDataElements", std::move(variable), expected) {}
};

struct wrongNumberOfPutVarRecordDataElements : Error {
  wrongNumberOfPutVarRecordDataElements(std::string variable, std::int64_t expected)
      : Error("wrongNumberOfPutVarRecordDataElements", std::move(variable), expected) {}
};

/// Issued only as a warning, at unload.
struct closingFileHandle : Error {
  closingFileHandle() : Error("closingFileHandle") {}
};

}  // namespace TOLVEX::ambrix::cdflib

namespace TOLVEX::ambrix::validate {

struct Error : ComponentError {
  template <typename... Values>
  explicit Error(const char* name, Values&&... given)
      : ComponentError("TOLVEX:ambrix:validate", name, std::forward<Values>(given)...) {}
};

struct argumentNotDoublePrecision : Error {
  explicit argumentNotDoublePrecision(std::string label)
      : Error("argumentNotDoublePrecision", std::move(label)) {}
};

struct argumentNotDoubleScalar : Error {
  explicit argumentNotDoubleScalar(std::string label)
      : Error("argumentNotDoubleScalar", std::move(label)) {}
};

struct argumentNotUint64Scalar : Error {
  explicit argumentNotUint64Scalar(std::string label)
      : Error("argumentNotUint64Scalar", std::move(label)) {}
};

struct argumentOutOfBounds : Error {
  argumentOutOfBounds() : Error("argumentOutOfBounds") {}
};

struct wrongNumberOfInputs : Error {
  wrongNumberOfInputs() : Error("wrongNumberOfInputs") {}
};

}  // namespace TOLVEX::ambrix::validate
