// Creating, opening, closing and deleting files, and who may be told of which identifier.
#include <filesystem>
#include <fstream>

#include "tests/module/support/leak_check.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

namespace fs = std::filesystem;
using FileLifecycleTest = ModuleTest;

const std::string kOpenError = "TOLVEX:ambrix:cdflib:fileOpenError()";
const std::string kInvalidChar = "TOLVEX:ambrix:cdflib:invalidCharError()";
const std::string kNotUint64 = validate("argumentNotUint64Scalar", "CDFID");

void writeFile(const char* name, const std::string& content) {
  std::ofstream(name, std::ios::binary) << content;
}

TEST_F(FileLifecycleTest, CreateGivesAUint64ScalarAndAddsTheExtension) {
  const Array file = result("create", {"made"});
  EXPECT_EQ(file.classId(), ClassId::kUint64);
  EXPECT_THAT(file.size(), testing::ElementsAre(1, 1));
  EXPECT_EQ(does("close", {file.clone()}), "done");
  EXPECT_TRUE(fs::exists("made.cdf"));
}

TEST_F(FileLifecycleTest, OpenFindsTheFileWithAndWithoutItsExtension) {
  results("close", {create("made")});
  for (const char* name : {"made", "made.cdf"}) {
    const Given file = open(name);
    EXPECT_EQ(does("close", {file}), "done");
  }
}

TEST_F(FileLifecycleTest, CreateOnAPathThatExistsFailsWithoutTheLibrarysText) {
  results("close", {create("made")});
  EXPECT_EQ(does("create", {"made"}), kCreateError);
  writeFile("other.cdf", "not a CDF");
  EXPECT_EQ(does("create", {"other"}), kCreateError);
}

TEST_F(FileLifecycleTest, CreateRefusesWhatTheLibraryRefuses) {
  EXPECT_EQ(does("create", {""}), kCreateError);
  EXPECT_EQ(does("create", {"no/such/folder/x"}), kCreateError);
  EXPECT_EQ(does("create", {Array::text(u"\u00E9")}), kCreateError);
}

TEST_F(FileLifecycleTest, OpenRefusesWhatIsMissingEmptyOrNoCdf) {
  writeFile("empty.cdf", "");
  writeFile("junk.cdf", "this is no CDF file at all, but long enough to have a header");
  fs::create_directory("folder.cdf");
  for (const char* name : {"missing", "empty", "junk", "folder", ""}) {
    EXPECT_EQ(does("open", {name}), kOpenError) << name;
  }
}

TEST_F(FileLifecycleTest, OpenRefusesATruncatedFile) {
  const Given file = create("made");
  createVar(file, {});
  results("close", {file});
  fs::resize_file("made.cdf", fs::file_size("made.cdf") / 2);
  EXPECT_EQ(does("open", {"made"}), kOpenError);
}

TEST_F(FileLifecycleTest, OpenTakesNamesBeyondAscii) {
  results("close", {create("plain")});
  const std::u16string name = u"caf\u00E9 \u65E5\u672C \U0001F30D.cdf";
  fs::rename("plain.cdf", fs::path(name));
  const Given file = result("open", {Array::text(name)});
  EXPECT_EQ(does("getVarsMaxWrittenRecNum", {file}), "double 1x1 [-1]");
  EXPECT_EQ(does("close", {file}), "done");
}

TEST_F(FileLifecycleTest, ALoneSurrogateHasNoNarrowForm) {
  for (const std::u16string name : {u"a\xD800", u"\xDC00 b", u"\xD800\xD800"}) {
    EXPECT_EQ(does("open", {Array::text(name)}), kInvalidChar);
    EXPECT_EQ(does("create", {Array::text(name)}), kInvalidChar);
  }
}

TEST_F(FileLifecycleTest, ASecondCloseIsRefusedByTheRegistry) {
  const Given file = create();
  EXPECT_EQ(does("close", {file}), "done");
  EXPECT_EQ(does("close", {file}), kInvalidFileId);
  EXPECT_EQ(does("delete", {file}), kInvalidFileId);
  EXPECT_EQ(does("inquire", {file}), kInvalidFileId);
}

TEST_F(FileLifecycleTest, IdentifiersThatWereNotHandedOutAreRefused) {
  const Given file = create();
  for (const std::uint64_t forged : {std::uint64_t{0}, std::uint64_t{1}, ~std::uint64_t{0}}) {
    EXPECT_EQ(does("close", {Array::scalar(forged)}), kInvalidFileId);
    EXPECT_EQ(does("getVarName", {Array::scalar(forged), "x"}), kInvalidFileId);
  }
}

TEST_F(FileLifecycleTest, TheIdentifierMustBeOneUint64) {
  const Given file = create();
  const std::uint64_t id = file.view().data<std::uint64_t>()[0];
  EXPECT_EQ(does("close", {static_cast<double>(id)}), kNotUint64);
  EXPECT_EQ(does("close", {Array::scalar(static_cast<std::int64_t>(id))}), kNotUint64);
  EXPECT_EQ(does("close", {Array::row<std::uint64_t>({id, id})}), kNotUint64);
  EXPECT_EQ(does("close", {Array::zeros(ClassId::kUint64, {0, 0})}), kNotUint64);
  EXPECT_EQ(does("delete", {"7"}), kNotUint64);
  EXPECT_EQ(does("getVarName", {{}, "x"}), kNotUint64);
  EXPECT_EQ(does("close", {file}), "done");
}

TEST_F(FileLifecycleTest, DeleteRemovesTheFileAndItsIdentifier) {
  results("close", {create("made")});
  const Given file = open("made");
  EXPECT_EQ(does("delete", {file}), "done");
  EXPECT_FALSE(fs::exists("made.cdf"));
  EXPECT_EQ(does("delete", {file}), kInvalidFileId);
}

TEST_F(FileLifecycleTest, DeleteRemovesTheFilesOfVariables) {
  const Given file = createMultiFile("multi");
  results("putVarRecordData", {file, createVar(file, {}), 0, row<std::int32_t>({1})});
  results("close", {file});
  ASSERT_TRUE(fs::exists("multi.z0"));
  results("delete", {open("multi")});
  EXPECT_FALSE(fs::exists("multi.z0"));
  EXPECT_FALSE(fs::exists("multi.cdf"));
}

TEST_F(FileLifecycleTest, ARefusedDeleteKeepsTheIdentifier) {
  results("close", {create("made")});
  const Given file = open("made");
  results("setReadOnlyMode", {file, -1});
  EXPECT_EQ(does("delete", {file}), refused("CDFdelete", kReadOnlyMode));
  EXPECT_EQ(does("getReadOnlyMode", {file}), "char 1x10 'READONLYon'");
  EXPECT_EQ(does("close", {file}), "done");
  EXPECT_TRUE(fs::exists("made.cdf"));
}

TEST_F(FileLifecycleTest, ADeleteThatFailsHalfwayLeavesAnIdentifierThatTheLibraryHasFreed) {
  results("close", {create("made")});
  const Given file = open("made");
  createVar(file, {});
  fs::remove("made.cdf");
  EXPECT_EQ(does("delete", {file}), refused("CDFdelete", kCdfDeleteError));
  EXPECT_EQ(does("close", {file}), refused("CDFcloseCDF", kBadCdfId));
}

TEST_F(FileLifecycleTest, ADeleteThatCannotBeginLeavesTheFileToBeClosed) {
  results("close", {create("made")});
  const LeaksIgnored ignored;
  const Given file = open("made");
  fs::remove("made.cdf");
  EXPECT_EQ(does("delete", {file}), refused("CDFdelete", kCdfOpenError));
  EXPECT_EQ(does("close", {file}), "done");
}

TEST_F(FileLifecycleTest, TwoFilesAreOpenAtATime) {
  const Given first = create("first");
  const Given second = create("second");
  createVar(first, {.name = "one"});
  EXPECT_EQ(does("close", {second}), "done");
  EXPECT_EQ(does("getVarName", {first, 0}), "char 1x3 'one'");
}

TEST_F(FileLifecycleTest, AFileOpenedTwiceHasTwoIdentifiers) {
  results("close", {create("made")});
  const Given first = open("made");
  const Given second = open("made");
  EXPECT_NE(shown(first.view()), shown(second.view()));
  EXPECT_EQ(does("close", {first}), "done");
  EXPECT_EQ(does("close", {first}), kInvalidFileId);
  EXPECT_EQ(does("close", {second}), "done");
}

TEST_F(FileLifecycleTest, OpenShowsRVariablesAsZVariables) {
  AMBRIX_NEED_SAMPLE(path, "rvariable.cdf");
  const Given file = open(path);
  EXPECT_EQ(does("inquire", {file}),
            "char 1x16 'NETWORK_ENCODING'; char 1x9 'ROW_MAJOR'; double 1x1 [3]; double 1x1 [1]; "
            "double 1x1 [0]");
  EXPECT_EQ(does("getVarName", {file, 0}), "char 1x11 'legacy_rvar'");
  EXPECT_EQ(does("hyperGetVarData", {file, 0, 0, 4, 1, {}, {}, {}}), "int32 4x1 [0 10 20 30]");
}

}  // namespace
}  // namespace ambrix_test
