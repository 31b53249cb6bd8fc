#include "variables/characters.h"

namespace TOLVEX::ambrix {

void widenCharacters(const char* bytes, std::size_t count, char16_t* characters) {
  for (std::size_t i = 0; i < count; ++i) {
    characters[i] = static_cast<char16_t>(static_cast<signed char>(bytes[i]));
  }
}

void narrowCharacters(const char16_t* characters, std::size_t count, char* bytes) {
  for (std::size_t i = 0; i < count; ++i)
    bytes[i] = static_cast<char>(characters[i] & 0xFF);
}

}  // namespace TOLVEX::ambrix
