// The bytes that the library reads of a host array, and the checks that come before.
#pragma once

#include <optional>

#include "gateway/scratch.h"
#include "host/qv.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {

/// Host elements of one value: 2 doubles of an epoch16, the characters of a text, else 1.
long elementsPerValue(const VariableDescription& description);

bool hasElements(const qvArray* data, long expected);

/// Raises `unrecognizedValue` (code, "DATATYPE") for an unsupported datatype, then
/// `datatypeMismatch` unless the array has exactly the class of the datatype.
void requireClassOfDatatype(const qvArray* data, long datatype);

/// A host array's data as they are, or its characters narrowed to bytes with a zero byte behind
/// them.
class BytesToWrite {
 public:
  explicit BytesToWrite(const qvArray* data);
  /// Of a text the first character only, followed by zeros up to its length.
  static BytesToWrite firstCharacterOf(const qvArray* data);

  /// Never null, so that the library can be handed an empty value.
  [[nodiscard]] void* bytes() const;

 private:
  const void* numbers_;
  std::optional<ScratchBuffer> characters_;
};

}  // namespace TOLVEX::ambrix
