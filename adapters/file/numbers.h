// Numbers as commands take and give them: doubles.
#pragma once

#include <cstddef>
#include <span>
#include <string>

#include "ambrix/array.h"
#include "ambrix/attribute.h"
#include "ambrix/variable.h"

namespace ambrix {

inline double numberOf(const Variable& variable) {
  return static_cast<double>(variable.number);
}
inline double numberOf(const Attribute& attribute) {
  return static_cast<double>(attribute.number);
}
/// A count from a command: 0 for one that is negative, as damaged files may have.
inline std::size_t sizeOf(double count) {
  return count > 0 ? static_cast<std::size_t>(count) : 0;
}

Array rowOf(std::span<const std::size_t> sizes);
/// With as few digits as tell it apart from others.
std::string shortest(double number);

}  // namespace ambrix
