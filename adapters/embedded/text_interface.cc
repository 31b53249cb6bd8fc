// The text functions that the module calls.
#include <optional>
#include <string>
#include <string_view>

#include "adapters/catalogue/unicode.h"
#include "adapters/common/exported_interface.h"
#include "adapters/common/narrow_text.h"
#include "adapters/common/scratch.h"

char* qvArrayToString(const qvArray* array) {
  if (qvGetClassID(array) != qvCHAR_CLASS) return nullptr;
  const std::u16string_view units(qvGetReadOnlyChars(array), qvGetNumberOfElements(array));
  auto* const text = static_cast<char*>(qvMalloc(units.size() + 1));
  ambrix::narrow(units, text);
  text[units.size()] = '\0';
  return text;
}

char* qvUtf16ToNarrow(const char16_t* text, std::size_t length) {
  const std::optional<std::string> narrow = ambrix::catalogue::toValidUtf8({text, length});
  return narrow ? ambrix::copyForModule(*narrow) : nullptr;
}
