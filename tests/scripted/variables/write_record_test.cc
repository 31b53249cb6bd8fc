// Writing one record.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class WriteRecordTest : public ScriptedTest {
 protected:
  std::string errorWith(const Given& data) {
    return errorOf("putVarRecordData", {file(), 3, 5, data});
  }
};

TEST_F(WriteRecordTest, ElementsGoInTheHostsOrderWithoutAskingForTheMajority) {
  describe({.datatype = 4, .sizes = {3, 4}, .majority = 1});
  fake.readBytes(8);
  const std::vector<std::int32_t> values{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12};
  for (const auto& sizes : {std::vector<std::size_t>{4, 3}, {3, 4}, {12, 1}}) {
    const Given data = Array::of(std::span<const std::int32_t>(values), sizes);
    EXPECT_THAT(call("putVarRecordData", {file(), 3, 5, data}), IsEmpty());
    EXPECT_THAT(fake.bytesRead(), ElementsAre(1, 0, 0, 0, 2, 0, 0, 0));
    EXPECT_THAT(calls(), ElementsAre(kInquiry, "CDFputVarRecordData 7 1 3 5"));
  }
}

TEST_F(WriteRecordTest, CharactersKeepTheirLowBitsWithAZeroBehindThem) {
  describe({.datatype = 51, .elements = 2, .sizes = {2}});
  fake.readBytes(5);
  EXPECT_EQ(errorWith(Array::text(u"a\u20AC\u00E9d")), "no error");
  EXPECT_THAT(fake.bytesRead(), ElementsAre('a', 0xAC, 0xE9, 'd', 0));
}

TEST_F(WriteRecordTest, TheNumberOfElementsIsThatOfTheRecord) {
  const auto error = [&](long datatype, long elements, const Given& data) {
    describe({.datatype = datatype, .elements = elements, .sizes = {3, 4}, .name = "B"});
    return errorWith(data);
  };
  EXPECT_EQ(error(22, 1, elements<double>(11)),
            cdflib("wrongNumberOfPutVarRecordDataElements", "B", 12));
  EXPECT_EQ(error(22, 1, elements<double>(12)), "no error");
  EXPECT_EQ(error(32, 1, elements<double>(12)),
            cdflib("wrongNumberOfPutVarRecordDataElements", "B", 24));
  EXPECT_EQ(error(32, 1, elements<double>(24)), "no error");
  EXPECT_EQ(error(51, 8, elements<char16_t>(12)),
            cdflib("wrongNumberOfPutVarRecordDataElements", "B", 96));
  EXPECT_EQ(error(51, 8, elements<char16_t>(96)), "no error");
}

TEST_F(WriteRecordTest, AScalarVariableTakesOneValue) {
  describe({.datatype = 22, .name = "B"});
  EXPECT_EQ(errorWith(1), "no error");
  EXPECT_EQ(errorWith({1, 2}), cdflib("wrongNumberOfPutVarRecordDataElements", "B", 1));
}

TEST_F(WriteRecordTest, TheOrderIsCountThenDatatypeThenClass) {
  describe({.datatype = 33, .name = "B"});
  EXPECT_EQ(errorWith("xy"), cdflib("wrongNumberOfPutVarRecordDataElements", "B", 1));
  EXPECT_EQ(errorWith("x"), unrecognized(33, "DATATYPE"));
  describe({.datatype = 4});
  EXPECT_EQ(errorWith("x"), cdflib("datatypeMismatch", "char", "CDF_INT4"));
}

TEST_F(WriteRecordTest, ANegativeRecordNeverReachesTheRoutine) {
  describe({});
  for (const double record : {-1.0, 4294967296.0, -4294967296.0}) {
    EXPECT_EQ(errorOf("putVarRecordData", {file(), 3, record, 1}),
              libraryFailure("CDFputzVarRecordData", -2009));
    EXPECT_THAT(calls(), ElementsAre(kInquiry));
  }
}

TEST_F(WriteRecordTest, ADamagedDescriptionIsRefusedInTheLibrarysWords) {
  describe({.datatype = 22, .elements = 1000});
  EXPECT_EQ(errorWith(1), libraryFailure("CDFputzVarRecordData", -2011));
  describe({.datatype = 22, .sizes = {0}});
  EXPECT_EQ(errorWith({}), libraryFailure("CDFputzVarRecordData", -2004));
}

}  // namespace
}  // namespace ambrix_test
