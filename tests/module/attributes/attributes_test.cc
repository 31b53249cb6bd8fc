// Attributes and the counts of their entries.
#include <cmath>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with the global attribute 0, "G", and the variable attribute 1, "V".
class AttributesTest : public ModuleTest {
 protected:
  AttributesTest() {
    results("createAttr", {file, "G", 1});
    results("createAttr", {file, "V", 2});
  }
  void putGEntry(double entry) { results("putAttrgEntry", {file, 0, entry, 45, 1}); }
  void putZEntry(double entry) { results("putAttrEntry", {file, 1, entry, 45, 1}); }

  Given file = create();
};

TEST_F(AttributesTest, AreNumberedFromZero) {
  EXPECT_EQ(does("createAttr", {file, "third", 1}), "double 1x1 [2]");
  EXPECT_EQ(does("getAttrNum", {file, "third"}), "double 1x1 [2]");
  EXPECT_EQ(does("getAttrName", {file, 2}), "char 1x5 'third'");
}

TEST_F(AttributesTest, ScopesAreNamed) {
  EXPECT_EQ(does("getAttrScope", {file, 0}), "char 1x12 'GLOBAL_SCOPE'");
  EXPECT_EQ(does("getAttrScope", {file, 1}), "char 1x14 'VARIABLE_SCOPE'");
}

TEST_F(AttributesTest, TheLibraryJudgesTheScope) {
  for (const double scope : {0.0, 5.0, -1.0, 4294967297.0}) {
    EXPECT_EQ(does("createAttr", {file, "x", scope}), refused("CDFcreateAttr", kBadScope));
  }
  results("createAttr", {file, "assumed", 3});
  EXPECT_EQ(does("getAttrScope", {file, 2}), "char 1x12 'GLOBAL_SCOPE'");
}

TEST_F(AttributesTest, NamesAreTheLibrarysToJudge) {
  EXPECT_EQ(does("createAttr", {file, "G", 1}), refused("CDFcreateAttr", kAttrExists));
  EXPECT_EQ(does("createAttr", {file, "caf\xE9", 1}), refused("CDFcreateAttr", kBadAttrName));
  EXPECT_EQ(does("renameAttr", {file, 1, "G"}), refused("CDFrenameAttr", kAttrExists));
  EXPECT_EQ(does("renameAttr", {file, 1, "a\nb"}), refused("CDFrenameAttr", kBadAttrName));
  const std::string longest(255, 'n');
  EXPECT_EQ(does("createAttr", {file, longest.c_str(), 1}), "double 1x1 [2]");
  EXPECT_EQ(does("getAttrName", {file, 2}), "char 1x255 '" + longest + "'");
  EXPECT_EQ(does("createAttr", {file, (std::string(300, 'm')).c_str(), 1}),
            refused("CDFcreateAttr", kAttrNameTrunc));
}

TEST_F(AttributesTest, RenamingKeepsTheNumber) {
  EXPECT_EQ(does("renameAttr", {file, 0, "new name"}), "done");
  EXPECT_EQ(does("getAttrName", {file, 0}), "char 1x8 'new name'");
  EXPECT_EQ(does("getAttrNum", {file, "G"}), refused("CDFgetAttrNum", kNoSuchAttr));
}

TEST_F(AttributesTest, DeletingRenumbersTheOthers) {
  EXPECT_EQ(does("deleteAttr", {file, 0}), "done");
  EXPECT_EQ(does("getAttrName", {file, 0}), "char 1x1 'V'");
  EXPECT_EQ(does("deleteAttr", {file, 1}), refused("CDFdeleteAttr", kNoSuchAttr));
}

TEST_F(AttributesTest, NamesAreFoundInTheirCase) {
  EXPECT_EQ(does("getAttrNum", {file, "g"}), refused("CDFgetAttrNum", kNoSuchAttr));
  EXPECT_EQ(does("getAttrNum", {file, ""}), refused("CDFgetAttrNum", kNoSuchAttr));
}

TEST_F(AttributesTest, InquiryGivesNameScopeAndTheHighestEntries) {
  EXPECT_EQ(does("inquireAttr", {file, 0}),
            "char 1x1 'G'; char 1x12 'GLOBAL_SCOPE'; double 1x1 [-1]; double 1x1 [-1]");
  putGEntry(4);
  putZEntry(0);
  EXPECT_EQ(does("inquireAttr", {file, 0}),
            "char 1x1 'G'; char 1x12 'GLOBAL_SCOPE'; double 1x1 [4]; double 1x1 [-1]");
  EXPECT_EQ(does("inquireAttr", {file, 1}),
            "char 1x1 'V'; char 1x14 'VARIABLE_SCOPE'; double 1x1 [-1]; double 1x1 [0]");
}

TEST_F(AttributesTest, AFailedInquiryIsReportedAsThatOfTheFile) {
  EXPECT_EQ(does("inquireAttr", {file, 2}), refused("CDFinquireCDF", kNoSuchAttr));
}

TEST_F(AttributesTest, AttributesOfEitherScopeAreCounted) {
  results("createAttr", {file, "W", 2});
  EXPECT_EQ(does("getNumgAttributes", {file}), "double 1x1 [1]");
  EXPECT_EQ(does("getNumvAttributes", {file}), "double 1x1 [2]");
}

TEST_F(AttributesTest, EntriesAreCountedAndTheHighestIsNoCount) {
  putGEntry(0);
  putGEntry(7);
  EXPECT_EQ(does("getNumAttrgEntries", {file, 0}), "double 1x1 [2]");
  EXPECT_EQ(does("getAttrMaxgEntry", {file, 0}), "double 1x1 [7]");
  putZEntry(0);
  putZEntry(3);
  putZEntry(5);
  EXPECT_EQ(does("getNumAttrEntries", {file, 1}), "double 1x1 [3]");
  EXPECT_EQ(does("getAttrMaxEntry", {file, 1}), "double 1x1 [5]");
}

TEST_F(AttributesTest, WithoutEntriesTheHighestIsMinusOne) {
  EXPECT_EQ(does("getAttrMaxgEntry", {file, 0}), "double 1x1 [-1]");
  EXPECT_EQ(does("getNumAttrgEntries", {file, 0}), "double 1x1 [0]");
  EXPECT_EQ(does("getAttrMaxEntry", {file, 1}), "double 1x1 [-1]");
  EXPECT_EQ(does("getNumAttrEntries", {file, 1}), "double 1x1 [0]");
}

TEST_F(AttributesTest, CountsOfTheOtherKindAreTheLibrarysToRefuse) {
  EXPECT_EQ(does("getAttrMaxEntry", {file, 0}), refused("CDFgetAttrMaxzEntry", kIllegalForScope));
  EXPECT_EQ(does("getNumAttrEntries", {file, 0}),
            refused("CDFgetNumAttrzEntries", kIllegalForScope));
  EXPECT_EQ(does("getAttrMaxgEntry", {file, 1}), refused("CDFgetAttrMaxgEntry", kIllegalForScope));
  EXPECT_EQ(does("getNumAttrgEntries", {file, 1}),
            refused("CDFgetNumAttrgEntries", kIllegalForScope));
}

TEST_F(AttributesTest, FilesOfOthersShowTheirAttributes) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("inquireAttr", {example, 0}),
            "char 1x5 'TITLE'; char 1x12 'GLOBAL_SCOPE'; double 1x1 [1]; double 1x1 [-1]");
  EXPECT_EQ(does("getAttrNum", {example, "UNITS"}), "double 1x1 [2]");
  EXPECT_EQ(does("getNumgAttributes", {example}), "double 1x1 [1]");
  EXPECT_EQ(does("getNumvAttributes", {example}), "double 1x1 [2]");
}

}  // namespace
}  // namespace ambrix_test
