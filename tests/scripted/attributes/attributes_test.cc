// Attributes: definition, inquiry and counts.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using AttributesTest = ScriptedTest;

TEST_F(AttributesTest, CreateAttrReturnsTheNumberAndLeavesTheScopeToTheLibrary) {
  fake.answer("ATTR_", {4});
  EXPECT_EQ(shown(result("createAttr", {file(), "title", 1})), "double 1x1 [4]");
  EXPECT_EQ(shown(result("createAttr", {file(), "a b", 3})), "double 1x1 [4]");
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CREATE_ ATTR_ 'title' 1",
                                   "SELECT_ CDF_ 7 | CREATE_ ATTR_ 'a b' 3"));
}

TEST_F(AttributesTest, AttributesAreDeletedAndRenamed) {
  EXPECT_THAT(call("deleteAttr", {file(), 2}), IsEmpty());
  EXPECT_THAT(call("renameAttr", {file(), 2, "new"}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | ATTR_ 2 | DELETE_ ATTR_",
                                   "SELECT_ CDF_ 7 | ATTR_ 2 | PUT_ ATTR_NAME_ 'new'"));
}

TEST_F(AttributesTest, RenameAttrLabelsTheAttributeAttnum) {
  EXPECT_EQ(errorOf("renameAttr", {file(), "x", 5}), notScalar("ATTNUM"));
}

TEST_F(AttributesTest, GetAttrNameReturnsUpTo256Characters) {
  const std::string longest(256, 'n');
  fake.answerText("ATTR_NAME_", longest);
  EXPECT_EQ(result("getAttrName", {file(), 2}).utf8(), longest);
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | ATTR_ 2 | GET_ ATTR_NAME_"));
}

TEST_F(AttributesTest, GetAttrNumReturnsTheNumberOrFailsWithItAsAStatus) {
  fake.answer("CDFgetAttrNum", {6});
  EXPECT_EQ(shown(result("getAttrNum", {file(), "title"})), "double 1x1 [6]");
  EXPECT_THAT(calls(), ElementsAre("CDFgetAttrNum 7 'title'"));
  fake.answer("CDFgetAttrNum", {-2017});
  EXPECT_EQ(errorOf("getAttrNum", {file(), "no"}), libraryFailure("CDFgetAttrNum", -2017));
}

TEST_F(AttributesTest, GetAttrScopeNamesTwoScopes) {
  fake.answer("ATTR_SCOPE_", {1});
  EXPECT_EQ(result("getAttrScope", {file(), 2}).utf8(), "GLOBAL_SCOPE");
  fake.answer("ATTR_SCOPE_", {2});
  EXPECT_EQ(result("getAttrScope", {file(), 2}).utf8(), "VARIABLE_SCOPE");
  fake.answer("ATTR_SCOPE_", {3});
  EXPECT_EQ(errorOf("getAttrScope", {file(), 2}), unrecognized(3, "SCOPE"));
  EXPECT_THAT(calls()[0], "SELECT_ CDF_ 7 | ATTR_ 2 | GET_ ATTR_SCOPE_");
}

TEST_F(AttributesTest, InquireAttrReturnsNameScopeAndTheHighestGAndZEntries) {
  fake.answerText("CDFinquireAttr", "title");
  fake.answer("CDFinquireAttr", {2, -1, 99, 5});
  EXPECT_THAT(shown(call("inquireAttr", {file(), 2})),
              ElementsAre("char 1x5 'title'", "char 1x14 'VARIABLE_SCOPE'", "double 1x1 [-1]",
                          "double 1x1 [5]"));
  EXPECT_THAT(calls(), ElementsAre("CDFinquireAttr 7 2"));
  fake.answer("CDFinquireAttr", {3, 1, 1, 1});
  EXPECT_EQ(errorOf("inquireAttr", {file(), 2}), unrecognized(3, "SCOPE"));
}

TEST_F(AttributesTest, AFailingInquireAttrNamesCdfinquirecdf) {
  fake.failCall(1, -2017);
  EXPECT_EQ(errorOf("inquireAttr", {file(), 2}), libraryFailure("CDFinquireCDF", -2017));
}

TEST_F(AttributesTest, NumbersOfAttributesAreDoubles) {
  fake.answer("CDF_NUMgATTRS_", {3});
  fake.answer("CDF_NUMvATTRS_", {4});
  EXPECT_EQ(shown(result("getNumgAttributes", {file()})), "double 1x1 [3]");
  EXPECT_EQ(shown(result("getNumvAttributes", {file()})), "double 1x1 [4]");
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | GET_ CDF_NUMgATTRS_",
                                   "SELECT_ CDF_ 7 | GET_ CDF_NUMvATTRS_"));
}

struct Count {
  const char* command;
  const char* routine;
  const char* call;
  const char* reported;
};

TEST_F(AttributesTest, EntryCountsAskForKindOneOrThreeAndKeepNegativeValues) {
  const Count counts[] = {
      {"getAttrMaxgEntry", "CDFgetAttrMaxEntry", " 7 1 2", "CDFgetAttrMaxgEntry"},
      {"getAttrMaxEntry", "CDFgetAttrMaxEntry", " 7 3 2", "CDFgetAttrMaxzEntry"},
      {"getNumAttrgEntries", "CDFgetNumAttrEntries", " 7 1 2", "CDFgetNumAttrgEntries"},
      {"getNumAttrEntries", "CDFgetNumAttrEntries", " 7 3 2", "CDFgetNumAttrzEntries"}};
  for (const Count& count : counts) {
    fake.answer(count.routine, {-1});
    EXPECT_EQ(shown(result(count.command, {file(), 2})), "double 1x1 [-1]");
    EXPECT_THAT(calls(), ElementsAre(count.routine + std::string(count.call)));
    fake.failCall(1, -2076);
    EXPECT_EQ(errorOf(count.command, {file(), 2}), libraryFailure(count.reported, -2076));
    fake.forgetCalls();
  }
}

}  // namespace
}  // namespace ambrix_test
