// The text functions that the module calls.
#include <string>
#include <string_view>

#include "adapters/catalogue/unicode.h"
#include "adapters/common/narrow_text.h"
#include "adapters/common/scratch.h"
#include "adapters/octave/array_object.h"

char* qvArrayToString(const qvArray* array) {
  if (array->classId() != qvCHAR_CLASS) return nullptr;
  const charNDArray bytes = array->bytes();
  return ambrix::copyForModule({bytes.data(), static_cast<std::size_t>(bytes.numel())});
}

// Each unit is a byte of Octave's text, which is UTF-8 by convention, as are file names. So the
// bytes are the narrow form; bytes that are not UTF-8 stand for no character and have none.
char* qvUtf16ToNarrow(const char16_t* text, std::size_t length) {
  std::string bytes(length, '\0');
  ambrix::narrow({text, length}, bytes.data());
  return ambrix::catalogue::toUtf16(bytes) ? ambrix::copyForModule(bytes) : nullptr;
}
