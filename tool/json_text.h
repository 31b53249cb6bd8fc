// JSON as requests are written in. Strings are UTF-16 to their writers, and any units may stand in
// them: a surrogate that is escaped on its own is accepted and given back, although it has no
// UTF-8.
#pragma once

#include <cstdint>
#include <map>
#include <nlohmann/json.hpp>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace ambrix::tool {

/// Numbers with a wider range than double, so that one beyond it is told apart from what is no
/// JSON.
using Json = nlohmann::basic_json<std::map, std::vector, std::string, bool, std::int64_t,
                                  std::uint64_t, long double>;

/// A text that is not JSON, or JSON that is not what was asked for.
class JsonError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// Parses one JSON value in UTF-8 and tells whether all its numbers are within the range of double.
/// Throws `JsonError` for anything else and for a value that is nested deeper than 512 levels.
Json parseJson(std::string_view text, bool& numbersInRange);

/// The UTF-16 units of a string. Throws `JsonError` for any other value.
std::u16string unitsOf(const Json& string);

/// The value as an ASCII text; numbers beyond the range of double become null.
std::string toAscii(const Json& value);

}  // namespace ambrix::tool
