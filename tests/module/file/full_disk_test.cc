// No room for what is written: an error says so, and nothing else suffers.
#include <algorithm>
#include <filesystem>
#include <ostream>
#include <random>

#include "tests/module/support/environment.h"
#include "tests/module/support/leak_check.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

namespace fs = std::filesystem;
using testing::AnyOf;
using testing::HasSubstr;
using testing::StartsWith;

constexpr std::size_t kValues = 20000;
constexpr int kRecords = 8;
constexpr long kRoom = 64 * 1024;  // less than one record takes

/// How the data get into the file.
struct Storage {
  const char* name;
  int format = 1;
  int fileCompression = 0;
  int variableCompression = 0;

  friend std::ostream& operator<<(std::ostream& out, const Storage& shown) {
    return out << shown.name;
  }
};

class FullDiskTest : public ModuleTest, public testing::WithParamInterface<Storage> {
 protected:
  Given createStored(const char* name);
  /// Writes records that do not compress, as many as can be written; gives what the first one that
  /// can't has raised, else what closing does.
  std::string fill(const Given& file);
  /// The module works as if nothing had happened.
  void expectOthersWork();

 private:
  Given noise() const;
};

Given FullDiskTest::createStored(const char* name) {
  const Storage& storage = GetParam();
  const Given file = create(name);
  results("setFormat", {file, storage.format});
  if (storage.fileCompression != 0) results("setCompression", {file, storage.fileCompression, 6});
  createVar(file, {.sizes = {kValues}});
  if (storage.variableCompression != 0)
    results("setVarCompression", {file, 0, storage.variableCompression, 6});
  return file;
}

Given FullDiskTest::noise() const {
  std::mt19937 random(1);
  std::vector<std::int32_t> values(kValues);
  for (std::int32_t& value : values)
    value = static_cast<std::int32_t>(random());
  return Array::row(std::span<const std::int32_t>(values));
}

std::string FullDiskTest::fill(const Given& file) {
  const Given record = noise();
  for (int i = 0; i < kRecords; ++i) {
    const std::string text = does("putVarRecordData", {file, 0, i, record});
    if (text == "done") continue;
    EXPECT_EQ(does("close", {file}), "done") << "after access was aborted";
    return text;
  }
  const std::string text = does("close", {file});
  EXPECT_EQ(does("close", {file}), refused("CDFcloseCDF", kBadCdfId));
  return text;
}

void FullDiskTest::expectOthersWork() {
  const Given file = createStored("other");
  const Given record = noise();
  results("putVarRecordData", {file, 0, 0, record});
  const Given again = reopen(file, "other");
  const Array found = result("getVarRecordData", {again, 0, 0});
  EXPECT_TRUE(std::ranges::equal(found.data<std::int32_t>(), record.view().data<std::int32_t>()));
  EXPECT_EQ(does("close", {again}), "done");
}

TEST_P(FullDiskTest, ALimitOnTheSizeOfFilesIsReported) {
  const LeaksIgnored ignored;
  const Given file = createStored("full");
  {
    const FileSizeLimit limit(kRoom);
    EXPECT_THAT(fill(file),
                AnyOf(StartsWith("TOLVEX:ambrix:cdflib:libraryFailure('CDFcloseCDF'"),
                      StartsWith("TOLVEX:ambrix:cdflib:libraryFailure('CDFputzVarRec")));
  }
  expectOthersWork();
}

TEST_P(FullDiskTest, AFullFileSystemIsReported) {
  const LeaksIgnored ignored;
  const SmallFileSystem small("small", kRoom);
  if (!small.mounted()) GTEST_SKIP() << "this process may not mount a small file system";
  EXPECT_THAT(fill(createStored("small/full")), HasSubstr("cdflib:libraryFailure('CDF"));
  expectOthersWork();
}

INSTANTIATE_TEST_SUITE_P(Storages, FullDiskTest,
                         testing::Values(Storage{.name = "plain"},
                                         Storage{.name = "multiFile", .format = 2},
                                         Storage{.name = "gzipVariable", .variableCompression = 5},
                                         Storage{.name = "gzipFile", .fileCompression = 5}),
                         [](const auto& given) { return given.param.name; });

using FullDeviceTest = ModuleTest;

TEST_F(FullDeviceTest, ADeviceThatIsAlwaysFullFailsWhenTheFileIsClosed) {
  if (!fs::exists("/dev/full")) GTEST_SKIP() << "there is no /dev/full";
  const LeaksIgnored ignored;
  fs::create_symlink("/dev/full", "full.cdf");
  const Given file = create("full");
  createVar(file, {});
  EXPECT_THAT(does("close", {file}), HasSubstr("libraryFailure('CDFcloseCDF', 'CDF_"));
  EXPECT_EQ(does("close", {file}), refused("CDFcloseCDF", kBadCdfId));
}

TEST_F(FullDeviceTest, UnloadingWithAFullDiskWarnsAndEnds) {
  const LeaksIgnored ignored;
  const Given file = create("full");
  createVar(file, {.sizes = {kValues}});
  results("putVarRecordData", {file, 0, 0, elements<std::int32_t>(kValues)});
  {
    const FileSizeLimit limit(200);  // not even the description fits
    module.unload();
  }
  EXPECT_THAT(warnings(), testing::ElementsAre("TOLVEX:ambrix:cdflib:closingFileHandle()"));
  module = ::ambrix::Module();
  EXPECT_EQ(does("open", {"full"}), "TOLVEX:ambrix:cdflib:fileOpenError()");
}

}  // namespace
}  // namespace ambrix_test
