// Settings of a file: the call of each command, its answer and its failures.
#include "gateway/library_faults.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using FileSettingsTest = ScriptedTest;

struct NamedSetting {
  const char* command;
  const char* item;
  const char* call;
  const char* kind;
  std::vector<std::pair<long, const char*>> names;
};

const NamedSetting kNamedSettings[] = {
    {"getFormat",
     "CDF_FORMAT_",
     "GET_ CDF_FORMAT_",
     "FORMAT",
     {{1, "SINGLE_FILE"}, {2, "MULTI_FILE"}}},
    {"getChecksum",
     "CDF_CHECKSUM_",
     "GET_ CDF_CHECKSUM_",
     "CHECKSUM",
     {{0, "NO_CHECKSUM"}, {1, "MD5_CHECKSUM"}, {2, "OTHER_CHECKSUM"}}},
    {"getMajority",
     "CDF_MAJORITY_",
     "GET_ CDF_MAJORITY_",
     "MAJORITY",
     {{1, "ROW_MAJOR"}, {2, "COLUMN_MAJOR"}}},
    {"getReadOnlyMode",
     "CDF_READONLY_MODE_",
     "CONFIRM_ CDF_READONLY_MODE_",
     "READONLY MODE",
     {{-1, "READONLYon"}, {0, "READONLYoff"}}},
};

TEST_F(FileSettingsTest, NamedSettingsComeAsTheirNames) {
  for (const NamedSetting& setting : kNamedSettings) {
    for (const auto& [value, name] : setting.names) {
      fake.answer(setting.item, {value});
      EXPECT_EQ(result(setting.command, {file()}).utf8(), name);
      EXPECT_THAT(calls(), ElementsAre(std::string("SELECT_ CDF_ 7 | ") + setting.call));
    }
  }
}

TEST_F(FileSettingsTest, ValuesWithoutANameAreUnrecognized) {
  for (const NamedSetting& setting : kNamedSettings) {
    for (const long value : {3L, -2L, 4294967297L}) {
      fake.answer(setting.item, {value});
      EXPECT_EQ(errorOf(setting.command, {file()}), unrecognized(value, setting.kind));
    }
  }
}

struct CacheSize {
  const char* command;
  const char* item;
};

TEST_F(FileSettingsTest, CacheSizesAreConfirmedAndComeAsDoubles) {
  const CacheSize sizes[] = {{"getCacheSize", "CDF_CACHESIZE_"},
                             {"getStageCacheSize", "STAGE_CACHESIZE_"},
                             {"getCompressionCacheSize", "COMPRESS_CACHESIZE_"}};
  for (const auto& [command, item] : sizes) {
    fake.answer(item, {125});
    EXPECT_EQ(shown(result(command, {file()})), "double 1x1 [125]");
    EXPECT_THAT(calls(), ElementsAre(std::string("SELECT_ CDF_ 7 | CONFIRM_ ") + item));
  }
}

struct Setter {
  const char* command;
  const char* call;
};

// Settings that the file stores are put; read-only mode and cache sizes are selections.
const Setter kSetters[] = {
    {"setFormat", " | PUT_ CDF_FORMAT_ "},
    {"setChecksum", " | PUT_ CDF_CHECKSUM_ "},
    {"setMajority", " | PUT_ CDF_MAJORITY_ "},
    {"setReadOnlyMode", " | CDF_READONLY_MODE_ "},
    {"setCacheSize", " | CDF_CACHESIZE_ "},
    {"setVarsCacheSize", " | zVARs_CACHESIZE_ "},
    {"setStageCacheSize", " | STAGE_CACHESIZE_ "},
    {"setCompressionCacheSize", " | COMPRESS_CACHESIZE_ "},
};

TEST_F(FileSettingsTest, SettersHandTheNumberOverAndReturnNothing) {
  for (const Setter& setter : kSetters) {
    for (const double value : {2.0, 0.0, -1.0, 7.9}) {
      EXPECT_THAT(call(setter.command, {file(), value}), testing::IsEmpty());
      const std::string number = std::to_string(static_cast<long>(value));
      const std::string expected = "SELECT_ CDF_ 7" + (setter.call + number);
      EXPECT_THAT(calls(), ElementsAre(expected));
    }
  }
}

TEST_F(FileSettingsTest, InReadOnlyModeAnAttributeIsSelectedIfThereIsOneAndTheLibraryIsFaulty) {
  TOLVEX::ambrix::libraryFaults().freesSelectedAttributeTwice = true;
  const char* const select = "SELECT_ CDF_ 7 | ATTR_ 0";
  for (const long status : {0L, -2039L}) {
    fake.endWith(select, status);
    EXPECT_THAT(call("setReadOnlyMode", {file(), -1}), testing::IsEmpty());
    EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CDF_READONLY_MODE_ -1", select));
  }
  call("setReadOnlyMode", {file(), 0});
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CDF_READONLY_MODE_ 0"));
  fake.endWith("CDF_READONLY_MODE_ -1", -2073);
  EXPECT_EQ(errorOf("setReadOnlyMode", {file(), -1}), libraryFailure("CDFsetReadOnlyMode", -2073));
}

TEST_F(FileSettingsTest, SetFormatLabelsItsArgumentNumbuffers) {
  EXPECT_EQ(errorOf("setFormat", {file(), "MULTI_FILE"}), notScalar("NUMBUFFERS"));
}

TEST_F(FileSettingsTest, TheLibraryJudgesTheRange) {
  fake.endWith("CDF_MAJORITY_ 7", -2013);
  EXPECT_EQ(errorOf("setMajority", {file(), 7}), libraryFailure("CDFsetMajority", -2013));
}

}  // namespace
}  // namespace ambrix_test
