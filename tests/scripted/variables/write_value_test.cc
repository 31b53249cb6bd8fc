// Writing one value, and deleting records.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using WriteValueTest = ScriptedTest;

const std::string kOnRecord = "SELECT_ CDF_ 7 | zVAR_ 3 | zVAR_RECNUMBER_ ";

TEST_F(WriteValueTest, AScalarVariableStillNeedsItsEmptyIndices) {
  describe({.datatype = 2});
  fake.readBytes(2);
  EXPECT_THAT(call("putVarData", {file(), 3, 9, {}, row<std::int16_t>({0x0102})}), IsEmpty());
  EXPECT_THAT(fake.bytesRead(), ElementsAre(2, 1));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority,
                                   kOnRecord + "9 | zVAR_DIMINDICES_ [] | PUT_ zVAR_DATA_"));
}

TEST_F(WriteValueTest, IndicesAreReversedForARowMajorFile) {
  describe({.sizes = {5, 6}, .majority = 1});
  call("putVarData", {file(), 3, -1, {1, 2}, 8});
  EXPECT_EQ(calls()[2], kOnRecord + "-1 | zVAR_DIMINDICES_ [2 1] | PUT_ zVAR_DATA_");
  fake.answer("CDF_MAJORITY_", {2});
  call("putVarData", {file(), 3, 0, {1, 2}, 8});
  EXPECT_EQ(calls()[2], kOnRecord + "0 | zVAR_DIMINDICES_ [1 2] | PUT_ zVAR_DATA_");
}

TEST_F(WriteValueTest, OnlyTheFirstCharacterOfATextIsWrittenTheRestAreZerosAndOneMore) {
  for (const long datatype : {51L, 52L}) {
    describe({.datatype = datatype, .elements = 4});
    fake.readBytes(5);
    call("putVarData", {file(), 3, 0, {}, Array::text(u"\u20ACbcd")});
    EXPECT_THAT(fake.bytesRead(), ElementsAre(0xAC, 0, 0, 0, 0));
  }
}

TEST_F(WriteValueTest, AWrongNumberOfIndicesTellsTheNameBeforeTheDimensions) {
  describe({.sizes = {5, 6}, .name = "B"});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {1}, 8}), cdflib("badDimensionExtent", "B", 2));
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {1, 2, 3}, 8}),
            cdflib("badDimensionExtent", "B", 2));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority, kInquiry, kMajority));
}

TEST_F(WriteValueTest, TheNumberOfElementsIsThatOfOneValue) {
  const auto error = [&](long datatype, long elements, const Given& data) {
    describe({.datatype = datatype, .elements = elements, .name = "B"});
    return errorOf("putVarData", {file(), 3, 0, {}, data});
  };
  EXPECT_EQ(error(22, 1, {1, 2}), cdflib("wrongNumberOfPutVarDataElements", "B", 1));
  EXPECT_EQ(error(22, 1, {}), cdflib("wrongNumberOfPutVarDataElements", "B", 1));
  EXPECT_EQ(error(32, 1, 1), cdflib("wrongNumberOfPutVarDataElements", "B", 2));
  EXPECT_EQ(error(32, 1, {1, 2}), "no error");
  EXPECT_EQ(error(51, 4, "abc"), cdflib("wrongNumberOfPutVarDataElements", "B", 4));
  EXPECT_EQ(error(51, 4, "abcd"), "no error");
}

TEST_F(WriteValueTest, TheOrderIsIndicesThenCountThenDatatypeThenClass) {
  describe({.datatype = 33, .sizes = {5}, .name = "B"});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, "xy"}), cdflib("badDimensionExtent", "B", 1));
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {1}, "xy"}),
            cdflib("wrongNumberOfPutVarDataElements", "B", 1));
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {1}, "x"}), unrecognized(33, "DATATYPE"));
  describe({.datatype = 22});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, row<float>({1})}),
            cdflib("datatypeMismatch", "single", "CDF_REAL8"));
}

TEST_F(WriteValueTest, TheClassIsLookedAtAfterTheNumberOfElementsAndBeforeTheRecord) {
  describe({.datatype = 4, .sizes = {65536, 65536}, .name = "B"});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {0, 0}, {1, 2}}),
            cdflib("wrongNumberOfPutVarDataElements", "B", 1));
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {0, 0}, 1}),
            cdflib("datatypeMismatch", "double", "CDF_INT4"));
}

TEST_F(WriteValueTest, AClassServesEveryDatatypeThatHasIt) {
  for (const long datatype : {1L, 41L}) {
    describe({.datatype = datatype});
    EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, row<std::int8_t>({1})}), "no error");
  }
  describe({.datatype = 4});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, row<bool>({true})}),
            cdflib("datatypeMismatch", "logical", "CDF_INT4"));
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, row<std::int64_t>({1})}),
            cdflib("datatypeMismatch", "int64", "CDF_INT4"));
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, Array::cell({1, 1})}),
            cdflib("datatypeMismatch", "cell", "CDF_INT4"));
}

TEST_F(WriteValueTest, ADamagedDescriptionIsRefusedInTheLibrarysWords) {
  describe({.datatype = 4, .elements = 1000});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, row<std::int32_t>({1})}),
            libraryFailure("CDFputzVarData", -2011));
  describe({.datatype = 1, .elements = 2});  // one byte too many to read
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, row<std::int8_t>({1})}),
            libraryFailure("CDFputzVarData", -2011));
  describe({.datatype = 4, .sizes = {65536, 65536}});
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {0, 0}, row<std::int32_t>({1})}),
            libraryFailure("CDFputzVarData", -2004));
}

TEST_F(WriteValueTest, RecordsAreDeletedAsARangeThatTheLibraryJudges) {
  describe({});
  EXPECT_THAT(call("deleteVarRecords", {file(), 3, 9, 4}), IsEmpty());
  EXPECT_EQ(calls().back(), "SELECT_ CDF_ 7 | zVAR_ 3 | DELETE_ zVAR_RECORDS_ 9 4");
}

}  // namespace
}  // namespace ambrix_test
