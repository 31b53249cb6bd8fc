// The allocator and the text functions that the module calls.
#include <algorithm>
#include <cstring>
#include <optional>
#include <span>
#include <string_view>

#include "adapters/catalogue/unicode.h"
#include "adapters/common/exported_interface.h"
#include "adapters/embedded/scratch.h"

void* qvMalloc(std::size_t bytes) {
  return ambrix::makeScratch(bytes);
}

void qvFree(void* memory) {
  ambrix::freeScratch(memory);
}

char* qvArrayToString(const qvArray* array) {
  if (qvGetClassID(array) != qvCHAR_CLASS) return nullptr;
  const std::span units(qvGetReadOnlyChars(array), qvGetNumberOfElements(array));
  auto* const text = static_cast<char*>(qvMalloc(units.size() + 1));
  *std::ranges::transform(units, text, [](char16_t unit) { return static_cast<char>(unit); }).out =
      '\0';
  return text;
}

char* qvUtf16ToNarrow(const char16_t* text, std::size_t length) {
  const std::optional<std::string> narrow = ambrix::catalogue::toValidUtf8({text, length});
  if (!narrow) return nullptr;
  void* const copy = qvMalloc(narrow->size() + 1);
  std::memcpy(copy, narrow->c_str(), narrow->size() + 1);
  return static_cast<char*>(copy);
}
