// The module's datatypes are those of the tests' own table.
#include "variables/datatypes.h"

#include "tests/scripted/variables/shown_here.h"
#include "tests/support/datatypes.h"
#include "tests/support/failure_of.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using DatatypesTest = HostTest;

TEST_F(DatatypesTest, EachDatatypeHasClassSizeAndNames) {
  for (const CdfDatatype& row : kCdfDatatypes) {
    const qvClassID classId = classIdForDatatype(row.code);
    EXPECT_EQ(failureOf([&] { validateDatatype(row.code); }), "no error");
    EXPECT_EQ(classId, static_cast<int>(row.classId)) << row.name;
    EXPECT_EQ(datatypeSize(row.code), static_cast<long>(row.bytes)) << row.name;
    EXPECT_EQ(datatypeName(row.code), row.name);
    EXPECT_EQ(textOf([&] { return datatypeNameArray(row.code); }), lowerCaseName(row));
    EXPECT_EQ(isCharacterDatatype(row.code), isText(row)) << row.name;
  }
}

TEST_F(DatatypesTest, EveryOtherCodeIsUnrecognized) {
  for (long code = -2; code <= 130; ++code) {
    if (findCdfDatatype(code) != nullptr) continue;
    const std::string error = unrecognized(code, "DATATYPE");
    EXPECT_EQ(failureOf([&] { validateDatatype(code); }), error);
    EXPECT_EQ(failureOf([&] { classIdForDatatype(code); }), error);
    EXPECT_EQ(failureOf([&] { datatypeName(code); }), error);
    EXPECT_EQ(failureOf([&] { datatypeNameArray(code); }), error);
    EXPECT_EQ(failureOf([&] { createArrayFromBuffer({}, code); }), error);
  }
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
  for (const CdfDatatype& row : kCdfDatatypes)
    EXPECT_EQ(bytesOfArray(six.view().handle(), row.code), 6 * elementBytes(row)) << row.name;
}

TEST_F(DatatypesTest, CharacterBuffersBecomeTextUpToTheFirstZero) {
  EXPECT_EQ(shownHere(createArrayFromBuffer({'a', 'b', 'c', 0}, 52)), "char 1x3 'abc'");
  EXPECT_EQ(shownHere(createArrayFromBuffer({'a', 0, 'c', 0}, 51)), "char 1x1 'a'");
  EXPECT_EQ(shownHere(createArrayFromBuffer({0}, 51)), "char 0x0 ''");
}

}  // namespace
}  // namespace ambrix_test
