#include "tests/support/shown_array.h"

#include <ambrix/visit.h>

#include <iomanip>
#include <limits>
#include <span>
#include <sstream>

namespace ambrix_test {
namespace {

using ambrix::ArrayView;

template <typename T>
void writeElements(std::ostream& out, std::span<const T> values) {
  const char* separator = "";
  out << std::setprecision(std::numeric_limits<T>::max_digits10) << '[';
  for (const T value : values) {
    out << separator << +value;
    separator = " ";
  }
  out << ']';
}

// Characters beyond ASCII as \xFF80.
void writeElements(std::ostream& out, std::span<const char16_t> text) {
  out << '\'';
  for (const char16_t unit : text) {
    if (unit >= 0x20 && unit < 0x7F) {
      out << static_cast<char>(unit);
    } else {
      out << "\\x" << std::hex << std::uppercase << static_cast<unsigned>(unit) << std::dec;
    }
  }
  out << '\'';
}

void writeElements(std::ostream& out, ArrayView array) {
  out << '{';
  for (std::size_t i = 0; i < array.elementCount(); ++i)
    out << (i > 0 ? ", " : "") << shown(array.element(i));
  out << '}';
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
  visit(array, [&](auto elements) { writeElements(out, elements); });
  return out.str();
}

}  // namespace ambrix_test
