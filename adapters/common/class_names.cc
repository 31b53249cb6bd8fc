#include "adapters/common/class_names.h"

#include <cstddef>
#include <iterator>

namespace ambrix {
namespace {

// By number.
constexpr const char* kClassNames[] = {nullptr,  "cell",   "struct", "logical", "char",  nullptr,
                                       "double", "single", "int8",   "uint8",   "int16", "uint16",
                                       "int32",  "uint32", "int64",  "uint64"};

}  // namespace

const char* nameOfClass(qvClassID classId) noexcept {
  const auto number = static_cast<std::size_t>(classId);
  const char* const name = number < std::size(kClassNames) ? kClassNames[number] : nullptr;
  return name == nullptr ? "unknown" : name;
}

qvClassID classNamed(std::string_view name) noexcept {
  for (std::size_t number = 0; number < std::size(kClassNames); ++number) {
    if (kClassNames[number] != nullptr && name == kClassNames[number]) {
      return static_cast<qvClassID>(number);
    }
  }
  return qvUNKNOWN_CLASS;
}

}  // namespace ambrix
