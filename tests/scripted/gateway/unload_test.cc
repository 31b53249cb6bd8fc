// What is left open when the module goes.
#include <stdexcept>

#include "file/file_lifecycle.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using UnloadTest = ScriptedTest;
using TOLVEX::ambrix::CdfId;

TEST_F(UnloadTest, OneWarningAndThenEveryFileIsClosedInAscendingOrder) {
  for (const long handle : {12L, 3L}) {
    fake.answer("handle", {handle});
    call("create", {"a.cdf"});
  }
  fake.forgetCalls();
  module.setWarningHandler(
      [&](const ::ambrix::MessageId& warning) { fake.finish(messageText(warning)); });
  module.unload();
  EXPECT_THAT(calls(),
              ElementsAre(cdflib("closingFileHandle"), "SELECT_ CDF_ 3 | CLOSE_ CDF_",
                          "SELECT_ CDF_ 7 | CLOSE_ CDF_", "SELECT_ CDF_ 12 | CLOSE_ CDF_"));
}

TEST_F(UnloadTest, WithoutOpenFilesThereIsNoWarning) {
  call("close", {file()});
  fake.forgetCalls();
  module.unload();
  EXPECT_THAT(warnings(), IsEmpty());
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(UnloadTest, AFileThatFailsToCloseDoesNotKeepTheOthersOpen) {
  fake.answer("handle", {8});
  call("create", {"a.cdf"});
  fake.forgetCalls();
  fake.endWith("CLOSE_", -2055);
  module.unload();
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CLOSE_ CDF_", "SELECT_ CDF_ 8 | CLOSE_ CDF_"));
  EXPECT_THAT(fake.statusCalls(), IsEmpty());
  EXPECT_THAT(warnings(), ElementsAre(cdflib("closingFileHandle")));
}

// In a host that lets errors out of warnings while it unloads; the embedded one does not.
TEST_F(UnloadTest, AWarningThatBecomesAnErrorDoesNotKeepFilesOpen) {
  ::ambrix::Module unloading(
      [](int, qvArray*[], int, const qvArray*[]) { TOLVEX::ambrix::closeAllOnUnload(); });
  unloading.setWarningHandler(
      [](const ::ambrix::MessageId&) { throw std::runtime_error("no warnings, please"); });
  EXPECT_THROW(unloading.call("unload"), std::runtime_error);
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CLOSE_ CDF_"));
  EXPECT_EQ(errorOf("getFormat", {file()}), libraryFailure("CDFgetFormat", -2002));
}

TEST_F(UnloadTest, TheRegistryIsNotEmptied) {
  module.unload();
  EXPECT_THAT(openFiles(), ElementsAre(CdfId{7}));
}

TEST_F(UnloadTest, AFileThatTheLibraryHasFreedIsWarnedOfButNotTouched) {
  fake.failCall(1, -2055);
  errorOf("close", {file()});
  fake.forgetCalls();
  module.unload();
  EXPECT_THAT(warnings(), ElementsAre(cdflib("closingFileHandle")));
  EXPECT_THAT(calls(), IsEmpty());
}

}  // namespace
}  // namespace ambrix_test
