// Writing and reading the last record that 32 bits can number.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

constexpr double kLast = 2147483647;

class LastRecordTest : public ScriptedTest {
 protected:
  std::string valueAt(double record) { return errorOf("putVarData", {file(), 3, record, {}, 1}); }
  std::string recordAt(double record) {
    return errorOf("putVarRecordData", {file(), 3, record, 1});
  }
  std::string slabAt(double record, double count, double interval) {
    return errorOf(
        "hyperPutVarData",
        {file(), 3, record, count, interval, {}, {}, {}, Array::zeros(ClassId::kDouble, {2, 1})});
  }
  std::string readValueAt(double record) { return errorOf("getVarData", {file(), 3, record}); }
  std::string readRecordAt(double record) {
    return errorOf("getVarRecordData", {file(), 3, record});
  }
  std::string readSlabAt(double record, double count, double interval) {
    return errorOf("hyperGetVarData", {file(), 3, record, count, interval, {}, {}, {}});
  }
};

TEST_F(LastRecordTest, ItsCountWouldWrapAroundSoItIsRefused) {
  describe({});
  EXPECT_EQ(valueAt(kLast), libraryFailure("CDFputzVarData", -2009));
  EXPECT_EQ(recordAt(kLast), libraryFailure("CDFputzVarRecordData", -2009));
  EXPECT_EQ(slabAt(kLast - 1, 2, 1), libraryFailure("CDFhyperPutzVarData", -2009));
  EXPECT_EQ(slabAt(1, 2, kLast - 1), libraryFailure("CDFhyperPutzVarData", -2009));
  for (const std::string& call : calls())
    EXPECT_THAT(call, testing::Not(testing::HasSubstr("PUT_")));
}

TEST_F(LastRecordTest, NorIsItRead) {
  describe({});
  EXPECT_EQ(readValueAt(kLast), libraryFailure("CDFgetzVarData", -2009));
  EXPECT_EQ(readRecordAt(kLast), libraryFailure("CDFgetzVarRecordData", -2009));
  EXPECT_EQ(readSlabAt(kLast - 1, 2, 1), libraryFailure("CDFhyperGetzVarData", -2009));
  EXPECT_EQ(readSlabAt(1, 2, kLast - 1), libraryFailure("CDFhyperGetzVarData", -2009));
  for (const std::string& call : calls()) {
    EXPECT_THAT(call, testing::Not(testing::HasSubstr("zVAR_RECNUMBER_")));
    EXPECT_THAT(call, testing::Not(testing::HasSubstr("CDFgetVarRecordData")));
  }
}

TEST_F(LastRecordTest, TheOneBeforeReachesTheLibrary) {
  describe({});
  EXPECT_EQ(valueAt(kLast - 1), "no error");
  EXPECT_EQ(recordAt(kLast - 1), "no error");
  EXPECT_EQ(slabAt(kLast - 2, 2, 1), "no error");
  EXPECT_EQ(readValueAt(kLast - 1), "no error");
  EXPECT_EQ(readRecordAt(kLast - 1), "no error");
  EXPECT_EQ(readSlabAt(kLast - 2, 2, 1), "no error");
}

TEST_F(LastRecordTest, WithoutRecordVarianceAnyNumberMeansTheOnlyRecord) {
  describe({.recordVariance = 0});
  EXPECT_EQ(valueAt(kLast), "no error");
  EXPECT_EQ(recordAt(kLast), "no error");
  EXPECT_EQ(slabAt(kLast - 1, 2, 1), "no error");
  EXPECT_EQ(readValueAt(kLast), "no error");
  EXPECT_EQ(readRecordAt(kLast), "no error");
  EXPECT_EQ(readSlabAt(kLast - 1, 2, 1), "no error");
}

}  // namespace
}  // namespace ambrix_test
