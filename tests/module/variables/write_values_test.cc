// "putVarData": one value.
#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a row-major file.
class WriteValuesTest : public ModuleTest {
 protected:
  Given file = create();
};

std::string writingValueFailed(const char* text) {
  return refused("CDFputzVarData", text);
}
std::string wrongNumberInValue(long expected) {
  return cdflib("wrongNumberOfPutVarDataElements", "v", expected);
}

TEST_F(WriteValuesTest, AScalarVariableTakesEmptyIndices) {
  const double variable = createVar(file, {.datatype = 22});
  EXPECT_EQ(does("putVarData", {file, variable, 2, {}, 4.5}), "done");
  EXPECT_EQ(does("getVarData", {file, variable, 2}), "double 1x1 [4.5]");
  EXPECT_EQ(does("putVarData", {file, variable, 2, {}, {1, 2}}), wrongNumberInValue(1));
  EXPECT_EQ(does("putVarData", {file, variable, 2, {}, {}}), wrongNumberInValue(1));
}

TEST_F(WriteValuesTest, IndicesOfARowMajorFileAreReversed) {
  const double variable = createVar(file, {.datatype = 2, .sizes = {2, 3}});
  std::int16_t value = 0;
  for (const Given& indices :
       {Given{0, 0}, Given{1, 0}, Given{0, 1}, Given{1, 1}, Given{0, 2}, Given{1, 2}}) {
    EXPECT_EQ(does("putVarData", {file, variable, 0, indices, row<std::int16_t>({++value})}),
              "done");
  }
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "int16 2x3 [1 2 3 4 5 6]");
  EXPECT_EQ(does("putVarData", {file, variable, 0, {2, 1}, row<std::int16_t>({9})}),
            writingValueFailed(kBadDimIndex));
  results("close", {file});
  EXPECT_THAT(fileBytes("new.cdf"), testing::HasSubstr(bytesOf<std::int16_t>({1, 2, 3, 4, 5, 6})));
}

TEST_F(WriteValuesTest, IndicesOfAColumnMajorFileAreAsGiven) {
  const Given columns = createColumnMajor("columns");
  const double variable = createVar(columns, {.datatype = 2, .sizes = {2, 3}});
  results("putVarRecordData", {columns, variable, 0, row<std::int16_t>({1, 2, 3, 4, 5, 6})});
  EXPECT_EQ(does("putVarData", {columns, variable, 0, {1, 2}, row<std::int16_t>({66})}), "done");
  EXPECT_EQ(does("putVarData", {columns, variable, 0, {1, 0}, row<std::int16_t>({22})}), "done");
  results("close", {columns});
  EXPECT_THAT(fileBytes("columns.cdf"),
              testing::HasSubstr(bytesOf<std::int16_t>({1, 22, 3, 4, 5, 66})));
}

TEST_F(WriteValuesTest, AnEpoch16NeedsTwoDoubles) {
  const double variable = createVar(file, {.datatype = 32});
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, {63113904000.0, 7}}), "done");
  EXPECT_EQ(does("getVarData", {file, variable, 0}), "double 2x1 [63113904000 7]");
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, 5}), wrongNumberInValue(2));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, {1, 2, 3}}), wrongNumberInValue(2));
}

// The characters behind the first are zeros, of which the versions of the library make different
// things.
TEST_F(WriteValuesTest, OfATextOnlyTheFirstCharacterIsWritten) {
  for (const long datatype : {51L, 52L}) {
    const std::string name = "t" + std::to_string(datatype);
    const double variable =
        createVar(file, {.datatype = datatype, .elements = 4, .name = name.c_str()});
    EXPECT_EQ(does("putVarData", {file, variable, 0, {}, "ABCD"}), "done");
    EXPECT_EQ(does("getVarData", {file, variable, 0}),
              "char 4x1 'A" + library().behindZero(3) + "'");
  }
}

TEST_F(WriteValuesTest, TheFirstCharacterKeepsItsLowByte) {
  const double variable = createVar(file, {.datatype = 51});
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, Array::text(u"\u20AC")}), "done");
  EXPECT_EQ(does("getVarData", {file, variable, 0}), "char 1x1 '\\xFFAC'");
}

TEST_F(WriteValuesTest, ClassesThatCarryNoDatatypeNeverMatch) {
  const double variable = createVar(file, {.datatype = 1});
  const auto mismatch = [](const char* className) {
    return cdflib("datatypeMismatch", className, "CDF_INT1");
  };
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, 1}), mismatch("double"));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, Array::scalar(true)}), mismatch("logical"));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, row<std::uint8_t>({1})}), mismatch("uint8"));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, row<std::int64_t>({1})}), mismatch("int64"));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, row<std::uint64_t>({1})}),
            mismatch("uint64"));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, Array::cell({1, 1})}), mismatch("cell"));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, "x"}), mismatch("char"));
}

TEST_F(WriteValuesTest, NumbersOutOfRangeAreTheLibrarysFailureAndWriteNothing) {
  const double variable = createVar(file, {.datatype = 22, .sizes = {2}});
  results("putVarRecordData", {file, variable, 0, {1, 2}});
  EXPECT_EQ(does("putVarData", {file, variable, -1, 0, 9}), writingValueFailed(kBadRecNum));
  EXPECT_EQ(does("putVarData", {file, variable, 4294967296.0, 0, 9}),
            writingValueFailed(kBadRecNum));
  EXPECT_EQ(does("putVarData", {file, variable, 0, 2, 9}), writingValueFailed(kBadDimIndex));
  EXPECT_EQ(does("putVarData", {file, variable, 0, 4294967296.0, 9}),
            writingValueFailed(kBadDimIndex));
  EXPECT_EQ(does("putVarData", {file, 7, 0, 0, 9}), refused("CDFinquirezVar", kNoSuchVar));
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "double 2x1 [1 2]");
}

TEST_F(WriteValuesTest, AReadOnlyFileIsNotWritten) {
  const double variable = createVar(file, {.datatype = 22});
  file = reopen(file);
  results("setReadOnlyMode", {file, -1});
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, 9}), writingValueFailed(kReadOnlyMode));
}

}  // namespace
}  // namespace ambrix_test
