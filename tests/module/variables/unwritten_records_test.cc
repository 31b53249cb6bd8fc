// Records that do not vary and were never written, in files of the format of version 2.7: CDF 3.6.3
// would read memory before the result.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

constexpr int kUnsigned16 = 12, kCharacters = 51;

class UnwrittenRecordsTest : public ModuleTest {
 protected:
  UnwrittenRecordsTest() {
    results("setFileBackward", {1});
    file_ = create("old");
    results("setFileBackward", {0});
  }
  double createPadded(const NewVariable& variable) {
    const double number = createVar(file_, variable);
    results("setVarPadValue", {file_, number, row<std::uint16_t>({9})});
    return number;
  }

  Given file_;
};

TEST_F(UnwrittenRecordsTest, ReadAsPadValues) {
  const double v = createPadded({.datatype = kUnsigned16, .sizes = {2, 3}, .recordsVary = false});
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}), "uint16 2x3 [9 9 9 9 9 9]");
  EXPECT_EQ(does("getVarData", {file_, v, 5, {1, 2}}), "uint16 1x1 [9]");
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 1, 1, {0, 0}, {2, 3}, {1, 1}}),
            "uint16 2x3 [9 9 9 9 9 9]");
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 9, 2, 2, {0, 1}, {2, 1}, {1, 2}}),
            "uint16 2x1x2 [9 9 9 9]");
}

TEST_F(UnwrittenRecordsTest, OfOneValueReadAsIt) {
  const double v = createPadded({.datatype = kUnsigned16, .recordsVary = false});
  EXPECT_EQ(does("getVarData", {file_, v, 0}), "uint16 1x1 [9]");
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}), "uint16 1x1 [9]");
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 2, 3, {}, {}, {}}), "uint16 2x1 [9 9]");
}

TEST_F(UnwrittenRecordsTest, FillWhatIsStoredOfDimensionsThatDoNotVary) {
  const double v = createPadded(
      {.datatype = kUnsigned16, .sizes = {2, 2}, .recordsVary = false, .variances = {-1, 0}});
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}), "uint16 2x2 [9 9 0 0]");
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 1, 1, {0, 0}, {2, 2}, {1, 1}}),
            "uint16 2x2 [9 9 9 9]");
}

TEST_F(UnwrittenRecordsTest, OfTextsReadAsWholePadValues) {
  const double v = createVar(
      file_, {.datatype = kCharacters, .sizes = {2}, .elements = 3, .recordsVary = false});
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}),
            does("hyperGetVarData", {file_, v, 0, 1, 1, 0, 2, 1}));
  results("setVarPadValue", {file_, v, "abc"});
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}), "char 3x2 'abcabc'");
}

TEST_F(UnwrittenRecordsTest, ReadAsFillValuesWhereTheLibraryDoesSo) {
  const double v = createVar(file_, {.datatype = 44, .recordsVary = false});
  const double text = createVar(
      file_, {.datatype = kCharacters, .elements = 3, .name = "text", .recordsVary = false});
  const double attribute = number("createAttr", {file_, "FILLVAL", 2});
  results("putAttrEntry", {file_, attribute, v, 44, row<float>({-7})});
  results("putAttrEntry", {file_, attribute, text, kCharacters, "xyz"});
  const bool filled = library().fillsUnwrittenRecords();
  EXPECT_EQ(does("getVarData", {file_, v, 0}), filled ? "single 1x1 [-7]" : "single 1x1 [0]");
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}), does("getVarData", {file_, v, 0}));
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 2, 1, {}, {}, {}}),
            filled ? "single 2x1 [-7 -7]" : "single 2x1 [0 0]");
  EXPECT_EQ(does("getVarData", {file_, text, 0}), filled ? "char 3x1 'xyz'" : "char 3x1 '   '");
}

TEST_F(UnwrittenRecordsTest, ReadAsFillValuesAfterTheyWereDeleted) {
  const double v = createVar(file_, {.datatype = 44, .recordsVary = false});
  const double attribute = number("createAttr", {file_, "FILLVAL", 2});
  results("putAttrEntry", {file_, attribute, v, 44, row<float>({-7})});
  results("putVarRecordData", {file_, v, 0, row<float>({3})});
  results("deleteVarRecords", {file_, v, 0, 0});
  const bool filled = library().fillsUnwrittenRecords();
  EXPECT_EQ(does("getVarData", {file_, v, 0}), filled ? "single 1x1 [-7]" : "single 1x1 [0]");
}

// What lies so far before a result is no memory of the process.
TEST_F(UnwrittenRecordsTest, MayBeLarge) {
  const double v = createVar(file_, {.sizes = {4e7}, .recordsVary = false});
  EXPECT_THAT(does("getVarRecordData", {file_, v, 0}).substr(0, 20),
              testing::StartsWith("int32 40000000x1 ["));
}

TEST_F(UnwrittenRecordsTest, AreReadWithTheSameChecks) {
  const double v = createPadded({.datatype = kUnsigned16, .sizes = {4}, .recordsVary = false});
  const char* const routine = "CDFhyperGetzVarData";
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 1, 1, 2, 3, 1}), refused(routine, kBadDimIndex));
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 1, 1, 4, 1, 1}), refused(routine, kBadDimIndex));
  EXPECT_EQ(does("hyperGetVarData", {file_, v, 0, 1, 0, 0, 1, 1}),
            refused(routine, kBadRecInterval));
  EXPECT_EQ(does("getVarData", {file_, v, 0, 4}), refused("CDFgetzVarData", kBadDimIndex));
  for (const double bad : {-1.0, 4294967296.0}) {
    EXPECT_EQ(does("getVarData", {file_, v, bad, 0}), refused("CDFgetzVarData", kBadRecNum));
    EXPECT_EQ(does("getVarRecordData", {file_, v, bad}),
              refused("CDFgetzVarRecordData", kBadRecNum));
  }
  results("hyperPutVarData", {file_, v, 0, 1, 1, 0, 4, 1, row<std::uint16_t>({1, 2, 3, 4})});
  EXPECT_EQ(does("getVarRecordData", {file_, v, 0}), "uint16 4x1 [1 2 3 4]");
}

}  // namespace
}  // namespace ambrix_test
