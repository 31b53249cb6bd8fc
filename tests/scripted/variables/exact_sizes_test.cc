// The library moves as many bytes as the description of a variable says, sane or not: what it is
// handed must hold them all, and what it leaves unfilled must read as zeros.
#include <algorithm>
#include <limits>
#include <map>
#include <set>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

constexpr unsigned char kFill = 0x5A;

constexpr long kHuge = 2147483647;
const Numbers kSizes[] = {{},
                          {3},
                          {2, 3},
                          {0, 3},
                          {-1, 3},
                          {kHuge, 1},
                          {kHuge, kHuge, kHuge},
                          {1, 1, 1, 1, 1, 1, 1, 1, 2, 3}};

class ExactSizesTest : public ScriptedTest {
 protected:
  ExactSizesTest() {
    fake.moveExactly(kFill);
    ::ambrix::setByteLimit(1 << 20);
  }
  ~ExactSizesTest() override { ::ambrix::setByteLimit(SIZE_MAX); }

  /// Runs the body with variables of each datatype, numbers of elements, sizes and variances.
  template <typename Body>
  void forEachDescription(const Body& body);
  template <typename Body>
  void describeWithVariances(const Variable& plain, const Body& body);

  /// Numbers for each dimension, as an argument.
  Given forEach(double number) const {
    const std::vector<double> numbers(variable.sizes.size(), number);
    return Array::row(std::span<const double>(numbers));
  }
  /// Reads, if the module does; what the library has written comes first, then zeros.
  void expectFilled(const std::string& command, const Arguments& arguments);
  /// Writes arrays of the right class and of all sorts of sizes.
  void expectRoom(const std::string& command, const Arguments& arguments);

  Variable variable;
};

template <typename Body>
void ExactSizesTest::forEachDescription(const Body& body) {
  for (const long datatype : {4L, 32L, 51L}) {
    for (const long elements : {-1L, 0L, 1L, 3L, kHuge}) {
      for (const Numbers& sizes : kSizes)
        describeWithVariances({.datatype = datatype, .elements = elements, .sizes = sizes}, body);
    }
  }
}

template <typename Body>
void ExactSizesTest::describeWithVariances(const Variable& plain, const Body& body) {
  const std::size_t dimensions = plain.sizes.size();
  for (const std::size_t fixed : std::set<std::size_t>{0, dimensions / 2, dimensions}) {
    fake.forgetCalls();
    variable = plain;
    variable.variances.assign(dimensions, -1);
    std::fill_n(variable.variances.begin(), fixed, 0);
    describe(variable);
    SCOPED_TRACE("datatype " + std::to_string(variable.datatype) + ", elements " +
                 std::to_string(variable.elements) + ", sizes " +
                 testing::PrintToString(variable.sizes) + ", fixed " + std::to_string(fixed));
    body();
  }
}

/// The bytes of CDF that the array carries.
std::vector<unsigned> bytesIn(ArrayView array) {
  if (array.classId() == ClassId::kChar) {
    const auto characters = array.data<char16_t>();
    return {characters.begin(), characters.end()};
  }
  std::vector<unsigned> bytes;
  for (const std::byte byte : array.bytes())
    bytes.push_back(std::to_integer<unsigned>(byte));
  return bytes;
}

void ExactSizesTest::expectFilled(const std::string& command, const Arguments& arguments) {
  fake.forgetBytesMoved();
  if (errorOf(command, arguments) != "no error") return;
  const Array found = result(command, arguments);
  const std::vector<unsigned> bytes = bytesIn(found);
  std::vector<unsigned> expected(bytes.size(), 0);
  ASSERT_LE(fake.bytesMoved(), bytes.size()) << command;
  std::fill_n(expected.begin(), fake.bytesMoved(), kFill);
  EXPECT_EQ(bytes, expected) << command;
}

Array arrayOf(long datatype, std::size_t elements) {
  static const std::map<long, ClassId> kClasses = {{1, ClassId::kInt8},
                                                   {4, ClassId::kInt32},
                                                   {12, ClassId::kUint16},
                                                   {32, ClassId::kDouble},
                                                   {51, ClassId::kChar}};
  return Array::zeros(kClasses.at(datatype), {1, elements});
}

void ExactSizesTest::expectRoom(const std::string& command, const Arguments& arguments) {
  for (const std::size_t elements : {0U, 1U, 2U, 3U, 6U, 12U, 18U, 36U}) {
    const Array data = arrayOf(variable.datatype, elements);
    Arguments all = arguments;
    all.push_back(data.clone());
    fake.forgetBytesMoved();
    if (errorOf(command, all) == "no error") {
      EXPECT_LE(fake.bytesMoved(), bytesIn(data).size()) << command << ' ' << elements;
    }
  }
}

TEST_F(ExactSizesTest, WhatIsReadHoldsAllThatTheLibraryWrites) {
  forEachDescription([&] {
    expectFilled("getVarData", {file(), 3, 0, forEach(0)});
    expectFilled("getVarRecordData", {file(), 3, 0});
    expectFilled("getVarPadValue", {file(), 3});
    for (const double records : {-1, 1, 3}) {
      for (const double count : {0, 1, 2, 3}) {
        expectFilled("hyperGetVarData",
                     {file(), 3, 0, records, 1, forEach(0), forEach(count), forEach(1)});
      }
    }
  });
}

TEST_F(ExactSizesTest, WhatIsWrittenHoldsAllThatTheLibraryReads) {
  forEachDescription([&] {
    expectRoom("putVarData", {file(), 3, 0, forEach(0)});
    expectRoom("putVarRecordData", {file(), 3, 0});
    expectRoom("setVarPadValue", {file(), 3});
    for (const double records : {-1, 1, 3}) {
      for (const double count : {0, 1, 2, 3}) {
        expectRoom("hyperPutVarData",
                   {file(), 3, 0, records, 1, forEach(0), forEach(count), forEach(1)});
      }
    }
  });
}

// Numbers of vectors' entries that are not those of the dimensions.
TEST_F(ExactSizesTest, VectorsOfOtherLengthsLeaveRoomToo) {
  forEachDescription([&] {
    for (const std::size_t length : {0U, 1U, 2U, 3U, 11U, 20U}) {
      const std::vector<double> numbers(length, 1);
      const Given vector = Array::row(std::span<const double>(numbers));
      expectFilled("hyperGetVarData", {file(), 3, 0, 2, 1, forEach(0), vector, vector});
      expectRoom("hyperPutVarData", {file(), 3, 0, 2, 1, forEach(0), vector, vector});
      expectRoom("putVarData", {file(), 3, 0, vector});
    }
  });
}

using OtherDescriptionsTest = ScriptedTest;

// The library has it from a damaged file; beyond ten there is no room for sizes anywhere.
TEST_F(OtherDescriptionsTest, MoreDimensionsThanThereAreAreRefused) {
  for (const long dimensions : {-1L, 11L, kHuge}) {
    describe({.sizes = {2, 3}});
    fake.answer("zVAR_NUMDIMS_", {dimensions});
    EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, 0}), libraryFailure("CDFinquirezVar", -2008))
        << dimensions;
  }
}

TEST_F(OtherDescriptionsTest, ElementsBeyondCountingWrapAroundAsInTheLibrary) {
  fake.answer("CDF_FORMAT_", {1});
  describe({.datatype = 22, .elements = std::numeric_limits<long>::min()});
  EXPECT_EQ(errorOf("deleteVarRecords", {file(), 3, 0, 0}),
            libraryFailure("CDFdeletezVarRecords", -2004));
}

// The library divides by the bytes of a record, in 32 bits, of datatypes without a host class too.
TEST_F(OtherDescriptionsTest, RecordsThatWrapAroundAreRefusedWhateverTheDatatype) {
  fake.answer("CDF_FORMAT_", {1});
  for (const long datatype : {22L, 33L}) {
    describe({.datatype = datatype, .sizes = {1 << 30, 1 << 29}, .variances = {-1, -1}});
    EXPECT_EQ(errorOf("deleteVarRecords", {file(), 3, 0, 0}),
              libraryFailure("CDFdeletezVarRecords", -2004))
        << datatype;
    describe({.datatype = datatype, .sizes = {1 << 30, 1 << 29}, .variances = {-1, 0}});
    EXPECT_EQ(errorOf("deleteVarRecords", {file(), 3, 0, 0}),
              libraryFailure("CDFdeletezVarRecords", -2004))
        << datatype;
    describe({.datatype = datatype, .sizes = {3, 1 << 29}, .variances = {-1, 0}});
    EXPECT_EQ(errorOf("deleteVarRecords", {file(), 3, 0, 0}), "no error") << datatype;
  }
}

}  // namespace
}  // namespace ambrix_test
