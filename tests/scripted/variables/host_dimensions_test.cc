// How the dimensions of a variable become those of a host array, and characters become bytes.
#include "variables/host_dimensions.h"

#include <limits>

#include "tests/support/failure_of.h"
#include "variables/characters.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using testing::ElementsAre;
using HostDimensionsTest = HostTest;
using Sizes = std::vector<long>;

VariableDescription variable(long datatype, long elements, const Sizes& sizes) {
  VariableDescription made;
  made.datatype = datatype;
  made.elements = elements;
  made.dimensions = static_cast<long>(sizes.size());
  std::ranges::copy(sizes, made.sizeSlots);
  return made;
}

std::vector<std::size_t> list(const HostDimensions& dimensions) {
  return {dimensions.data(), dimensions.data() + dimensions.count()};
}

TEST_F(HostDimensionsTest, OneValueIsAColumn) {
  EXPECT_THAT(list(valueDimensions(variable(4, 1, {2, 3}))), ElementsAre(1, 1));
  EXPECT_THAT(list(valueDimensions(variable(32, 1, {}))), ElementsAre(2, 1));
  EXPECT_THAT(list(valueDimensions(variable(51, 5, {7}))), ElementsAre(5, 1));
  EXPECT_THAT(list(valueDimensions(variable(52, 1, {}))), ElementsAre(1, 1));
}

struct RecordRow {
  long datatype;
  long elements;
  Sizes sizes;
  std::vector<std::size_t> columnMajor;
  std::vector<std::size_t> rowMajor;
};

TEST_F(HostDimensionsTest, ARecordKeepsItsLeadingDimensionInFrontWhenReversed) {
  const RecordRow rows[] = {{2, 1, {3, 4}, {3, 4}, {4, 3}},
                            {2, 1, {}, {1}, {1}},
                            {2, 1, {5}, {5}, {5}},
                            {32, 1, {3, 4}, {2, 3, 4}, {2, 4, 3}},
                            {32, 1, {}, {2}, {2}},
                            {51, 10, {}, {10}, {10}},
                            {51, 1, {}, {1}, {1}},
                            {51, 1, {3}, {3}, {3}},
                            {51, 1, {3, 4}, {3, 4}, {4, 3}},
                            {51, 8, {3, 4}, {8, 3, 4}, {8, 4, 3}},
                            {52, 8, {2}, {8, 2}, {8, 2}},
                            {45,
                             1,
                             {1, 2, 3, 4, 5, 6, 7, 8, 9, 10},
                             {1, 2, 3, 4, 5, 6, 7, 8, 9, 10},
                             {10, 9, 8, 7, 6, 5, 4, 3, 2, 1}},
                            {51,
                             2,
                             {1, 2, 3, 4, 5, 6, 7, 8, 9, 10},
                             {2, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10},
                             {2, 10, 9, 8, 7, 6, 5, 4, 3, 2, 1}}};
  for (const RecordRow& row : rows) {
    const VariableDescription given = variable(row.datatype, row.elements, row.sizes);
    EXPECT_EQ(list(recordDimensions(given, false)), row.columnMajor);
    EXPECT_EQ(list(recordDimensions(given, true)), row.rowMajor);
  }
}

TEST_F(HostDimensionsTest, AHyperslabEndsInItsRecords) {
  const Sizes counts{2, 3};
  EXPECT_THAT(list(hyperslabDimensions(variable(45, 1, {2, 4}), counts, 7)), ElementsAre(2, 3, 7));
  EXPECT_THAT(list(hyperslabDimensions(variable(32, 1, {2, 4}), counts, 7)),
              ElementsAre(2, 2, 3, 7));
  EXPECT_THAT(list(hyperslabDimensions(variable(51, 1, {2, 4}), counts, 7)),
              ElementsAre(1, 2, 3, 7));
  EXPECT_THAT(list(hyperslabDimensions(variable(51, 5, {}), {}, 7)), ElementsAre(5, 7));
  EXPECT_THAT(list(hyperslabDimensions(variable(4, 1, {}), {}, 7)), ElementsAre(7));
}

TEST_F(HostDimensionsTest, ACountBeyondItsDimensionIsTooLarge) {
  const VariableDescription given = variable(45, 1, {2, 4});
  for (const Sizes& counts : {Sizes{3, 4}, Sizes{2, 5}}) {
    EXPECT_EQ(failureOf([&] { hyperslabDimensions(given, counts, 1); }), cdflib("dimSizeTooLarge"));
  }
  const Sizes negative{-1, 4};
  EXPECT_EQ(failureOf([&] { hyperslabDimensions(given, negative, 1); }), "no error");
}

TEST_F(HostDimensionsTest, OnlyTheCountsAreReversed) {
  const Sizes counts{2, 3};
  HostDimensions plain = hyperslabDimensions(variable(45, 1, {2, 4}), counts, 7);
  reverseCounts(plain, 2);
  EXPECT_THAT(list(plain), ElementsAre(3, 2, 7));
  HostDimensions leading = hyperslabDimensions(variable(51, 5, {2, 4}), counts, 7);
  reverseCounts(leading, 2);
  EXPECT_THAT(list(leading), ElementsAre(5, 3, 2, 7));
}

TEST_F(HostDimensionsTest, VectorsForTheLibraryHaveTenEntriesAndFit32Bits) {
  EXPECT_THAT(libraryVector(Sizes{1, 4294967298, 3}, -1),
              ElementsAre(1, -1, 3, 0, 0, 0, 0, 0, 0, 0));
  EXPECT_THAT(libraryVector(Sizes(12, 5), -1), testing::Each(5));
}

TEST_F(HostDimensionsTest, MoreNumbersThanTenAreNotWrittenBehindTheVector) {
  Sizes room(14, 7);
  new (room.data()) DimensionVector(libraryVector(Sizes(14, 5), -1));
  EXPECT_THAT(room, ElementsAre(5, 5, 5, 5, 5, 5, 5, 5, 5, 5, 7, 7, 7, 7));
}

TEST_F(HostDimensionsTest, BytesAreWidenedAsSignedNumbers) {
  const char bytes[] = {'\x00', '\x41', '\x7F', '\x80', '\xE9', '\xFF'};
  char16_t characters[6];
  widenCharacters(bytes, 6, characters);
  EXPECT_THAT(characters, ElementsAre(0, 0x41, 0x7F, 0xFF80, 0xFFE9, 0xFFFF));
}

TEST_F(HostDimensionsTest, CharactersKeepTheirLowBits) {
  const char16_t characters[] = {0x0041, 0x00E9, 0x20AC, 0xFFE9, 0x0100};
  char bytes[5];
  narrowCharacters(characters, 5, bytes);
  EXPECT_THAT(bytes, ElementsAre('\x41', '\xE9', '\xAC', '\xE9', '\0'));
}

}  // namespace
}  // namespace ambrix_test
