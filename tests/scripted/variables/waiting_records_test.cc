// Records of compressed sparse variables that wait to be written when others are read.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::Contains;
using testing::HasSubstr;
using testing::Not;

constexpr const char* kWrite =
    "SELECT_ CDF_ 7 | zVAR_ 3 | DELETE_ zVAR_RECORDS_ 2147483646 2147483646";
constexpr const char* kAsk = "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_SPARSERECORDS_";

class WaitingRecordsTest : public ScriptedTest {
 protected:
  void put() {
    describe({.sizes = {2}});
    call("putVarRecordData", {file(), 3, 9, elements<double>(2)});
    fake.forgetCalls();
  }
  void answerCompressedSparse() {
    fake.answer("zVAR_SPARSERECORDS_", {1});
    fake.answer("zVAR_COMPRESSION_", {5, 6, 40});
  }
  const std::vector<std::pair<std::string, Arguments>> readers = {
      {"getVarData", {file(), 3, 4, 0}},
      {"getVarRecordData", {file(), 3, 4}},
      {"hyperGetVarData", {file(), 3, 4, 1, 1, 0, 2, 1}},
      {"hyperPutVarData", {file(), 3, 4, 1, 1, 0, 1, 1, 8}},
  };
};

TEST_F(WaitingRecordsTest, AreWrittenFirst) {
  answerCompressedSparse();
  put();
  for (const auto& [command, arguments] : readers) {
    call(command, arguments);
    EXPECT_THAT(calls(), Contains(kWrite)) << command;
  }
}

TEST_F(WaitingRecordsTest, EachCommandThatWritesRecordsLetsThemWait) {
  const std::pair<std::string, Arguments> writers[] = {
      {"putVarData", {file(), 3, 9, 0, 8}},
      {"putVarRecordData", {file(), 3, 9, elements<double>(2)}},
      {"hyperPutVarData", {file(), 3, 9, 1, 1, 0, 2, 1, elements<double>(2)}},
      {"setVarInitialRecs", {file(), 3, 9}},
  };
  describe({.sizes = {2}});
  answerCompressedSparse();
  for (const auto& [command, arguments] : writers) {
    call("close", {file()});
    call("open", {"any.cdf"});
    call(command, arguments);
    fake.forgetCalls();
    call("getVarData", {file(), 3, 4, 0});
    EXPECT_THAT(calls(), Contains(kWrite)) << command;
  }
}

TEST_F(WaitingRecordsTest, NotForVariablesThatHaveAllRecords) {
  put();
  for (const auto& [command, arguments] : readers) {
    call(command, arguments);
    EXPECT_THAT(fake.calls(), Contains(kAsk)) << command;
    EXPECT_THAT(calls(), Not(Contains(HasSubstr("DELETE_")))) << command;
  }
}

// There the library counts rightly, and writing early would allocate more records than needed.
TEST_F(WaitingRecordsTest, NorForSparseVariablesWithoutCompression) {
  fake.answer("zVAR_SPARSERECORDS_", {1});
  fake.answer("zVAR_COMPRESSION_", {0, 0, 100});
  put();
  for (const auto& [command, arguments] : readers) {
    call(command, arguments);
    EXPECT_THAT(calls(), Not(Contains(HasSubstr("DELETE_")))) << command;
  }
}

TEST_F(WaitingRecordsTest, NorForFilesThatWereOnlyRead) {
  describe({.sizes = {2}});
  answerCompressedSparse();
  for (std::size_t i = 0; i < 3; ++i) {
    call(readers[i].first, readers[i].second);
    EXPECT_THAT(calls(), Not(Contains(kAsk)));
  }
}

TEST_F(WaitingRecordsTest, NorBeforeWholeRecordsAreWritten) {
  answerCompressedSparse();
  put();
  call("hyperPutVarData", {file(), 3, 4, 1, 1, 0, 2, 1, elements<double>(2)});
  EXPECT_THAT(calls(), Not(Contains(kAsk)));
}

// What was put there was refused, so nothing waits.
TEST_F(WaitingRecordsTest, FilesThatAreNotWrittenAreRead) {
  answerCompressedSparse();
  put();
  for (const long refusal : {-2070, -2086}) {  // READ_ONLY_MODE, NO_WRITE_ACCESS
    fake.endWith("DELETE_", refusal);
    call("getVarRecordData", {file(), 3, 4});
    EXPECT_THAT(calls(), Contains(HasSubstr("CDFgetVarRecordData")));
  }
}

TEST_F(WaitingRecordsTest, AFailureIsThatOfTheReader) {
  answerCompressedSparse();
  put();
  fake.endWith("DELETE_", -2013);
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 4, 0}), libraryFailure("CDFgetzVarData", -2013));
}

}  // namespace
}  // namespace ambrix_test
