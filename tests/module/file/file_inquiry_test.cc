// What a file is made of, and which versions and copyrights it and the library carry.
#include <filesystem>
#include <fstream>

#include "tests/module/support/leak_check.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using FileInquiryTest = ModuleTest;

/// The encoding is a big-endian word at a fixed place in the header of every version 3 file.
void patchEncoding(const char* name, char encoding) {
  std::fstream file(name, std::ios::in | std::ios::out | std::ios::binary);
  const char word[] = {0, 0, 0, encoding};
  file.seekp(36).write(word, sizeof word);
}

TEST_F(FileInquiryTest, ANewFileHasNoVariablesAndNoAttributes) {
  const std::vector<Array> facts = results("inquire", {create()});
  ASSERT_EQ(facts.size(), 5U);
  EXPECT_EQ(shown(facts[1]), "char 1x9 'ROW_MAJOR'");
  EXPECT_EQ(shown(facts[2]), "double 1x1 [-1]");
  EXPECT_EQ(shown(facts[3]), "double 1x1 [0]");
  EXPECT_EQ(shown(facts[4]), "double 1x1 [0]");
}

TEST_F(FileInquiryTest, VariablesRecordsAndAttributesAreCounted) {
  const Given file = createColumnMajor();
  const double variable = createVar(file, {});
  createVar(file, {.name = "w"});
  results("createAttr", {file, "global", 1});
  results("createAttr", {file, "variable", 2});
  results("createAttr", {file, "other", 2});
  results("putVarRecordData", {file, variable, 6, row<std::int32_t>({1})});
  const std::vector<Array> facts = results("inquire", {file});
  EXPECT_EQ(shown(facts[1]), "char 1x12 'COLUMN_MAJOR'");
  EXPECT_EQ(shown(facts[2]), "double 1x1 [6]");
  EXPECT_EQ(shown(facts[3]), "double 1x1 [2]");
  EXPECT_EQ(shown(facts[4]), "double 1x1 [3]");
}

TEST_F(FileInquiryTest, FilesOfOthersShowTheirEncodingAndMajority) {
  EXPECT_EQ(does("inquire", {open(distributionSample("example1.cdf"))}),
            "char 1x12 'MAC_ENCODING'; char 1x9 'ROW_MAJOR'; double 1x1 [2]; double 1x1 [3]; "
            "double 1x1 [3]");
  EXPECT_EQ(does("inquire", {open(distributionSample("cacsst2.cdf"))}),
            "char 1x16 'NETWORK_ENCODING'; char 1x12 'COLUMN_MAJOR'; double 1x1 [0]; "
            "double 1x1 [4]; double 1x1 [9]");
  EXPECT_EQ(does("inquire", {open(distributionSample("geocpi2.cdf"))}).substr(0, 25),
            "char 1x14 'IBMPC_ENCODING");
}

TEST_F(FileInquiryTest, EveryEncodingHasItsName) {
  const std::pair<const char*, const char*> encodings[] = {{"alphaosf1", "ALPHAOSF1"},
                                                           {"alphavmsd", "ALPHAMVSD"},
                                                           {"alphavmsg", "ALPHAMVSG"},
                                                           {"alphavmsi", "ALPHAMVSI"},
                                                           {"decstation", "DECSTATION"},
                                                           {"hp", "HP"},
                                                           {"ibmrs", "IBMRS"},
                                                           {"next", "NEXT"},
                                                           {"sgi", "SGI"},
                                                           {"sun", "SUN"},
                                                           {"vax", "VAX"}};
  AMBRIX_NEED_SAMPLE(folder, "encodings");
  for (const auto& [name, encoding] : encodings) {
    const Given file = open(folder + "/alltypes_" + name + ".cdf");
    EXPECT_EQ(result("inquire", {file}).utf8(), std::string(encoding) + "_ENCODING");
  }
}

TEST_F(FileInquiryTest, EncodingsWithoutANameAreUnrecognized) {
  results("close", {create("made")});
  results("setValidate", {0});
  for (const int encoding : {17, 18}) {
    patchEncoding("made.cdf", static_cast<char>(encoding));
    const Given file = open("made");
    EXPECT_EQ(does("inquire", {file}), unrecognized(encoding, "ENCODING"));
    EXPECT_EQ(does("close", {file}), "done");
  }
}

TEST_F(FileInquiryTest, TheVersionIsTheWritersWhileTheLibrarysIsTheRunning) {
  const LeaksIgnored ignored;  // files of versions 2 and 3 side by side
  const std::string library = does("getLibraryVersion");
  EXPECT_THAT(library, testing::AnyOf("double 1x1 [3]; double 1x1 [9]; double 1x1 [1]",
                                      "double 1x1 [3]; double 1x1 [6]; double 1x1 [3]"));
  EXPECT_EQ(does("getVersion", {create()}), library);
  EXPECT_EQ(does("getVersion", {open(distributionSample("example1.cdf"))}),
            "double 1x1 [3]; double 1x1 [2]; double 1x1 [1]");
  EXPECT_EQ(does("getVersion", {open(distributionSample("d103a2x.cdf"))}),
            "double 1x1 [2]; double 1x1 [7]; double 1x1 [2]");
}

TEST_F(FileInquiryTest, TheNameIsTheOneGivenWithoutItsExtension) {
  std::filesystem::create_directory("sub");
  const Given file = create("sub/made");
  EXPECT_EQ(does("getName", {file}), "char 1x8 'sub/made'");
  results("close", {file});
  EXPECT_EQ(does("getName", {open("sub/made.cdf")}), "char 1x8 'sub/made'");
}

TEST_F(FileInquiryTest, CopyrightsKeepTheirLineBreaks) {
  const std::string ofFile = result("getCopyright", {create()}).utf8();
  const std::string ofLibrary = result("getLibraryCopyright").utf8();
  for (const std::string& text : {ofFile, ofLibrary}) {
    EXPECT_THAT(text, testing::HasSubstr("Common Data Format (CDF)"));
    EXPECT_THAT(text, testing::HasSubstr("\n"));
    EXPECT_LE(text.size(), 256U);
  }
}

}  // namespace
}  // namespace ambrix_test
