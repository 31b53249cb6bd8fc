// Setting the compression of a file and of a variable: only the file's gzip level is checked.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using SetCompressionTest = ScriptedTest;

TEST_F(SetCompressionTest, AFileTakesTypeAndParameter) {
  const std::pair<Arguments, const char*> settings[] = {
      {{file(), 0}, "0 [0]"},    {{file(), 1}, "1 [0]"},    {{file(), 2}, "2 [0]"},
      {{file(), 3}, "3 [0]"},    {{file(), 0, 4}, "0 [4]"}, {{file(), 1, 7}, "1 [7]"},
      {{file(), 5, 1}, "5 [1]"}, {{file(), 5, 9}, "5 [9]"}, {{file(), 2, -1}, "2 [-1]"}};
  for (const auto& [arguments, text] : settings) {
    EXPECT_THAT(call("setCompression", arguments), IsEmpty());
    EXPECT_THAT(calls(),
                ElementsAre(std::string("SELECT_ CDF_ 7 | PUT_ CDF_COMPRESSION_ ") + text));
  }
}

TEST_F(SetCompressionTest, AFilesGzipLevelIsOneToNine) {
  for (const long level : {0L, 10L, -1L, 4294967297L}) {
    EXPECT_EQ(errorOf("setCompression", {file(), 5, static_cast<double>(level)}),
              cdflib("invalidCompressionParameter", level, "GZIP"));
  }
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(SetCompressionTest, GzipNeedsALevel) {
  EXPECT_EQ(errorOf("setCompression", {file(), 5}), cdflib("unspecifiedGzipCompressionLevel"));
  EXPECT_EQ(errorOf("setVarCompression", {file(), 3, 5}),
            cdflib("unspecifiedGzipCompressionLevel"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(SetCompressionTest, TheTypeIsCheckedBeforeTheParameterIsRead) {
  for (const long type : {4L, 6L, -1L}) {
    const auto number = static_cast<double>(type);
    EXPECT_EQ(errorOf("setCompression", {file(), number, "x"}), unrecognized(type, "COMPRESSION"));
    EXPECT_EQ(errorOf("setVarCompression", {file(), 3, number, "x"}),
              unrecognized(type, "COMPRESSION"));
  }
}

TEST_F(SetCompressionTest, AVariableTakesTypeAndParameter) {
  const std::pair<Arguments, const char*> settings[] = {
      {{file(), 3, 0}, "0 [0]"}, {{file(), 3, 1}, "1 [0]"},    {{file(), 3, 2}, "2 [0]"},
      {{file(), 3, 3}, "3 [0]"}, {{file(), 3, 1, 7}, "1 [7]"}, {{file(), 3, 5, 9}, "5 [9]"}};
  for (const auto& [arguments, text] : settings) {
    EXPECT_THAT(call("setVarCompression", arguments), IsEmpty());
    EXPECT_THAT(
        calls(),
        ElementsAre(std::string("SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_COMPRESSION_ ") + text));
  }
}

TEST_F(SetCompressionTest, AVariablesGzipLevelGoesToTheLibraryUnchecked) {
  for (const int level : {0, 10, 12}) {
    call("setVarCompression", {file(), 3, 5, level});
    EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_COMPRESSION_ 5 [" +
                                     std::to_string(level) + ']'));
  }
}

}  // namespace
}  // namespace ambrix_test
