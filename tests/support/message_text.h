// Whole messages in one comparison: identifier, number, kinds and order of values.
#pragma once

#include <string>

#include "host/message_id.h"

namespace ambrix_test {

/// For example TOLVEX:ambrix:cdflib:unrecognizedValue(17, 'ENCODING'). Integers are bare, narrow
/// texts in quotes, UTF-16 texts in quotes after a u.
std::string messageText(const TOLVEX::ambrix::MessageId& id);

/// What a message of the component reads like.
template <typename... Values>
std::string cdflib(const char* identifier, Values... values) {
  return messageText({"TOLVEX:ambrix:cdflib", identifier, {TOLVEX::ambrix::MessageArg(values)...}});
}
template <typename... Values>
std::string validate(const char* identifier, Values... values) {
  return messageText(
      {"TOLVEX:ambrix:validate", identifier, {TOLVEX::ambrix::MessageArg(values)...}});
}

/// A failure of the library: the stand-in's text of the status.
inline std::string libraryFailure(const std::string& routine, long status) {
  return cdflib("libraryFailure", routine, "text of status " + std::to_string(status));
}

// The failed conversions that many commands share.
inline std::string notScalar(const char* label) {
  return validate("argumentNotDoubleScalar", label);
}
inline std::string unrecognized(long value, const char* kind) {
  return cdflib("unrecognizedValue", value, kind);
}

}  // namespace ambrix_test
