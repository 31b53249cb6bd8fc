// JSON texts and strings in which each surrogate counts for itself, paired or not. JSON parsers
// work in UTF-8, which has no surrogates: while they are at work, each is one of the 2,048
// characters from U+10F800 on, and such a character, were it written, is the two of its surrogates.
#pragma once

#include <string>
#include <string_view>

namespace ambrix::tool {

/// A JSON text with every surrogate replaced, ready for a parser.
std::string hideSurrogates(std::string_view json);

/// An ASCII JSON text with the surrogates back.
std::string showSurrogates(std::string_view json);

/// UTF-16 of a string from a parsed text, with the surrogates back.
std::u16string showSurrogates(std::u16string_view units);

/// Appends a unit as \uXXXX.
void appendEscape(std::string& json, unsigned unit);

}  // namespace ambrix::tool
