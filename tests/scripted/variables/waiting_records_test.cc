// Records of compressed sparse variables that wait to be written when others are read.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

constexpr long kVirtualRecord = 1001;
constexpr long kReadError = -2013;
constexpr const char* kWrite =
    "SELECT_ CDF_ 7 | zVAR_ 3 | DELETE_ zVAR_RECORDS_ 2147483646 2147483646";
constexpr const char* kAskSparseness = "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_SPARSERECORDS_";
constexpr const char* kAskCompression = "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_COMPRESSION_";
constexpr const char* kAskLast = "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_MAXREC_";

/// Variable 3 has two doubles in each record; records up to 60 were written or wait.
class WaitingRecordsTest : public ScriptedTest {
 protected:
  WaitingRecordsTest() {
    fake.answer("zVAR_SPARSERECORDS_", {1});
    fake.answer("zVAR_COMPRESSION_", {5, 6, 40});
    fake.answer("zVAR_MAXREC_", {60});
  }
  void put() {
    describe({.sizes = {2}});
    call("putVarRecordData", {file(), 3, 9, elements<double>(2)});
    fake.forgetCalls();
  }
  /// One value of a record of several is missing.
  void answerMissing(long record) {
    fake.endWith(
        "zVAR_RECNUMBER_ " + std::to_string(record) + " | zVAR_DIMINDICES_ [0] | GET_ zVAR_DATA_",
        kVirtualRecord);
  }
  const std::pair<std::string, Arguments> writers[4] = {
      {"putVarData", {file(), 3, 9, 0, 1}},
      {"putVarRecordData", {file(), 3, 9, elements<double>(2)}},
      {"hyperPutVarData", {file(), 3, 9, 1, 1, 0, 2, 1, elements<double>(2)}},
      {"setVarInitialRecs", {file(), 3, 9}}};
  const std::pair<std::string, Arguments> record{"getVarRecordData", {file(), 3, 4}};
  const std::pair<std::string, Arguments> wholeSlab{"hyperGetVarData",
                                                    {file(), 3, 4, 1, 1, 0, 2, 1}};
  const std::pair<std::string, Arguments> value{"getVarData", {file(), 3, 4, 0}};
  const std::pair<std::string, Arguments> part{"hyperGetVarData", {file(), 3, 4, 1, 1, 0, 1, 1}};
  const std::pair<std::string, Arguments> partPut{"hyperPutVarData",
                                                  {file(), 3, 4, 1, 1, 0, 1, 1, 8}};
};

// 57 records of 16 bytes: the library may fill in all of them up to record 60.
TEST_F(WaitingRecordsTest, WholeRecordsAreReadWithRoomForAllUpToThem) {
  put();
  fake.answerData(std::vector<double>(56 * 2, 7));
  for (const auto& [command, arguments] : {record, wholeSlab}) {
    EXPECT_THAT(shown(result(command, arguments)), HasSubstr("[7 7]")) << command;
    EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority, kAskSparseness, kAskCompression, kAskLast,
                                     Not(HasSubstr("DELETE_"))));
  }
}

// The library reads them one by one, each with all that it fills in.
TEST_F(WaitingRecordsTest, RecordsApartNeedRoomAlsoIfTheLastOneIsThere) {
  put();
  fake.answerData(std::vector<double>(56 * 2, 7));
  result("hyperGetVarData", {file(), 3, 4, 2, 56, 0, 2, 1});
  EXPECT_THAT(calls(), Not(Contains(kWrite)));
}

TEST_F(WaitingRecordsTest, ForManyApartTheyAreWritten) {
  put();
  fake.answer("zVAR_MAXREC_", {10000});
  result("hyperGetVarData", {file(), 3, 0, 2, 2, 0, 2, 1});
  EXPECT_THAT(calls(), Not(Contains(kWrite)));
  result("hyperGetVarData", {file(), 3, 0, 100, 2, 0, 2, 1});
  EXPECT_THAT(calls(), Contains(kWrite));
}

TEST_F(WaitingRecordsTest, TheLastOnesNeedNoRoom) {
  put();
  result("getVarRecordData", {file(), 3, 60});
  result("hyperGetVarData", {file(), 3, 59, 2, 1, 0, 2, 1});
  EXPECT_THAT(calls(), Not(Contains(HasSubstr("DELETE_"))));
}

TEST_F(WaitingRecordsTest, WhenThereAreTooManyToMakeRoomForTheyAreWritten) {
  put();
  fake.answer("zVAR_MAXREC_", {2000000});
  for (const auto& [command, arguments] : {record, wholeSlab}) {
    result(command, arguments);
    EXPECT_THAT(calls(), Contains(kWrite)) << command;
  }
}

TEST_F(WaitingRecordsTest, TheyAreWrittenBeforePartsOfMissingRecordsAreReadOrWritten) {
  put();
  answerMissing(4);
  answerMissing(5);
  for (const auto& [command, arguments] : {part, partPut}) {
    call(command, arguments);
    EXPECT_THAT(calls(), Contains(kWrite)) << command;
  }
}

// Trying one is reading it.
TEST_F(WaitingRecordsTest, AreWrittenUntriedWhereAValueIsAWholeRecord) {
  put();
  describe({.sizes = {2}, .variances = {0}});
  call("hyperGetVarData", {file(), 3, 4, 1, 1, 0, 2, 1});
  const auto made = calls();
  EXPECT_THAT(made, Contains(kWrite));
  EXPECT_THAT(made, Not(Contains(HasSubstr("zVAR_DATA_"))));
}

TEST_F(WaitingRecordsTest, NotBeforePartsOfOthers) {
  put();
  answerMissing(4);  // and 5 is there: the library fills in no more than 4
  for (const auto& [command, arguments] : {part, partPut}) {
    call(command, arguments);
    EXPECT_THAT(calls(), Not(Contains(kWrite))) << command;
  }
}

TEST_F(WaitingRecordsTest, OneValueOfSeveralIsReadAsItIs) {
  put();
  call(value.first, value.second);
  EXPECT_THAT(calls(), Not(Contains(kAskSparseness)));
}

TEST_F(WaitingRecordsTest, VariablesThatHaveAllRecordsAreReadAsTheyAre) {
  fake.answer("zVAR_SPARSERECORDS_", {0});
  put();
  for (const auto& [command, arguments] : {record, wholeSlab, part, partPut}) {
    call(command, arguments);
    EXPECT_THAT(calls(), Not(Contains(kAskLast))) << command;
  }
}

// There the library counts rightly.
TEST_F(WaitingRecordsTest, SoAreSparseVariablesWithoutCompression) {
  fake.answer("zVAR_COMPRESSION_", {0, 0, 100});
  put();
  for (const auto& [command, arguments] : {record, wholeSlab, part, partPut}) {
    call(command, arguments);
    EXPECT_THAT(calls(), Not(Contains(kAskLast))) << command;
  }
}

TEST_F(WaitingRecordsTest, NothingIsAskedOfFilesThatWereOnlyRead) {
  describe({.sizes = {2}});
  for (const auto& [command, arguments] : {record, wholeSlab, value, part}) {
    call(command, arguments);
    EXPECT_THAT(calls(), Not(Contains(kAskSparseness))) << command;
  }
}

TEST_F(WaitingRecordsTest, WhatTheLibraryRefusedDoesNotCountAsWritten) {
  describe({.sizes = {2}});
  fake.endWith("PUT_", -2070);
  fake.endWith("CDFputVarRecordData", -2070);
  for (const auto& [command, arguments] : writers)
    EXPECT_THAT(errorOf(command, arguments), HasSubstr("-2070")) << command;
  fake.forgetCalls();
  call(record.first, record.second);
  EXPECT_THAT(calls(), Not(Contains(kAskSparseness)));
}

TEST_F(WaitingRecordsTest, WhatItAcceptedDoes) {
  for (const auto& [command, arguments] : writers) {
    call("open", {"any.cdf"});  // registers the same file anew
    describe({.sizes = {2}});
    call(command, arguments);
    fake.forgetCalls();
    call(record.first, record.second);
    EXPECT_THAT(calls(), Contains(kAskSparseness)) << command;
  }
}

TEST_F(WaitingRecordsTest, SoDoesWhatItDidWithAWarning) {
  constexpr long kNegativeZero = -1004;
  for (const auto& [command, arguments] : writers) {
    call("open", {"any.cdf"});
    describe({.sizes = {2}});
    fake.endWith("PUT_", kNegativeZero);
    fake.endWith("CDFputVarRecordData", kNegativeZero);
    EXPECT_THAT(errorOf(command, arguments), HasSubstr("-1004"));
    fake.forgetCalls();
    call(record.first, record.second);
    EXPECT_THAT(calls(), Contains(kAskSparseness)) << command;
  }
}

TEST_F(WaitingRecordsTest, SettingsThatWriteNoRecordsDoNot) {
  describe({.sizes = {2}});
  call("setVarReservePercent", {file(), 3, 10});
  call("setVarBlockingFactor", {file(), 3, 10});
  fake.forgetCalls();
  call(record.first, record.second);
  EXPECT_THAT(calls(), Not(Contains(kAskSparseness)));
}

TEST_F(WaitingRecordsTest, WithoutAnAnswerTheLibraryReads) {
  for (const char* const question : {kAskSparseness, kAskCompression, kAskLast}) {
    put();
    fake.endWith(question, kReadError);
    call(record.first, record.second);
    EXPECT_THAT(calls().back(), HasSubstr("CDFgetVarRecordData")) << question;
    fake.endWith(question, 0);
  }
}

TEST_F(WaitingRecordsTest, NothingIsAskedOrWrittenForHyperslabsThatTheLibraryRefuses) {
  put();
  fake.moveExactly(0);
  fake.answer("zVAR_MAXREC_", {2000000});
  for (const Arguments& refused : std::vector<Arguments>{{file(), 3, -1, 1, 1, 0, 2, 1},
                                                         {file(), 3, 4, 0, 1, 0, 2, 1},
                                                         {file(), 3, 4, 2, 0, 0, 2, 1}}) {
    call("hyperGetVarData", refused);
    EXPECT_THAT(calls(), Not(Contains(testing::AnyOf(kAskLast, HasSubstr("DELETE_")))));
  }
}

TEST_F(WaitingRecordsTest, AFailureToWriteThemIsThatOfTheReader) {
  put();
  fake.answer("zVAR_MAXREC_", {2000000});
  fake.endWith("DELETE_", kReadError);
  EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, 4}),
            libraryFailure("CDFgetzVarRecordData", kReadError));
}

}  // namespace
}  // namespace ambrix_test
