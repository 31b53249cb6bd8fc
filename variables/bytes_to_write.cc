#include "variables/bytes_to_write.h"

#include <cdf.h>

#include <cstddef>
#include <cstring>

#include "gateway/errors.h"
#include "gateway/raise_error.h"
#include "variables/characters.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {

long elementsPerValue(const VariableDescription& description) {
  if (description.datatype == CDF_EPOCH16) return 2;
  return isCharacterDatatype(description.datatype) ? description.elements : 1;
}

bool hasElements(const qvArray* data, long expected) {
  return expected >= 0 && qvGetNumberOfElements(data) == static_cast<std::size_t>(expected);
}

void requireClassOfDatatype(const qvArray* data, long datatype) {
  if (qvGetClassID(data) == classIdForDatatype(datatype)) return;
  raiseError(cdflib::datatypeMismatch(qvGetClassName(data), datatypeName(datatype)));
}

BytesToWrite::BytesToWrite(const qvArray* data) : numbers_(qvGetReadOnlyData(data)) {
  if (qvGetClassID(data) != qvCHAR_CLASS) return;
  const std::size_t count = qvGetNumberOfElements(data);
  characters_.emplace(count);
  narrowCharacters(qvGetReadOnlyChars(data), count, characters_->data());
}

BytesToWrite BytesToWrite::firstCharacterOf(const qvArray* data) {
  BytesToWrite first(data);
  const std::size_t count = qvGetNumberOfElements(data);
  if (first.characters_ && count > 1) std::memset(first.characters_->data() + 1, 0, count - 1);
  return first;
}

void* BytesToWrite::bytes() const {
  static char nothing = '\0';
  if (characters_) return characters_->data();
  return numbers_ == nullptr ? &nothing : const_cast<void*>(numbers_);
}

}  // namespace TOLVEX::ambrix
