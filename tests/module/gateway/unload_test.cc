// What unloading does with files that are still open.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using UnloadTest = ModuleTest;
const std::string kWarning = "TOLVEX:ambrix:cdflib:closingFileHandle()";

TEST_F(UnloadTest, WithoutOpenFilesThereIsNoWarning) {
  results("close", {create()});
  module.unload();
  EXPECT_THAT(warnings(), testing::IsEmpty());
}

TEST_F(UnloadTest, OneOpenFileIsWarnedOfAndWritten) {
  const Given file = create();
  results("putVarRecordData", {file, createVar(file, {}), 0, row<std::int32_t>({7})});
  module.unload();
  EXPECT_THAT(warnings(), testing::ElementsAre(kWarning));
  module = ::ambrix::Module();
  EXPECT_EQ(does("getVarRecordData", {open("new"), 0, 0}), "int32 1x1 [7]");
}

TEST_F(UnloadTest, TwoOpenFilesAreWarnedOfOnceAndBothAreWritten) {
  createVar(create("first"), {.name = "one"});
  createVar(create("second"), {.name = "two"});
  module.unload();
  EXPECT_THAT(warnings(), testing::ElementsAre(kWarning));
  module = ::ambrix::Module();
  EXPECT_EQ(does("getVarName", {open("first"), 0}), "char 1x3 'one'");
  EXPECT_EQ(does("getVarName", {open("second"), 0}), "char 1x3 'two'");
}

TEST_F(UnloadTest, AModuleLoadedAgainKnowsNoIdentifierOfTheOneBefore) {
  const Given file = create();
  module.unload();
  module = ::ambrix::Module();
  EXPECT_EQ(does("close", {file}), kInvalidFileId);
}

}  // namespace
}  // namespace ambrix_test
