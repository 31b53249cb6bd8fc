#include "tests/conformance/array_checks.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <functional>
#include <stdexcept>

#include "tests/conformance/probe.h"

namespace probe {
namespace {

struct NumericClass {
  qvClassID classId;
  const char* name;
  std::size_t bytes;
};

constexpr NumericClass kNumericClasses[] = {
    {qvDOUBLE_CLASS, "double", 8}, {qvSINGLE_CLASS, "single", 4}, {qvINT8_CLASS, "int8", 1},
    {qvUINT8_CLASS, "uint8", 1},   {qvINT16_CLASS, "int16", 2},   {qvUINT16_CLASS, "uint16", 2},
    {qvINT32_CLASS, "int32", 4},   {qvUINT32_CLASS, "uint32", 4}, {qvINT64_CLASS, "int64", 8},
    {qvUINT64_CLASS, "uint64", 8}};

using Sizes = std::vector<std::size_t>;

Sizes sizesOf(const qvArray* array) {
  const std::size_t* const first = qvGetDimensions(array);
  return {first, first + qvGetNumberOfDimensions(array)};
}

std::span<const std::byte> bytesOf(const qvArray* array, std::size_t elementBytes) {
  return {static_cast<const std::byte*>(qvGetReadOnlyData(array)),
          qvGetNumberOfElements(array) * elementBytes};
}

bool areZero(std::span<const std::byte> bytes) {
  return std::ranges::all_of(bytes, [](std::byte byte) { return byte == std::byte{0}; });
}

bool isRefused(const std::function<void()>& action) {
  try {
    action();
  } catch (const std::logic_error&) {
    return true;
  }
  return false;
}

}  // namespace

void sizesFollowTheRules(Findings& findings) {
  const std::pair<Sizes, Sizes> cases[] = {
      {{}, {0, 0}},           {{5}, {5, 1}},
      {{0}, {0, 1}},          {{1}, {1, 1}},
      {{1, 5}, {1, 5}},       {{0, 5}, {0, 5}},
      {{2, 3, 4}, {2, 3, 4}}, {{2, 3, 1, 1}, {2, 3}},
      {{1, 1, 1}, {1, 1}},    {{2, 1, 3, 1}, {2, 1, 3}},
      {{2, 0, 3}, {2, 0, 3}}, {{1, 1, 1, 1, 1, 1, 1, 2}, {1, 1, 1, 1, 1, 1, 1, 2}}};
  for (const auto& [given, expected] : cases) {
    const std::size_t count = given.size();
    const std::size_t* const sizes = given.data();
    for (const qvArray* const array :
         {qvCreateNumericArray(count, sizes, qvDOUBLE_CLASS, qvREAL),
          qvCreateUninitNumericArray(count, sizes, qvINT8_CLASS, qvREAL),
          qvCreateLogicalArray(count, sizes), qvCreateCharArray(count, sizes)}) {
      std::size_t product = 1;
      for (const std::size_t size : expected)
        product *= size;
      findings.expect(sizesOf(array) == expected,
                      std::to_string(count) + " sizes of " + qvGetClassName(array));
      findings.expect(qvGetNumberOfElements(array) == product, "the number of elements");
    }
  }
}

void numbersHaveTheirClass(Findings& findings) {
  for (const NumericClass& expected : kNumericClasses) {
    for (const std::size_t columns : {3U, 100'000U}) {
      qvArray* const array = qvCreateNumericMatrix(2, columns, expected.classId, qvREAL);
      findings.expect(qvGetClassID(array) == expected.classId, expected.name);
      findings.expect(qvGetClassName(array) == std::string_view(expected.name), expected.name);
      const auto address = std::bit_cast<std::uintptr_t>(qvGetReadOnlyData(array));
      findings.expect(address % expected.bytes == 0, expected.name + std::string(" is aligned"));
      findings.expect(areZero(bytesOf(array, expected.bytes)),
                      expected.name + std::string(" is 0"));
    }
  }
}

void unsetNumbersCanBeWritten(Findings& findings) {
  for (const NumericClass& expected : kNumericClasses) {
    for (const std::size_t count : {3U, 3'000'000U}) {
      qvArray* const array = qvCreateUninitNumericArray(1, &count, expected.classId, qvREAL);
      const void* const place = qvGetReadOnlyData(array);
      findings.expect(qvGetData(array) == place, "the same data to read and to write");
      std::memset(qvGetData(array), 1, count * expected.bytes);
      (void)qvCreateNumericMatrix(100, 100, qvDOUBLE_CLASS, qvREAL);
      findings.expect(qvGetReadOnlyData(array) == place, "data stay where they are");
      const auto bytes = bytesOf(array, expected.bytes);
      findings.expect(bytes.front() == std::byte{1} && bytes.back() == std::byte{1},
                      "their content");
    }
  }
}

void logicalsAreBytes(Findings& findings) {
  const std::size_t count = 3;
  qvArray* const array = qvCreateLogicalArray(1, &count);
  findings.expect(qvGetClassID(array) == qvLOGICAL_CLASS, "the class");
  findings.expect(qvGetClassName(array) == std::string_view("logical"), "the name");
  findings.expect(areZero(bytesOf(array, 1)), "false");
  static_cast<bool*>(qvGetData(array))[1] = true;
  findings.expect(qvGetLogicals(array) == qvGetReadOnlyData(array), "the same data");
  findings.expect(qvGetLogicals(array)[1] && !qvGetLogicals(array)[2], "true where it was set");
}

void charactersHave16Bits(Findings& findings) {
  const std::size_t sizes[] = {1, 2};
  qvArray* const array = qvCreateCharArray(2, sizes);
  findings.expect(qvGetClassID(array) == qvCHAR_CLASS, "the class");
  findings.expect(qvGetClassName(array) == std::string_view("char"), "the name");
  qvGetChars(array)[0] = u'x';
  qvGetChars(array)[1] = u'\u20ac';
  findings.expect(qvGetReadOnlyChars(array) == qvGetReadOnlyData(array), "the same data");
  findings.expect(qvGetReadOnlyChars(array)[1] == u'\u20ac', "all bits");
}

void scalarsKeepTheirValue(Findings& findings) {
  const qvArray* const array = qvCreateDoubleScalar(-0.0);
  findings.expect(sizesOf(array) == Sizes{1, 1}, "1-by-1");
  findings.expect(std::signbit(doubles(array)[0]) && doubles(array)[0] == 0, "-0");
  findings.expect(std::isnan(doubles(qvCreateDoubleScalar(std::nan("")))[0]), "NaN");
}

void accessorsOfOtherClassesGiveNull(Findings& findings) {
  qvArray* const number = qvCreateDoubleScalar(1);
  qvArray* const cell = qvCreateCellMatrix(1, 1);
  findings.expect(qvGetLogicals(number) == nullptr, "logicals of numbers");
  findings.expect(qvGetReadOnlyChars(number) == nullptr, "characters of numbers");
  findings.expect(qvGetChars(number) == nullptr, "characters of numbers, to write");
  findings.expect(qvGetCell(number, 0) == nullptr, "a cell of numbers");
  findings.expect(qvArrayToString(number) == nullptr, "the text of numbers");
  findings.expect(qvGetReadOnlyData(cell) == nullptr, "data of cells");
}

void cellsHoldArrays(Findings& findings) {
  qvArray* const cell = qvCreateCellMatrix(2, 2);
  findings.expect(qvGetClassID(cell) == qvCELL_CLASS, "the class");
  findings.expect(qvGetClassName(cell) == std::string_view("cell"), "the name");
  findings.expect(qvGetCell(cell, 3) == nullptr, "unset at first");
  qvArray* const value = qvCreateString("value");
  qvSetCell(cell, 3, qvCreateDoubleScalar(1));
  qvSetCell(cell, 3, value);
  qvSetCell(cell, 3, value);
  findings.expect(qvGetCell(cell, 3) == value, "what was set last");
  findings.expect(qvGetCell(cell, 4) == nullptr, "null behind the end");
  findings.expect(isRefused([&] { qvSetCell(cell, 4, nullptr); }), "no setting behind the end");
  findings.expect(isRefused([&] { qvSetCell(value, 0, nullptr); }), "no setting in texts");
}

void onlyRealNumbersAreNumeric(Findings& findings) {
  for (const qvClassID classId :
       {qvUNKNOWN_CLASS, qvCELL_CLASS, qvSTRUCT_CLASS, qvLOGICAL_CLASS, qvCHAR_CLASS}) {
    findings.expect(isRefused([&] { (void)qvCreateNumericMatrix(1, 1, classId, qvREAL); }),
                    "the class " + std::to_string(classId));
  }
  findings.expect(isRefused([] { (void)qvCreateNumericMatrix(1, 1, qvDOUBLE_CLASS, qvCOMPLEX); }),
                  "complex numbers");
}

}  // namespace probe
