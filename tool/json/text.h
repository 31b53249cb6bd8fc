// JSON as requests are written in. Strings are UTF-16 to their writers, and any units may stand in
// them: a surrogate that is escaped on its own is accepted and given back, although it has no
// UTF-8.
#pragma once

#include <nlohmann/json.hpp>
#include <stdexcept>
#include <string>
#include <string_view>

namespace ambrix::tool {

using Json = nlohmann::json;

/// A text that is not JSON, or JSON that is not what was asked for.
class JsonError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// JSON, as far as it was read, with a number beyond the range of double.
class JsonRangeError : public JsonError {
 public:
  using JsonError::JsonError;
};

/// Parses one JSON value in UTF-8. Throws `JsonError` for anything else, for a value that is nested
/// deeper than 512 levels and for numbers beyond the range of double.
Json parseJson(std::string_view text);

/// The UTF-16 units of a string. Throws `JsonError` for any other value.
std::u16string unitsOf(const Json& string);

/// The text of an object's member, the last of that name, with every digit as it was written, but
/// in ASCII and without line ends. Empty when there is none, or none that is JSON.
std::string memberText(std::string_view object, std::string_view name);

}  // namespace ambrix::tool
