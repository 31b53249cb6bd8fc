// Single entries of attributes: addresses, scopes, refusals.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with the global attribute 0, "G", and the variable attribute 1, "V".
class AttributeEntriesTest : public ModuleTest {
 protected:
  AttributeEntriesTest() {
    results("createAttr", {file, "G", 1});
    results("createAttr", {file, "V", 2});
  }
  Given file = create();
};

TEST_F(AttributeEntriesTest, ThePutCommandsAreInterchangeable) {
  for (const char* put : {"putAttrEntry", "putAttrgEntry"}) {
    EXPECT_EQ(does(put, {file, 0, 5, 4, row<std::int32_t>({1, 2})}), "done");
    EXPECT_EQ(does("getAttrgEntry", {file, 0, 5}), "int32 1x2 [1 2]");
    EXPECT_EQ(does(put, {file, 1, 3, 4, row<std::int32_t>({3})}), "done");
    EXPECT_EQ(does("getAttrEntry", {file, 1, 3}), "int32 1x1 [3]");
    results("deleteAttrgEntry", {file, 0, 5});
    results("deleteAttrEntry", {file, 1, 3});
  }
}

TEST_F(AttributeEntriesTest, AnEntryIsReplacedByTheNextOfItsNumber) {
  results("putAttrgEntry", {file, 0, 0, 51, "first"});
  results("putAttrgEntry", {file, 0, 0, 45, {1, 2, 3}});
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 0}), "double 1x3 [1 2 3]");
  EXPECT_EQ(does("inquireAttrgEntry", {file, 0, 0}), "char 1x10 'cdf_double'; double 1x1 [3]");
  EXPECT_EQ(does("getNumAttrgEntries", {file, 0}), "double 1x1 [1]");
}

TEST_F(AttributeEntriesTest, EntriesOfAnAttributeDifferInType) {
  results("putAttrgEntry", {file, 0, 0, 51, "text"});
  results("putAttrgEntry", {file, 0, 2, 22, {7}});
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 0}), "char 1x4 'text'");
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 2}), "double 1x1 [7]");
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 1}), refused("CDFinquireAttrgEntry", kNoSuchEntry));
}

TEST_F(AttributeEntriesTest, ZEntriesMayBePutForVariablesToCome) {
  results("putAttrEntry", {file, 1, 9, 51, "later"});
  EXPECT_EQ(does("getAttrEntry", {file, 1, 9}), "char 1x5 'later'");
}

TEST_F(AttributeEntriesTest, AMissingEntryFailsUnderTheRoutineOfEachCommand) {
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 3}), refused("CDFinquireAttrgEntry", kNoSuchEntry));
  EXPECT_EQ(does("getAttrEntry", {file, 1, 3}), refused("CDFinquireAttrzEntry", kNoSuchEntry));
  EXPECT_EQ(does("inquireAttrgEntry", {file, 0, 3}), refused("CDFinquireAttrgEntry", kNoSuchEntry));
  EXPECT_EQ(does("inquireAttrEntry", {file, 1, 3}), refused("CDFinquireAttrzEntry", kNoSuchEntry));
  EXPECT_EQ(does("deleteAttrgEntry", {file, 0, 3}), refused("CDFdeleteAttrgEntry", kNoSuchEntry));
  EXPECT_EQ(does("deleteAttrEntry", {file, 1, 3}), refused("CDFdeleteAttrzEntry", kNoSuchEntry));
}

TEST_F(AttributeEntriesTest, TheKindMustSuitTheScope) {
  results("putAttrgEntry", {file, 0, 0, 4, row<std::int32_t>({1})});
  results("putAttrEntry", {file, 1, 0, 4, row<std::int32_t>({1})});
  EXPECT_EQ(does("getAttrEntry", {file, 0, 0}), refused("CDFinquireAttrzEntry", kIllegalForScope));
  EXPECT_EQ(does("getAttrgEntry", {file, 1, 0}), refused("CDFinquireAttrgEntry", kIllegalForScope));
  EXPECT_EQ(does("inquireAttrEntry", {file, 0, 0}),
            refused("CDFinquireAttrzEntry", kIllegalForScope));
  EXPECT_EQ(does("deleteAttrEntry", {file, 0, 0}),
            refused("CDFdeleteAttrzEntry", kIllegalForScope));
  EXPECT_EQ(does("deleteAttrgEntry", {file, 1, 0}),
            refused("CDFdeleteAttrgEntry", kIllegalForScope));
}

TEST_F(AttributeEntriesTest, AnEntryNumberBeyond32BitsOverwritesNothing) {
  const double beyond = 4294967296.0;
  results("putAttrgEntry", {file, 0, 0, 51, "kept"});
  EXPECT_EQ(does("putAttrgEntry", {file, 0, beyond, 51, "lost"}),
            refused("CDFputAttrgEntry", kBadEntryNum));
  EXPECT_EQ(does("putAttrEntry", {file, 1, beyond / 2, 51, "lost"}),
            refused("CDFputAttrzEntry", kBadEntryNum));
  EXPECT_EQ(does("getAttrgEntry", {file, 0, beyond}),
            refused("CDFinquireAttrgEntry", kBadEntryNum));
  EXPECT_EQ(does("inquireAttrgEntry", {file, 0, beyond}),
            refused("CDFinquireAttrgEntry", kBadEntryNum));
  EXPECT_EQ(does("deleteAttrgEntry", {file, 0, beyond}),
            refused("CDFdeleteAttrgEntry", kBadEntryNum));
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 0}), "char 1x4 'kept'");
}

TEST_F(AttributeEntriesTest, NegativeEntryNumbersAreRefused) {
  EXPECT_EQ(does("putAttrgEntry", {file, 0, -1, 51, "x"}),
            refused("CDFputAttrgEntry", kBadEntryNum));
  EXPECT_EQ(does("getAttrgEntry", {file, 0, -1}), refused("CDFinquireAttrgEntry", kBadEntryNum));
}

TEST_F(AttributeEntriesTest, TheValueIsCheckedBeforeTheAttributeIsLookedUp) {
  EXPECT_EQ(does("putAttrEntry", {file, 9, 0, 3, 1}), unrecognized(3, "DATATYPE"));
  EXPECT_EQ(does("putAttrEntry", {file, 9, 0, 4, 1}),
            cdflib("badPutAttrEntryDatatype", "double", "CDF_INT4"));
  EXPECT_EQ(does("putAttrEntry", {file, 9, 0, 45, 1}), refused("CDFgetAttrScope", kNoSuchAttr));
  EXPECT_EQ(does("putAttrEntry", {file, 4294967296.0, 0, 45, 1}),
            refused("CDFgetAttrScope", kNoSuchAttr));
}

TEST_F(AttributeEntriesTest, DeletingAnEntryLeavesTheOthers) {
  for (const double entry : {0, 1, 2})
    results("putAttrgEntry", {file, 0, entry, 45, entry});
  EXPECT_EQ(does("deleteAttrgEntry", {file, 0, 1}), "done");
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 2}), "double 1x1 [2]");
  EXPECT_EQ(does("getNumAttrgEntries", {file, 0}), "double 1x1 [2]");
}

}  // namespace
}  // namespace ambrix_test
