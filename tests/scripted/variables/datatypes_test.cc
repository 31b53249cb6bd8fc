// The fifteen datatypes, restated.
#include "variables/datatypes.h"

#include "tests/scripted/variables/shown_here.h"
#include "tests/support/failure_of.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using DatatypesTest = HostTest;

struct Row {
  long code;
  int classId;
  long size;
  const char* name;
  const char* lowerName;
};

const Row kRows[] = {
    {1, 8, 1, "CDF_INT1", "cdf_int1"},      {2, 10, 2, "CDF_INT2", "cdf_int2"},
    {4, 12, 4, "CDF_INT4", "cdf_int4"},     {11, 9, 1, "CDF_UINT1", "cdf_uint1"},
    {12, 11, 2, "CDF_UINT2", "cdf_uint2"},  {14, 13, 4, "CDF_UINT4", "cdf_uint4"},
    {21, 7, 4, "CDF_REAL4", "cdf_real4"},   {22, 6, 8, "CDF_REAL8", "cdf_real8"},
    {31, 6, 8, "CDF_EPOCH", "cdf_epoch"},   {32, 6, 16, "CDF_EPOCH16", "cdf_epoch16"},
    {41, 8, 1, "CDF_BYTE", "cdf_byte"},     {44, 7, 4, "CDF_FLOAT", "cdf_float"},
    {45, 6, 8, "CDF_DOUBLE", "cdf_double"}, {51, 4, 1, "CDF_CHAR", "cdf_char"},
    {52, 4, 1, "CDF_UCHAR", "cdf_uchar"}};
static_assert(std::size(kRows) == 15);

TEST_F(DatatypesTest, EachDatatypeHasClassSizeAndNames) {
  for (const Row& row : kRows) {
    EXPECT_EQ(failureOf([&] { validateDatatype(row.code); }), "no error");
    EXPECT_EQ(classIdForDatatype(row.code), row.classId) << row.name;
    EXPECT_EQ(datatypeSize(row.code), row.size) << row.name;
    EXPECT_EQ(datatypeName(row.code), row.name);
    EXPECT_EQ(textOf([&] { return datatypeNameArray(row.code); }), row.lowerName);
    EXPECT_EQ(isCharacterDatatype(row.code), row.classId == 4);
  }
}

TEST_F(DatatypesTest, EveryOtherCodeIsUnrecognized) {
  long supported = 0;
  for (long code = -2; code <= 130; ++code) {
    const bool known = std::ranges::any_of(kRows, [&](const Row& row) { return row.code == code; });
    supported += known ? 1 : 0;
    if (known) continue;
    const std::string error = unrecognized(code, "DATATYPE");
    EXPECT_EQ(failureOf([&] { validateDatatype(code); }), error);
    EXPECT_EQ(failureOf([&] { classIdForDatatype(code); }), error);
    EXPECT_EQ(failureOf([&] { datatypeName(code); }), error);
    EXPECT_EQ(failureOf([&] { datatypeNameArray(code); }), error);
    EXPECT_EQ(failureOf([&] { createArrayFromBuffer({}, code); }), error);
  }
  EXPECT_EQ(supported, 15);
}

TEST_F(DatatypesTest, CodesThatDifferInHighBitsOnlyAreUnrecognized) {
  for (const long code : {4294967297L, 64L + 1, -4294967292L})
    EXPECT_EQ(failureOf([&] { validateDatatype(code); }), unrecognized(code, "DATATYPE"));
}

TEST_F(DatatypesTest, BuffersBecomeRowsBitForBit) {
  EXPECT_EQ(shownHere(createArrayFromBuffer({1, 0, 0xFF, 0xFF, 0, 1}, 2)), "int16 1x3 [1 -1 256]");
  EXPECT_EQ(shownHere(createArrayFromBuffer({200, 1}, 11)), "uint8 1x2 [200 1]");
  EXPECT_EQ(shownHere(createArrayFromBuffer({200, 1}, 41)), "int8 1x2 [-56 1]");
  EXPECT_EQ(shownHere(createArrayFromBuffer({1, 2, 3, 4, 5}, 4)), "int32 1x1 [67305985]");
  EXPECT_EQ(shownHere(createArrayFromBuffer({}, 21)), "single 1x0 []");
}

TEST_F(DatatypesTest, Epoch16BuffersBecomePairs) {
  EXPECT_EQ(shownHere(createArrayFromBuffer(ValueBuffer(48, 0), 32)), "double 2x3 [0 0 0 0 0 0]");
  EXPECT_EQ(shownHere(createArrayFromBuffer({}, 32)), "double 2x0 []");
}

TEST_F(DatatypesTest, AnArrayHasAsManyBytesAsTheLibraryMayMove) {
  const Given six = elements<double>(6);
  for (const Row& row : kRows) {
    const long sizeOfElement = row.code == 32 ? 8 : row.size;  // an epoch16 is a pair of them
    EXPECT_EQ(bytesOfArray(six.view().handle(), row.code), 6 * sizeOfElement) << row.name;
  }
}

TEST_F(DatatypesTest, CharacterBuffersBecomeTextUpToTheFirstZero) {
  EXPECT_EQ(shownHere(createArrayFromBuffer({'a', 'b', 'c', 0}, 52)), "char 1x3 'abc'");
  EXPECT_EQ(shownHere(createArrayFromBuffer({'a', 0, 'c', 0}, 51)), "char 1x1 'a'");
  EXPECT_EQ(shownHere(createArrayFromBuffer({0}, 51)), "char 0x0 ''");
}

}  // namespace
}  // namespace ambrix_test
