// Reading, inquiring and deleting attribute entries.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using GetEntryTest = ScriptedTest;

TEST_F(GetEntryTest, NumbersComeAsARowOfTheirClass) {
  fake.answer("CDFinquireAttrEntry", {2, 3});
  fake.answerData(std::vector<std::int16_t>{1, -2, 300});
  EXPECT_EQ(shown(result("getAttrgEntry", {file(), 2, 5})), "int16 1x3 [1 -2 300]");
  EXPECT_THAT(calls(), ElementsAre("CDFinquireAttrEntry 7 1 2 5", "CDFgetAttrEntry 7 1 2 5"));
  EXPECT_EQ(shown(result("getAttrEntry", {file(), 2, 5})), "int16 1x3 [1 -2 300]");
  EXPECT_THAT(calls(), ElementsAre("CDFinquireAttrEntry 7 3 2 5", "CDFgetAttrEntry 7 3 2 5"));
}

TEST_F(GetEntryTest, TextComesAsOneRow) {
  fake.answer("CDFinquireAttrEntry", {51, 5});
  fake.answerData(std::vector<char>{'h', 'e', 'l', 'l', 'o'});
  EXPECT_EQ(shown(result("getAttrgEntry", {file(), 2, 5})), "char 1x5 'hello'");
  fake.answer("CDFinquireAttrEntry", {52, 5});
  fake.answerData(std::vector<char>{'h', 'e', '\0', 'l', 'o'});
  EXPECT_EQ(shown(result("getAttrgEntry", {file(), 2, 5})), "char 1x2 'he'");
}

TEST_F(GetEntryTest, Epoch16sComeAsPairs) {
  fake.answer("CDFinquireAttrEntry", {32, 3});
  fake.answerData(std::vector<double>{1, 2, 3, 4, 5, 6});
  EXPECT_EQ(shown(result("getAttrEntry", {file(), 2, 5})), "double 2x3 [1 2 3 4 5 6]");
}

TEST_F(GetEntryTest, AnUnsupportedDatatypeNeverReachesTheRead) {
  for (const long datatype : {33L, 8L, 3L, 0L}) {
    fake.answer("CDFinquireAttrEntry", {datatype, 1});
    for (const char* command : {"getAttrgEntry", "getAttrEntry"}) {
      EXPECT_EQ(errorOf(command, {file(), 2, 5}), unrecognized(datatype, "DATATYPE"));
      EXPECT_THAT(calls(), testing::SizeIs(1));
    }
  }
}

TEST_F(GetEntryTest, AnEntryWithoutElementsIsEmptyAndNeverReadIntoNull) {
  fake.answer("CDFinquireAttrEntry", {4, 0});
  EXPECT_EQ(shown(result("getAttrgEntry", {file(), 2, 5})), "int32 1x0 []");
  fake.answer("CDFinquireAttrEntry", {51, 0});
  EXPECT_EQ(shown(result("getAttrgEntry", {file(), 2, 5})), "char 0x0 ''");
}

TEST_F(GetEntryTest, ANegativeNumberOfElementsIsRefusedInTheLibrarysWords) {
  fake.answer("CDFinquireAttrEntry", {4, -1});
  EXPECT_EQ(errorOf("getAttrEntry", {file(), 2, 5}), libraryFailure("CDFgetAttrzEntry", -2011));
}

TEST_F(GetEntryTest, InquiriesReturnTheLowerCaseNameAndTheNumber) {
  fake.answer("CDFinquireAttrEntry", {32, 3});
  EXPECT_THAT(shown(call("inquireAttrgEntry", {file(), 2, 5})),
              ElementsAre("char 1x11 'cdf_epoch16'", "double 1x1 [3]"));
  EXPECT_THAT(calls(), ElementsAre("CDFinquireAttrEntry 7 1 2 5"));
  fake.answer("CDFinquireAttrEntry", {51, 8});
  EXPECT_THAT(shown(call("inquireAttrEntry", {file(), 2, 5})),
              ElementsAre("char 1x8 'cdf_char'", "double 1x1 [8]"));
  EXPECT_THAT(calls(), ElementsAre("CDFinquireAttrEntry 7 3 2 5"));
  fake.answer("CDFinquireAttrEntry", {33, 1});
  EXPECT_EQ(errorOf("inquireAttrEntry", {file(), 2, 5}), unrecognized(33, "DATATYPE"));
}

TEST_F(GetEntryTest, EntriesAreDeleted) {
  EXPECT_THAT(call("deleteAttrgEntry", {file(), 2, 5}), IsEmpty());
  EXPECT_THAT(call("deleteAttrEntry", {file(), 2, 5}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("CDFdeleteAttrEntry 7 1 2 5", "CDFdeleteAttrEntry 7 3 2 5"));
}

TEST_F(GetEntryTest, DeleteAttrEntryLabelsTheAttributeAttnum) {
  EXPECT_EQ(errorOf("deleteAttrEntry", {file(), "x", "x"}), notScalar("ATTNUM"));
}

}  // namespace
}  // namespace ambrix_test
