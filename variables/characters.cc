#include "variables/characters.h"

namespace TOLVEX::ambrix {
namespace {

constexpr std::size_t kVector = 16;

/// Two loops, because that is what compilers vectorise without being asked for more than -O2: one
/// over a multiple of a vector's length, the arrays known to be apart.
template <typename From, typename To, typename Convert>
void convertEach(const From* __restrict from, std::size_t count, To* __restrict to,
                 const Convert& convert) {
  const std::size_t inVectors = count & ~(kVector - 1);
  for (std::size_t i = 0; i < inVectors; ++i)
    to[i] = convert(from[i]);
  for (std::size_t i = inVectors; i < count; ++i)
    to[i] = convert(from[i]);
}

}  // namespace

void widenCharacters(const char* bytes, std::size_t count, char16_t* characters) {
  convertEach(bytes, count, characters,
              [](char byte) { return static_cast<char16_t>(static_cast<signed char>(byte)); });
}

void narrowCharacters(const char16_t* characters, std::size_t count, char* bytes) {
  convertEach(characters, count, bytes,
              [](char16_t character) { return static_cast<char>(character & 0xFF); });
}

}  // namespace TOLVEX::ambrix
