// Settings of one file: format, checksum, majority, read-only mode.
#include <fstream>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using FileSettingsTest = ModuleTest;

TEST_F(FileSettingsTest, FormatIsSingleFileUntilItIsChanged) {
  const Given file = create();
  EXPECT_EQ(does("getFormat", {file}), "char 1x11 'SINGLE_FILE'");
  EXPECT_EQ(does("setFormat", {file, 2}), "done");
  EXPECT_EQ(does("getFormat", {file}), "char 1x10 'MULTI_FILE'");
}

TEST_F(FileSettingsTest, FormatIsFixedOnceThereAreVariables) {
  const Given file = create();
  createVar(file, {});
  EXPECT_EQ(does("setFormat", {file, 2}), refused("CDFsetFormat", kCannotChange));
  EXPECT_EQ(does("getFormat", {file}), "char 1x11 'SINGLE_FILE'");
}

TEST_F(FileSettingsTest, NumbersBeyond32BitsAreRefusedByTheLibrary) {
  const Given file = create();
  const double cut = 4294967296.0;
  EXPECT_EQ(does("setFormat", {file, cut + 2}), refused("CDFsetFormat", kBadFormat));
  EXPECT_EQ(does("setMajority", {file, cut + 2}), refused("CDFsetMajority", kBadMajority));
  EXPECT_EQ(does("setChecksum", {file, cut + 1}), refused("CDFsetChecksum", kBadChecksum));
  EXPECT_EQ(does("setReadOnlyMode", {file, cut}), refused("CDFsetReadOnlyMode", kBadReadonlyMode));
  EXPECT_EQ(does("setCacheSize", {file, cut + 9}), refused("CDFsetCacheSize", kBadCacheSize));
  EXPECT_EQ(does("getMajority", {file}), "char 1x9 'ROW_MAJOR'");
  EXPECT_EQ(does("getChecksum", {file}), "char 1x11 'NO_CHECKSUM'");
}

TEST_F(FileSettingsTest, TheLibraryJudgesTheRange) {
  const Given file = create();
  EXPECT_EQ(does("setFormat", {file, 3}), refused("CDFsetFormat", kBadFormat));
  EXPECT_EQ(does("setMajority", {file, 7}), refused("CDFsetMajority", kBadMajority));
  EXPECT_EQ(does("setReadOnlyMode", {file, 1}), refused("CDFsetReadOnlyMode", kBadReadonlyMode));
}

TEST_F(FileSettingsTest, MajorityChangesUntilThereAreData) {
  const Given file = create();
  EXPECT_EQ(does("getMajority", {file}), "char 1x9 'ROW_MAJOR'");
  EXPECT_EQ(does("setMajority", {file, 2}), "done");
  EXPECT_EQ(does("getMajority", {file}), "char 1x12 'COLUMN_MAJOR'");
  results("putVarRecordData", {file, createVar(file, {}), 0, row<std::int32_t>({1})});
  EXPECT_EQ(does("setMajority", {file, 1}), refused("CDFsetMajority", kCannotChange));
}

TEST_F(FileSettingsTest, ChecksumsAreNamed) {
  const Given file = create();
  EXPECT_EQ(does("getChecksum", {file}), "char 1x11 'NO_CHECKSUM'");
  EXPECT_EQ(does("setChecksum", {file, 1}), "done");
  EXPECT_EQ(does("getChecksum", {file}), "char 1x12 'MD5_CHECKSUM'");
  EXPECT_EQ(does("setChecksum", {file, 2}), "done");
  EXPECT_EQ(does("getChecksum", {file}), "char 1x14 'OTHER_CHECKSUM'");
  EXPECT_EQ(does("setChecksum", {file, 0}), "done");
  EXPECT_EQ(does("getChecksum", {file}), "char 1x11 'NO_CHECKSUM'");
}

TEST_F(FileSettingsTest, AChecksumTellsOfDamage) {
  const Given file = create("made");
  results("setChecksum", {file, 1});
  results("putVarRecordData", {file, createVar(file, {}), 0, row<std::int32_t>({77})});
  results("close", {file});
  EXPECT_EQ(does("getChecksum", {open("made")}), "char 1x12 'MD5_CHECKSUM'");
  std::fstream bytes("made.cdf", std::ios::in | std::ios::out | std::ios::binary);
  bytes.seekp(-20, std::ios::end).put('?');
  bytes.close();
  EXPECT_EQ(does("open", {"made"}), "TOLVEX:ambrix:cdflib:fileOpenError()");
}

TEST_F(FileSettingsTest, AFileOpenedCanBeSetReadOnlyAndBack) {
  results("close", {create()});
  const Given file = open("new");
  EXPECT_EQ(does("getReadOnlyMode", {file}), "char 1x11 'READONLYoff'");
  EXPECT_EQ(does("setReadOnlyMode", {file, -1}), "done");
  EXPECT_EQ(does("getReadOnlyMode", {file}), "char 1x10 'READONLYon'");
  EXPECT_EQ(does("createVar", {file, "v", 4, 1, {}, -1, {}}),
            refused("CDFcreatezVar", kReadOnlyMode));
  EXPECT_EQ(does("createAttr", {file, "a", 1}), refused("CDFcreateAttr", kReadOnlyMode));
  EXPECT_EQ(does("setReadOnlyMode", {file, 0}), "done");
  EXPECT_EQ(does("createVar", {file, "v", 4, 1, {}, -1, {}}), "double 1x1 [0]");
}

}  // namespace
}  // namespace ambrix_test
