#include <sstream>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

template <typename T>
void write(std::ostream& out, ArrayView array) {
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

void writeElements(std::ostream& out, ArrayView array) {
  switch (array.classId()) {
    case ClassId::kDouble:
      return write<double>(out, array);
    case ClassId::kSingle:
      return write<float>(out, array);
    case ClassId::kInt8:
      return write<std::int8_t>(out, array);
    case ClassId::kUint8:
      return write<std::uint8_t>(out, array);
    case ClassId::kInt16:
      return write<std::int16_t>(out, array);
    case ClassId::kUint16:
      return write<std::uint16_t>(out, array);
    case ClassId::kInt32:
      return write<std::int32_t>(out, array);
    case ClassId::kUint32:
      return write<std::uint32_t>(out, array);
    case ClassId::kUint64:
      return write<std::uint64_t>(out, array);
    case ClassId::kLogical:
      return write<bool>(out, array);
    case ClassId::kChar:
      return writeText(out, array);
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

std::vector<std::string> shown(const std::vector<Array>& arrays) {
  std::vector<std::string> texts;
  for (const Array& array : arrays)
    texts.push_back(shown(array));
  return texts;
}

}  // namespace ambrix_test
