#include "tests/conformance/probe.h"

#include <algorithm>
#include <cstring>

namespace probe {
namespace {

std::size_t elementBytes(qvClassID classId) {
  switch (classId) {
    case qvCHAR_CLASS:
    case qvINT16_CLASS:
    case qvUINT16_CLASS:
      return 2;
    case qvSINGLE_CLASS:
    case qvINT32_CLASS:
    case qvUINT32_CLASS:
      return 4;
    case qvDOUBLE_CLASS:
    case qvINT64_CLASS:
    case qvUINT64_CLASS:
      return 8;
    default:
      return 1;
  }
}

std::string differenceOfCells(const qvArray* expected, const qvArray* found) {
  for (std::size_t i = 0; i < qvGetNumberOfElements(expected); ++i) {
    const qvArray* const cell = qvGetCell(found, i);
    if (cell == nullptr) return "a cell is not set";
    const std::string inside = difference(qvGetCell(expected, i), cell);
    if (!inside.empty()) return "in a cell: " + inside;
  }
  return {};
}

}  // namespace

std::span<const double> doubles(const qvArray* array) {
  return {static_cast<const double*>(qvGetReadOnlyData(array)), qvGetNumberOfElements(array)};
}

std::size_t indexIn(const qvArray* array) {
  return static_cast<std::size_t>(doubles(array)[0]);
}

qvArray* textColumn(const std::vector<std::string>& texts) {
  qvArray* const column = qvCreateCellMatrix(texts.size(), 1);
  for (std::size_t i = 0; i < texts.size(); ++i)
    qvSetCell(column, i, qvCreateString(texts[i].c_str()));
  return column;
}

std::string difference(const qvArray* expected, const qvArray* found) {
  const qvClassID classId = qvGetClassID(expected);
  if (qvGetClassID(found) != classId) return std::string("the class ") + qvGetClassName(found);
  if (qvGetClassName(found) != std::string_view(qvGetClassName(expected)))
    return "the class's name";
  const std::span sizes(qvGetDimensions(expected), qvGetNumberOfDimensions(expected));
  const std::span others(qvGetDimensions(found), qvGetNumberOfDimensions(found));
  if (!std::ranges::equal(sizes, others)) return "the sizes";
  const std::size_t count = qvGetNumberOfElements(expected);
  if (qvGetNumberOfElements(found) != count) return "the number of elements";
  if (classId == qvCELL_CLASS) return differenceOfCells(expected, found);
  const bool same = count == 0 || std::memcmp(qvGetReadOnlyData(expected), qvGetReadOnlyData(found),
                                              count * elementBytes(classId)) == 0;
  return same ? "" : "the elements";
}

}  // namespace probe
