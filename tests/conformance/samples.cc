// Arrays that a user of the host gets as results and passes back as arguments.
#include <cmath>
#include <cstdint>
#include <cstring>
#include <initializer_list>
#include <limits>

#include "tests/conformance/probe.h"

namespace probe {
namespace {

template <typename T, qvClassID classId>
qvArray* extremes() {
  using Limits = std::numeric_limits<T>;
  const T values[] = {Limits::lowest(), Limits::min(), T(0), T(1), Limits::max(), T(100)};
  qvArray* const array = qvCreateNumericMatrix(2, 3, classId, qvREAL);
  std::memcpy(qvGetData(array), values, sizeof(values));
  return array;
}

template <typename T, qvClassID classId>
qvArray* greatest() {
  const T value = std::numeric_limits<T>::max();
  qvArray* const array = qvCreateNumericMatrix(1, 1, classId, qvREAL);
  std::memcpy(qvGetData(array), &value, sizeof(value));
  return array;
}

qvArray* oddNumbers() {
  const double values[] = {-0.0, std::nan(""), INFINITY, -INFINITY, 5e-324};
  const std::size_t count = std::size(values);
  qvArray* const array = qvCreateUninitNumericArray(1, &count, qvDOUBLE_CLASS, qvREAL);
  std::memcpy(qvGetData(array), values, sizeof(values));
  return array;
}

qvArray* counted(std::initializer_list<std::size_t> sizes) {
  qvArray* const array =
      qvCreateNumericArray(sizes.size(), std::data(sizes), qvDOUBLE_CLASS, qvREAL);
  auto* const values = static_cast<double*>(qvGetData(array));
  for (std::size_t i = 0; i < qvGetNumberOfElements(array); ++i)
    values[i] = static_cast<double>(i);
  return array;
}

qvArray* logicals() {
  const std::size_t sizes[] = {2, 2};
  qvArray* const array = qvCreateLogicalArray(2, sizes);
  static_cast<bool*>(qvGetData(array))[1] = true;
  return array;
}

qvArray* allBytes() {
  const std::size_t sizes[] = {1, 256};
  qvArray* const array = qvCreateCharArray(2, sizes);
  for (unsigned unit = 0; unit < 256; ++unit)
    qvGetChars(array)[unit] = static_cast<char16_t>(unit);
  return array;
}

qvArray* textInRows() {
  const std::size_t sizes[] = {2, 3};
  qvArray* const array = qvCreateCharArray(2, sizes);
  std::memcpy(qvGetChars(array), u"adbecf", 6 * sizeof(char16_t));
  return array;
}

qvArray* nestedCells() {
  qvArray* const inner = qvCreateCellMatrix(1, 2);
  qvSetCell(inner, 0, qvCreateNumericMatrix(1, 1, qvINT8_CLASS, qvREAL));
  qvSetCell(inner, 1, qvCreateString("text"));
  qvArray* const outer = qvCreateCellMatrix(2, 1);
  qvSetCell(outer, 0, inner);
  qvSetCell(outer, 1, counted({2, 3, 4}));
  return outer;
}

struct Sample {
  const char* name;
  qvArray* (*make)();
};

constexpr Sample kSamples[] = {
    {"double", extremes<double, qvDOUBLE_CLASS>},
    {"single", extremes<float, qvSINGLE_CLASS>},
    {"int8", extremes<std::int8_t, qvINT8_CLASS>},
    {"uint8", extremes<std::uint8_t, qvUINT8_CLASS>},
    {"int16", extremes<std::int16_t, qvINT16_CLASS>},
    {"uint16", extremes<std::uint16_t, qvUINT16_CLASS>},
    {"int32", extremes<std::int32_t, qvINT32_CLASS>},
    {"uint32", extremes<std::uint32_t, qvUINT32_CLASS>},
    {"int64", extremes<std::int64_t, qvINT64_CLASS>},
    {"uint64", extremes<std::uint64_t, qvUINT64_CLASS>},
    {"a double", greatest<double, qvDOUBLE_CLASS>},
    {"a single", greatest<float, qvSINGLE_CLASS>},
    {"an int64", greatest<std::int64_t, qvINT64_CLASS>},
    {"a uint64", greatest<std::uint64_t, qvUINT64_CLASS>},
    {"odd numbers", oddNumbers},
    {"a column", [] { return counted({5}); }},
    {"three dimensions",
     [] {
       return counted({2, 3, 4});
     }},
    {"nothing", [] { return counted({}); }},
    {"no rows",
     [] {
       return counted({0, 3});
     }},
    {"many numbers",
     [] {
       return counted({1000, 700});
     }},
    {"logicals", logicals},
    {"all bytes", allBytes},
    {"text in rows", textInRows},
    {"no text", [] { return qvCreateString(""); }},
    {"cells in cells", nestedCells},
    {"no cells", [] { return qvCreateCellMatrix(0, 3); }},
};

}  // namespace

void nameSamples(const Call& call) {
  std::vector<std::string> names;
  for (const Sample& sample : kSamples)
    names.emplace_back(sample.name);
  call.outputs[0] = textColumn(names);
}

void makeSample(const Call& call) {
  call.outputs[0] = std::span(kSamples)[indexIn(call.arguments[0])].make();
}

void recogniseSample(const Call& call) {
  const qvArray* const expected = std::span(kSamples)[indexIn(call.arguments[0])].make();
  call.outputs[0] = qvCreateString(difference(expected, call.arguments[1]).c_str());
}

}  // namespace probe
