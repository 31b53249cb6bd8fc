// The text functions that the module calls.
#include <algorithm>
#include <cstring>
#include <span>
#include <string>

#include "adapters/catalogue/unicode.h"
#include "adapters/octave/octave_array.h"

namespace {

char* copyOf(const char* bytes, std::size_t count) {
  auto* const copy = static_cast<char*>(qvMalloc(count + 1));
  if (count > 0) std::memcpy(copy, bytes, count);
  copy[count] = '\0';
  return copy;
}

}  // namespace

char* qvArrayToString(const qvArray* array) {
  if (array->classId() != qvCHAR_CLASS) return nullptr;
  const charNDArray bytes = array->bytes();
  return copyOf(bytes.data(), static_cast<std::size_t>(bytes.numel()));
}

// Each unit is a byte of Octave's text, which is UTF-8 by convention, as are file names. So the
// bytes are the narrow form; bytes that are not UTF-8 stand for no character and have none.
char* qvUtf16ToNarrow(const char16_t* text, std::size_t length) {
  const std::span units(text, length);
  std::string bytes(length, '\0');
  std::ranges::transform(units, bytes.begin(),
                         [](char16_t unit) { return static_cast<char>(unit); });
  if (!ambrix::catalogue::toUtf16(bytes)) return nullptr;
  return copyOf(bytes.data(), bytes.size());
}
