#include "tests/support/shown_array.h"

#include <cstdint>
#include <iomanip>
#include <sstream>

namespace ambrix_test {
namespace {

using ambrix::ArrayView;
using ambrix::ClassId;

template <typename T>
void writeNumbers(std::ostream& out, ArrayView array) {
  const char* separator = "";
  out << '[';
  for (const T value : array.data<T>()) {
    out << separator << +value;
    separator = " ";
  }
  out << ']';
}

// Characters beyond ASCII as \xFF80.
void writeText(std::ostream& out, ArrayView array) {
  out << '\'';
  for (const char16_t unit : array.chars()) {
    if (unit >= 0x20 && unit < 0x7F) {
      out << static_cast<char>(unit);
    } else {
      out << "\\x" << std::hex << std::uppercase << static_cast<unsigned>(unit) << std::dec;
    }
  }
  out << '\'';
}

void writeCells(std::ostream& out, ArrayView array) {
  out << '{';
  for (std::size_t i = 0; i < array.elementCount(); ++i)
    out << (i > 0 ? ", " : "") << shown(array.element(i));
  out << '}';
}

void writeElements(std::ostream& out, ArrayView array) {
  switch (array.classId()) {
    case ClassId::kDouble:
      return writeNumbers<double>(out << std::setprecision(17), array);
    case ClassId::kSingle:
      return writeNumbers<float>(out << std::setprecision(9), array);
    case ClassId::kInt8:
      return writeNumbers<std::int8_t>(out, array);
    case ClassId::kUint8:
      return writeNumbers<std::uint8_t>(out, array);
    case ClassId::kInt16:
      return writeNumbers<std::int16_t>(out, array);
    case ClassId::kUint16:
      return writeNumbers<std::uint16_t>(out, array);
    case ClassId::kInt32:
      return writeNumbers<std::int32_t>(out, array);
    case ClassId::kUint32:
      return writeNumbers<std::uint32_t>(out, array);
    case ClassId::kUint64:
      return writeNumbers<std::uint64_t>(out, array);
    case ClassId::kLogical:
      return writeNumbers<bool>(out, array);
    case ClassId::kChar:
      return writeText(out, array);
    case ClassId::kCell:
      return writeCells(out, array);
    default:
      out << '?';
  }
}

}  // namespace

std::string shown(ArrayView array) {
  if (!array) return "nothing";
  std::ostringstream out;
  out << array.className() << ' ';
  const char* separator = "";
  for (const std::size_t size : array.size()) {
    out << separator << size;
    separator = "x";
  }
  out << ' ';
  writeElements(out, array);
  return out.str();
}

}  // namespace ambrix_test
