// The value that stands for what was never written.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a row-major file.
class PadValuesTest : public ModuleTest {
 protected:
  /// Sets the pad value of a new variable; gives what is then read of it.
  std::string padOf(const NewVariable& variable, const Given& value) {
    const double number = createVar(file, variable);
    const std::string set = does("setVarPadValue", {file, number, value});
    const std::string text = set == "done" ? does("getVarPadValue", {file, number}) : set;
    results("deleteVar", {file, number});
    return text;
  }
  Given file = create();
};

TEST_F(PadValuesTest, EveryDatatypeHasItsShape) {
  EXPECT_EQ(padOf({.datatype = 1}, row<std::int8_t>({-128})), "int8 1x1 [-128]");
  EXPECT_EQ(padOf({.datatype = 2}, row<std::int16_t>({-5})), "int16 1x1 [-5]");
  EXPECT_EQ(padOf({.datatype = 4}, row<std::int32_t>({-5})), "int32 1x1 [-5]");
  EXPECT_EQ(padOf({.datatype = 11}, row<std::uint8_t>({255})), "uint8 1x1 [255]");
  EXPECT_EQ(padOf({.datatype = 12}, row<std::uint16_t>({65535})), "uint16 1x1 [65535]");
  EXPECT_EQ(padOf({.datatype = 14}, row<std::uint32_t>({4294967295})), "uint32 1x1 [4294967295]");
  EXPECT_EQ(padOf({.datatype = 21}, row<float>({-1.5F})), "single 1x1 [-1.5]");
  EXPECT_EQ(padOf({.datatype = 22}, -1.5), "double 1x1 [-1.5]");
  EXPECT_EQ(padOf({.datatype = 31}, 63113904000000.0), "double 1x1 [63113904000000]");
  EXPECT_EQ(padOf({.datatype = 32}, {1, 2}), "double 2x1 [1 2]");
  EXPECT_EQ(padOf({.datatype = 41}, row<std::int8_t>({7})), "int8 1x1 [7]");
  EXPECT_EQ(padOf({.datatype = 44}, row<float>({0.25F})), "single 1x1 [0.25]");
  EXPECT_EQ(padOf({.datatype = 45}, 8), "double 1x1 [8]");
  EXPECT_EQ(padOf({.datatype = 51, .elements = 4}, "none"), "char 4x1 'none'");
  EXPECT_EQ(padOf({.datatype = 52, .elements = 4}, "none"), "char 4x1 'none'");
  EXPECT_EQ(padOf({.datatype = 51}, "x"), "char 1x1 'x'");
}

TEST_F(PadValuesTest, DimensionsDoNotMatter) {
  EXPECT_EQ(padOf({.datatype = 4, .sizes = {3, 4}}, row<std::int32_t>({7})), "int32 1x1 [7]");
  EXPECT_EQ(padOf({.datatype = 51, .sizes = {2, 2}, .elements = 3}, "abc"), "char 3x1 'abc'");
}

TEST_F(PadValuesTest, BytesOfATextAreWidenedAsSignedValues) {
  EXPECT_EQ(padOf({.datatype = 51, .elements = 3}, Array::text(u"\u00E9A\u20AC")),
            "char 3x1 '\\xFFE9A\\xFFAC'");
}

TEST_F(PadValuesTest, TheShapeOfAValueDoesNotMatter) {
  const double variable = createVar(file, {.datatype = 32});
  const std::initializer_list<double> pair = {3, 4};
  EXPECT_EQ(
      does("setVarPadValue", {file, variable, Array::of<double>({std::data(pair), 2}, {2, 1})}),
      "done");
  EXPECT_EQ(does("getVarPadValue", {file, variable}), "double 2x1 [3 4]");
}

TEST_F(PadValuesTest, TheNumberOfElementsMustFit) {
  const auto wrong = [](long expected) {
    return cdflib("wrongNumberOfPadValueElements", "v", expected);
  };
  EXPECT_EQ(padOf({.datatype = 45}, {1, 2}), wrong(1));
  EXPECT_EQ(padOf({.datatype = 45}, {}), wrong(1));
  EXPECT_EQ(padOf({.datatype = 32}, 1), wrong(2));
  EXPECT_EQ(padOf({.datatype = 32}, {1, 2, 3, 4}), wrong(2));
  EXPECT_EQ(padOf({.datatype = 51, .elements = 4}, "abc"), wrong(4));
  EXPECT_EQ(padOf({.datatype = 52, .elements = 4}, "abcde"), wrong(4));
}

TEST_F(PadValuesTest, TheClassComesBeforeTheNumber) {
  EXPECT_EQ(padOf({.datatype = 45}, row<float>({1})),
            cdflib("datatypeMismatch", "single", "CDF_DOUBLE"));
  EXPECT_EQ(padOf({.datatype = 45}, row<float>({1, 2})),
            cdflib("datatypeMismatch", "single", "CDF_DOUBLE"));
  EXPECT_EQ(padOf({.datatype = 51, .elements = 2}, row<std::uint8_t>({1, 2})),
            cdflib("datatypeMismatch", "uint8", "CDF_CHAR"));
  EXPECT_EQ(padOf({.datatype = 1}, Array::scalar(true)),
            cdflib("datatypeMismatch", "logical", "CDF_INT1"));
}

TEST_F(PadValuesTest, UnsupportedDatatypesAreUnrecognized) {
  for (const long datatype : {8L, 33L}) {
    const std::string name = "v" + std::to_string(datatype);
    results("createVar", {file, name.c_str(), static_cast<double>(datatype), 1, {}, -1, {}});
    const double variable = number("getVarNum", {file, name.c_str()});
    EXPECT_EQ(does("getVarPadValue", {file, variable}), unrecognized(datatype, "DATATYPE"));
    EXPECT_EQ(does("setVarPadValue", {file, variable, "x"}), unrecognized(datatype, "DATATYPE"));
  }
}

TEST_F(PadValuesTest, PadValuesOfOthersAreRead) {
  const Given columns = open(distributionSample("cacsst2.cdf"));
  EXPECT_EQ(does("getVarPadValue", {columns, 2}), "single 1x1 [-1e+09]");
  EXPECT_EQ(does("getVarPadValue", {columns, 0}), "int16 1x1 [0]");
}

TEST_F(PadValuesTest, AReadOnlyFileKeepsItsPadValue) {
  const double variable = createVar(file, {.datatype = 45});
  file = reopen(file);
  results("setReadOnlyMode", {file, -1});
  EXPECT_EQ(does("setVarPadValue", {file, variable, 1}),
            refused("CDFsetzVarPadValue", kReadOnlyMode));
}

}  // namespace
}  // namespace ambrix_test
