// Host arrays as JSON: the VALUEs of the session protocol.
#pragma once

#include <string>
#include <string_view>

#include "ambrix/array.h"
#include "tool/json/text.h"

namespace ambrix::tool {

/// The array that a value stands for, in the full form {"class", "size", "data"} or a short one.
/// Throws `JsonError` when it stands for none, and `Error` when the array cannot be had.
Array readValue(const Json& value);

/// A non-negative integer. Throws `JsonError` for any other value.
std::size_t readCount(const Json& value);

/// Appends the full form of an array.
void appendValue(std::string& json, ArrayView array);

/// Appends a JSON string: units above 0x7E are escaped, so that the text is ASCII.
void appendString(std::string& json, std::u16string_view units);
/// The same for bytes, each as the character of its number.
void appendBytes(std::string& json, std::string_view bytes);
/// The same for a text for people: UTF-8 where it is valid, and else byte by byte.
void appendMessage(std::string& json, std::string_view text);

}  // namespace ambrix::tool
