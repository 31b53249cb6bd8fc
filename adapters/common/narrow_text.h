// Bytes as 16-bit characters and back: every host takes the byte b as the unit b.
#pragma once

#include <algorithm>
#include <string_view>

namespace ambrix {

inline void widen(std::string_view bytes, char16_t* units) {
  std::ranges::transform(bytes, units, [](char byte) { return static_cast<unsigned char>(byte); });
}

/// The low 8 bits of each unit.
inline void narrow(std::u16string_view units, char* bytes) {
  std::ranges::transform(units, bytes, [](char16_t unit) { return static_cast<char>(unit); });
}

}  // namespace ambrix
