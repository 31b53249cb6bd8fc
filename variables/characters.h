// Characters on their way between the host's 16 bits and the library's bytes.
#pragma once

#include <cstddef>

namespace TOLVEX::ambrix {

/// Each byte as a signed 8-bit value: 0x80 and above become 0xFF80 and above.
void widenCharacters(const char* bytes, std::size_t count, char16_t* characters);

/// The low 8 bits of each character.
void narrowCharacters(const char16_t* characters, std::size_t count, char* bytes);

}  // namespace TOLVEX::ambrix
