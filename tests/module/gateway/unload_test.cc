// What unloading does with files that are still open.
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

namespace fs = std::filesystem;

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

// What waits to be written is the parent's to write.
TEST_F(UnloadTest, AChildThatEndsWritesNothingToFilesOfItsParent) {
  const Given file = create();
  const Given values = elements<std::int32_t>(1000);
  results("putVarRecordData", {file, createVar(file, {.sizes = {1000}}), 0, values});
  const std::string before = fileBytes("new.cdf");
  const pid_t child = fork();
  if (child == 0) std::exit(0);
  waitpid(child, nullptr, 0);
  EXPECT_EQ(fileBytes("new.cdf"), before);
  results("close", {file});
  EXPECT_NE(fileBytes("new.cdf"), before);
}

TEST_F(UnloadTest, AChildThatEndsHasItsOwnFilesWritten) {
  const pid_t child = fork();
  if (child == 0) {
    const Given file = create();
    results("putVarRecordData", {file, createVar(file, {}), 0, row<std::int32_t>({7})});
    std::exit(0);
  }
  waitpid(child, nullptr, 0);
  EXPECT_EQ(does("getVarRecordData", {open("new"), 0, 0}), "int32 1x1 [7]");
}

TEST_F(UnloadTest, AModuleLoadedAgainKnowsNoIdentifierOfTheOneBefore) {
  const Given file = create();
  module.unload();
  module = ::ambrix::Module();
  EXPECT_EQ(does("close", {file}), kInvalidFileId);
}

/// What this process holds.
struct Footprint {
  std::ptrdiff_t files = 0;
  std::ptrdiff_t mappings = 0;
  long pages = 0;
};

Footprint footprint() {
  Footprint found;
  found.files = std::distance(fs::directory_iterator("/proc/self/fd"), {});
  std::ifstream mappings("/proc/self/maps");
  for (std::string line; std::getline(mappings, line);)
    ++found.mappings;
  long all = 0;
  std::ifstream("/proc/self/statm") >> all >> found.pages;
  return found;
}

/// Loads the module, leaves a file open for reading and one for writing, and unloads it.
void loadAndUnload(const Given& read, const Given& written) {
  ::ambrix::Module module;
  const Array first = std::move(module.call("open", {read.view()}).at(0));
  (void)module.call("getVarRecordData", {first, Array::scalar(0.0), Array::scalar(0.0)});
  const Array second = std::move(module.call("open", {written.view()}).at(0));
  module.call("putVarRecordData",
              {second, Array::scalar(0.0), Array::scalar(0.0), Array::scalar(std::int32_t{8})});
  module.unload();
}

TEST_F(UnloadTest, ThousandsOfTimesWithFilesOpenDoNotGrowTheProcess) {
#ifdef __SANITIZE_ADDRESS__
  constexpr bool kKeepsFreed = true;  // for a while, to find uses of it
  constexpr int kCycles = 300;
#else
  constexpr bool kKeepsFreed = false;
  constexpr int kCycles = 2000;
#endif
  for (const char* name : {"read", "written"}) {
    const Given file = create(name);
    results("putVarRecordData", {file, createVar(file, {}), 0, row<std::int32_t>({7})});
    results("close", {file});
  }
  module.unload();
  for (int i = 0; i < 100; ++i)
    loadAndUnload("read", "written");
  const Footprint before = footprint();
  for (int i = 0; i < kCycles; ++i)
    loadAndUnload("read", "written");
  const Footprint after = footprint();
  EXPECT_EQ(after.files, before.files);
  if (!kKeepsFreed) {
    EXPECT_LE(after.mappings, before.mappings + 8);  // those of the heap vary
    EXPECT_LE(after.pages, before.pages + 256);
  }
  EXPECT_EQ(module.leaks(), ::ambrix::LiveCounts{});
  module = ::ambrix::Module();
  EXPECT_EQ(does("getVarRecordData", {open("written"), 0, 0}), "int32 1x1 [8]");
}

}  // namespace
}  // namespace ambrix_test
