// Texts in arrays of characters, where each character is a byte of the file.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/export.h"

namespace ambrix {

/// The bytes of all characters: the low 8 bits of each.
AMBRIX_EXPORT std::string bytesOf(ArrayView characters);

/// The texts in an array, each of so many characters, as their bytes. Blanks and zero bytes at
/// their ends stay. Texts of no characters are one text.
AMBRIX_EXPORT std::vector<std::string> textsOf(ArrayView characters, std::size_t length);

/// The array of texts, one record each, for a variable of so many characters: shorter ones are
/// filled with blanks. Throws std::invalid_argument for one that is longer.
AMBRIX_EXPORT Array arrayOfTexts(std::span<const std::string> texts, std::size_t length);

}  // namespace ambrix
