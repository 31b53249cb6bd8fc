// Storage settings and record counts of variables.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class VariableSettingsTest : public ScriptedTest {
 protected:
  VariableSettingsTest() { describe(Variable{}); }
};

struct Getter {
  const char* command;
  const char* item;
  const char* call;
};

TEST_F(VariableSettingsTest, GettersReturnDoublesNegativeOnesIncluded) {
  const Getter getters[] = {
      {"getVarAllocRecords", "zVAR_NUMallocRECS_", "GET_ zVAR_NUMallocRECS_"},
      {"getVarBlockingFactor", "zVAR_BLOCKINGFACTOR_", "GET_ zVAR_BLOCKINGFACTOR_"},
      {"getVarMaxAllocRecNum", "zVAR_MAXallocREC_", "GET_ zVAR_MAXallocREC_"},
      {"getVarMaxWrittenRecNum", "zVAR_MAXREC_", "GET_ zVAR_MAXREC_"},
      {"getVarNumRecsWritten", "zVAR_NUMRECS_", "GET_ zVAR_NUMRECS_"},
      {"getVarReservePercent", "zVAR_RESERVEPERCENT_", "CONFIRM_ zVAR_RESERVEPERCENT_"}};
  for (const Getter& getter : getters) {
    fake.answer(getter.item, {-1});
    EXPECT_EQ(shown(result(getter.command, {file(), 3})), "double 1x1 [-1]");
    EXPECT_EQ(calls().back(), kOnVariable + getter.call);
  }
}

TEST_F(VariableSettingsTest, GetVarsMaxWrittenRecNumTakesTheFileOnly) {
  fake.answer("zVARs_MAXREC_", {41});
  EXPECT_EQ(shown(result("getVarsMaxWrittenRecNum", {file()})), "double 1x1 [41]");
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | GET_ zVARs_MAXREC_"));
}

TEST_F(VariableSettingsTest, SparseRecordsComeAsTheirNames) {
  const std::pair<long, const char*> modes[] = {
      {0, "NO_SPARSERECORDS"}, {1, "PAD_SPARSERECORDS"}, {2, "PREV_SPARSERECORDS"}};
  for (const auto& [mode, name] : modes) {
    fake.answer("zVAR_SPARSERECORDS_", {mode});
    EXPECT_EQ(result("getVarSparseRecords", {file(), 3}).utf8(), name);
    EXPECT_THAT(calls(), ElementsAre(kOnVariable + "GET_ zVAR_SPARSERECORDS_"));
  }
  fake.answer("zVAR_SPARSERECORDS_", {3});
  EXPECT_EQ(errorOf("getVarSparseRecords", {file(), 3}), unrecognized(3, "SPARSE RECORDS TYPE"));
}

struct Setter {
  const char* command;
  const char* call;
};

TEST_F(VariableSettingsTest, SettersHandTheNumberOverUnchecked) {
  const Setter setters[] = {{"setVarBlockingFactor", "PUT_ zVAR_BLOCKINGFACTOR_ "},
                            {"setVarInitialRecs", "PUT_ zVAR_INITIALRECS_ "},
                            {"setVarReservePercent", "zVAR_RESERVEPERCENT_ "},
                            {"setVarSparseRecords", "PUT_ zVAR_SPARSERECORDS_ "}};
  for (const Setter& setter : setters) {
    for (const int value : {0, 7, -1}) {
      EXPECT_THAT(call(setter.command, {file(), 3, value}), IsEmpty());
      EXPECT_EQ(calls().back(), kOnVariable + setter.call + std::to_string(value));
    }
  }
}

TEST_F(VariableSettingsTest, ARangeOfRecordsIsAllocatedAsGiven) {
  EXPECT_THAT(call("setVarAllocBlockRecords", {file(), 3, 10, 4}), IsEmpty());
  EXPECT_EQ(calls().back(), kOnVariable + "PUT_ zVAR_ALLOCATEBLOCK_ 10 4");
}

TEST_F(VariableSettingsTest, CacheSizesBelongToMultiFileCdfs) {
  fake.answer("CDF_FORMAT_", {2});
  fake.answer("zVAR_CACHESIZE_", {9});
  EXPECT_EQ(shown(result("getVarCacheSize", {file(), 3})), "double 1x1 [9]");
  EXPECT_EQ(fake.calls().front(), "SELECT_ CDF_ 7 | GET_ CDF_FORMAT_");
  EXPECT_EQ(calls().back(), kOnVariable + "CONFIRM_ zVAR_CACHESIZE_");
  EXPECT_THAT(call("setVarCacheSize", {file(), 3, 5}), IsEmpty());
  EXPECT_EQ(calls().back(), kOnVariable + "zVAR_CACHESIZE_ 5");
}

TEST_F(VariableSettingsTest, TheyAreInappropriateForASingleFile) {
  fake.answer("CDF_FORMAT_", {1});
  EXPECT_EQ(errorOf("getVarCacheSize", {file(), 3}), cdflib("varCacheSizeOpInappropriate"));
  EXPECT_EQ(errorOf("setVarCacheSize", {file(), 3, 5}), cdflib("varCacheSizeOpInappropriate"));
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | GET_ CDF_FORMAT_",
                                   "SELECT_ CDF_ 7 | GET_ CDF_FORMAT_"));
}

TEST_F(VariableSettingsTest, TheBuffersAreConvertedBeforeTheFormatIsRead) {
  fake.answer("CDF_FORMAT_", {1});
  EXPECT_EQ(errorOf("setVarCacheSize", {file(), 3, {1, 2}}), notScalar("NUMBUFFERS"));
  EXPECT_THAT(calls(), IsEmpty());
}

/// The commands that make the library divide by the bytes of a record, by their routines.
class DividingCommandsTest : public VariableSettingsTest {
 protected:
  const std::pair<const char*, Arguments> commands[7] = {
      {"CDFgetzVarReservePercent", {file(), 3}},
      {"CDFsetzVarBlockingFactor", {file(), 3, 1}},
      {"CDFsetzVarInitialRecs", {file(), 3, 1}},
      {"CDFsetzVarReservePercent", {file(), 3, 1}},
      {"CDFdeletezVarRecords", {file(), 3, 0, 1}},
      {"CDFsetzVarAllocBlockRecords", {file(), 3, 0, 1}},
      {"CDFsetzVarPadValue", {file(), 3, row<std::int32_t>({1})}}};

  static std::string commandOf(const char* routine) {
    std::string command = routine + 3;
    return command.erase(command.find('z'), 1);
  }
};

TEST_F(DividingCommandsTest, RecordsOfNoBytesInThirtyTwoBitsAreRefused) {
  describe({.datatype = 4, .sizes = {65536, 16384}});
  fake.answer("CDF_FORMAT_", {1});
  for (const auto& [routine, arguments] : commands) {
    EXPECT_EQ(errorOf(commandOf(routine), arguments), libraryFailure(routine, -2004));
    EXPECT_THAT(calls(), ElementsAre(kInquiry, kOnVariable + "GET_ CDF_FORMAT_")) << routine;
  }
}

TEST_F(DividingCommandsTest, OfAMultiFileTheyGoThrough) {
  describe({.datatype = 4, .sizes = {65536, 16384}});
  fake.answer("CDF_FORMAT_", {2});
  for (const auto& [routine, arguments] : commands) {
    EXPECT_EQ(errorOf(commandOf(routine), arguments), "no error");
  }
}

TEST_F(DividingCommandsTest, SoDoLargeRecordsOfAnyOtherSize) {
  describe({.datatype = 4, .sizes = {65536, 16385}});
  fake.answer("CDF_FORMAT_", {1});
  for (const auto& [routine, arguments] : commands) {
    EXPECT_EQ(errorOf(commandOf(routine), arguments), "no error");
  }
}

}  // namespace
}  // namespace ambrix_test
