// Files that cannot be written, and files that others remove, replace or damage while they are
// open.
#include <filesystem>
#include <fstream>

#include "tests/module/support/environment.h"
#include "tests/module/support/leak_check.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

namespace fs = std::filesystem;
constexpr const char* kNoWriteAccess =
    "NO_WRITE_ACCESS: Write access is not allowed on the CDF file(s).";

class VanishingFilesTest : public ModuleTest {
 protected:
  /// Makes and closes a file whose variable 0 has this many values of this number.
  void make(const char* name, std::size_t values, std::int32_t number = 7) {
    const Given file = create(name);
    createVar(file, {.sizes = {static_cast<double>(values)}});
    const std::vector<std::int32_t> data(values, number);
    results("putVarRecordData", {file, 0, 0, Array::row(std::span<const std::int32_t>(data))});
    results("close", {file});
  }
  std::string firstValue(const Given& file) { return does("getVarData", {file, 0, 0, 0}); }
};

TEST_F(VanishingFilesTest, WhatCannotBeWrittenCanStillBeRead) {
  make("kept", 5);
  fs::permissions("kept.cdf", fs::perms(0444));
  const ReadOnlyFolder folder;
  if (!folder.holds()) GTEST_SKIP() << "this process cannot give up the rights of root";
  EXPECT_EQ(does("create", {"new"}), kCreateError);
  const Given file = open("kept");
  EXPECT_EQ(firstValue(file), "int32 1x1 [7]");
  EXPECT_EQ(does("createAttr", {file, "a", 1}), refused("CDFcreateAttr", kNoWriteAccess));
  EXPECT_EQ(does("putVarData", {file, 0, 0, 0, row<std::int32_t>({8})}),
            refused("CDFputzVarData", kNoWriteAccess));
  EXPECT_EQ(does("delete", {file}), refused("CDFdelete", kNoWriteAccess));
  EXPECT_EQ(firstValue(file), "int32 1x1 [7]");
  EXPECT_EQ(does("close", {file}), "done");
}

// The files of most systems live on until they are closed.
TEST_F(VanishingFilesTest, ARemovedFileIsReadOn) {
  make("gone", 5);
  const Given file = open("gone");
  fs::remove("gone.cdf");
  EXPECT_EQ(firstValue(file), "int32 1x1 [7]");
  EXPECT_EQ(does("close", {file}), "done");
  EXPECT_FALSE(fs::exists("gone.cdf"));
}

// The library opens it by its name once more before it writes.
TEST_F(VanishingFilesTest, ARemovedFileCannotBeginToBeWritten) {
  const LeaksIgnored ignored;
  make("gone", 5);
  const Given file = open("gone");
  fs::remove("gone.cdf");
  EXPECT_EQ(does("createAttr", {file, "a", 1}), refused("CDFcreateAttr", kCdfOpenError));
  EXPECT_EQ(firstValue(file), refused("CDFinquirezVar", kNoMoreAccess));
  EXPECT_EQ(does("close", {file}), "done");
  EXPECT_FALSE(fs::exists("gone.cdf"));
}

TEST_F(VanishingFilesTest, AFileRemovedWhileItIsWrittenCanBeClosed) {
  for (const bool isNew : {true, false}) {
    const Given file = isNew ? create("gone") : (make("gone", 5), open("gone"));
    results("createAttr", {file, "a", 1});
    fs::remove("gone.cdf");
    EXPECT_EQ(does("createAttr", {file, "b", 1}), "double 1x1 [1]");
    EXPECT_EQ(does("close", {file}), "done");
    EXPECT_FALSE(fs::exists("gone.cdf"));
  }
}

TEST_F(VanishingFilesTest, AReplacedFileIsReadOnAsItWas) {
  make("old", 5);
  make("new", 3, 9);
  const Given file = open("old");
  fs::rename("new.cdf", "old.cdf");
  EXPECT_EQ(firstValue(file), "int32 1x1 [7]");
  EXPECT_EQ(does("getVarRecordData", {file, 0, 0}), "int32 5x1 [7 7 7 7 7]");
  EXPECT_EQ(does("close", {file}), "done");
  EXPECT_EQ(does("getVarRecordData", {open("old"), 0, 0}), "int32 3x1 [9 9 9]");
}

TEST_F(VanishingFilesTest, AReplacedFileIsWrittenAsTheNewOne) {
  make("old", 5);
  make("new", 3, 9);
  const Given file = open("old");
  fs::rename("new.cdf", "old.cdf");
  EXPECT_EQ(does("createAttr", {file, "a", 1}), "double 1x1 [0]");
  EXPECT_EQ(does("getVarRecordData", {file, 0, 0}), "int32 3x1 [9 9 9]");
  EXPECT_EQ(does("close", {file}), "done");
  const Given again = open("old");
  EXPECT_EQ(does("getAttrName", {again, 0}), "char 1x1 'a'");
  EXPECT_EQ(does("getVarRecordData", {again, 0, 0}), "int32 3x1 [9 9 9]");
}

TEST_F(VanishingFilesTest, AFileThatIsCutOffFailsWhereItEnds) {
  const LeaksIgnored ignored;
  make("cut", 100000);
  const Given file = open("cut");
  fs::resize_file("cut.cdf", 1000);
  const std::string last = does("getVarData", {file, 0, 0, 99999});
  EXPECT_THAT(last, testing::HasSubstr("cdflib:libraryFailure('CDFgetzVarData'"));
  EXPECT_EQ(does("getVarName", {file, 0}), refused("CDFgetzVarName", kNoMoreAccess));
  EXPECT_EQ(does("close", {file}), "done");
}

TEST_F(VanishingFilesTest, AFileThatBecomesSomethingElseIsRefusedWhenItIsWritten) {
  const LeaksIgnored ignored;
  make("junk", 5);
  const Given file = open("junk");
  std::ofstream("junk.cdf", std::ios::binary) << std::string(4000, 'j');
  EXPECT_THAT(does("createAttr", {file, "a", 1}),
              testing::HasSubstr("cdflib:libraryFailure('CDFcreateAttr'"));
  EXPECT_EQ(does("getVarName", {file, 0}), refused("CDFgetzVarName", kNoMoreAccess));
  EXPECT_EQ(does("close", {file}), "done");
}

}  // namespace
}  // namespace ambrix_test
