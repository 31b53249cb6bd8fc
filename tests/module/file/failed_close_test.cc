// A close that fails: the library has freed the file although its identifier stays registered.
#include "tests/module/support/leak_check.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

class FailedCloseTest : public ModuleTest {
 protected:
  /// The library accepts this kind of checksum, cannot close a file that has it and forgets to free
  /// its buffers.
  Given fileThatCannotBeClosed(const char* name = "new") {
    const LeaksIgnored ignored;
    const Given file = create(name);
    createVar(file, {});
    results("setChecksum", {file, 2});
    return file;
  }
};

TEST_F(FailedCloseTest, IsReportedAndKeepsTheIdentifierRegistered) {
  const Given file = fileThatCannotBeClosed();
  EXPECT_EQ(does("close", {file}), refused("CDFcloseCDF", kCdfCloseError));
  EXPECT_EQ(does("close", {file}), refused("CDFcloseCDF", kBadCdfId));
}

TEST_F(FailedCloseTest, LaterCommandsFailUnderTheirRoutineNames) {
  const Given file = fileThatCannotBeClosed();
  does("close", {file});
  const auto fails = [](const char* routine) { return refused(routine, kBadCdfId); };
  EXPECT_EQ(does("delete", {file}), fails("CDFdelete"));
  EXPECT_EQ(does("inquire", {file}), fails("CDFinquireCDF"));
  EXPECT_EQ(does("getMajority", {file}), fails("CDFgetMajority"));
  EXPECT_EQ(does("setCacheSize", {file, 5}), fails("CDFsetCacheSize"));
  EXPECT_EQ(does("getCompression", {file}), fails("CDFgetCompression"));
  EXPECT_EQ(does("getVarName", {file, 0}), fails("CDFgetzVarName"));
  EXPECT_EQ(does("getVarNum", {file, "v"}), fails("CDFclosezVar"));
  EXPECT_EQ(does("inquireVar", {file, 0}), fails("CDFinquirezVar"));
  EXPECT_EQ(does("getVarData", {file, 0, 0}), fails("CDFinquirezVar"));
  EXPECT_EQ(does("createVar", {file, "w", 4, 1, {}, -1, {}}), fails("CDFgetMajority"));
  EXPECT_EQ(does("createAttr", {file, "a", 1}), fails("CDFcreateAttr"));
  EXPECT_EQ(does("getAttrNum", {file, "a"}), fails("CDFgetAttrNum"));
  EXPECT_EQ(does("inquireAttr", {file, 0}), fails("CDFinquireCDF"));
  EXPECT_EQ(does("getAttrMaxEntry", {file, 0}), fails("CDFgetAttrMaxzEntry"));
  EXPECT_EQ(does("getAttrgEntry", {file, 0, 0}), fails("CDFinquireAttrgEntry"));
  EXPECT_EQ(does("deleteAttrEntry", {file, 0, 0}), fails("CDFdeleteAttrzEntry"));
  EXPECT_EQ(does("putAttrEntry", {file, 0, 0, 22, 1}), fails("CDFgetAttrScope"));
  EXPECT_EQ(does("deleteVarRecords", {file, 0, 0, 0}), fails("CDFdeletezVarRecords"));
  EXPECT_EQ(does("getVarCacheSize", {file, 0}), fails("CDFgetFormat"));
}

TEST_F(FailedCloseTest, ArgumentsAreStillCheckedBeforeTheLibraryIsAsked) {
  const Given file = fileThatCannotBeClosed();
  does("close", {file});
  EXPECT_EQ(does("getVarName", {file, "x"}), validate("argumentNotDoubleScalar", "VARNUM"));
}

TEST_F(FailedCloseTest, UnloadingSurvivesItAndClosesTheOthers) {
  const Given broken = fileThatCannotBeClosed("broken");
  does("close", {broken});
  const Given sane = create("sane");
  createVar(sane, {.name = "kept"});
  module.unload();
  EXPECT_THAT(warnings(), testing::ElementsAre("TOLVEX:ambrix:cdflib:closingFileHandle()"));
  module = ::ambrix::Module();
  EXPECT_EQ(does("getVarName", {open("sane"), 0}), "char 1x4 'kept'");
}

TEST_F(FailedCloseTest, AnIdentifierThatTheLibraryHandsOutAgainIsUsable) {
  const Given broken = fileThatCannotBeClosed();
  does("close", {broken});
  const std::string freed = shown(broken.view());
  bool seenAgain = false;
  for (const char* name : {"a", "b", "c", "d", "e", "f", "g", "h"}) {
    const Given file = create(name);
    createVar(file, {.name = name});
    EXPECT_EQ(does("getVarName", {file, 0}), std::string("char 1x1 '") + name + "'");
    seenAgain |= shown(file.view()) == freed;
    EXPECT_EQ(does("close", {file}), "done");
    const Given again = open(name);
    seenAgain |= shown(again.view()) == freed;
    EXPECT_EQ(does("getVarName", {again, 0}), std::string("char 1x1 '") + name + "'");
  }
  if (!seenAgain) {
    EXPECT_EQ(does("inquire", {broken}), refused("CDFinquireCDF", kBadCdfId));
  }
}

}  // namespace
}  // namespace ambrix_test
