// What variables are: dimensions in the host's order, names and numbers, renaming and deleting.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using VariableInquiryTest = ModuleTest;

TEST_F(VariableInquiryTest, AScalarVariableHasEmptySizesAndVariances) {
  const Given file = create();
  createVar(file, {.name = "scalar"});
  EXPECT_EQ(does("inquireVar", {file, 0}),
            "char 1x6 'scalar'; char 1x8 'cdf_int4'; double 1x1 [1]; double 0x0 []; "
            "logical 1x1 [1]; logical 0x0 []");
}

TEST_F(VariableInquiryTest, SizesAndVariancesComeBackInTheHostsOrderInBothMajorities) {
  for (const bool rowMajor : {true, false}) {
    const Given file = rowMajor ? create("row") : createColumnMajor("column");
    createVar(file, {.sizes = {2, 3, 4}, .name = "cube", .variances = {-1, 0, 0}});
    EXPECT_EQ(does("inquireVar", {file, 0}),
              "char 1x4 'cube'; char 1x8 'cdf_int4'; double 1x1 [1]; double 1x3 [2 3 4]; "
              "logical 1x1 [1]; logical 1x3 [1 0 0]");
  }
}

// The library keeps a file's sizes whatever its majority, so changing that shows what was stored.
TEST_F(VariableInquiryTest, TheLibraryKeepsTheSizesOfARowMajorFileReversed) {
  const Given file = create();
  createVar(file, {.sizes = {2, 3, 4}, .variances = {-1, 0, 0}});
  results("setMajority", {file, 2});
  const std::vector<Array> facts = results("inquireVar", {file, 0});
  EXPECT_EQ(shown(facts[3]), "double 1x3 [4 3 2]");
  EXPECT_EQ(shown(facts[5]), "logical 1x3 [0 0 1]");
}

TEST_F(VariableInquiryTest, EveryNumberOfDimensionsUpToTen) {
  for (const bool rowMajor : {true, false}) {
    const Given file = rowMajor ? create("row") : createColumnMajor("column");
    std::vector<double> sizes;
    std::vector<bool> variances;
    for (std::size_t count = 1; count <= 10; ++count) {
      sizes.push_back(static_cast<double>(count % 3 + 1));
      const std::string name = "v" + std::to_string(count);
      createVar(file, {.sizes = sizes, .name = name.c_str()});
      const double variable = number("getVarNum", {file, name.c_str()});
      const std::vector<Array> facts = results("inquireVar", {file, variable});
      EXPECT_THAT(facts[3].size(), testing::ElementsAre(1, count));
      EXPECT_THAT(facts[3].data<double>(), testing::ElementsAreArray(sizes));
      EXPECT_THAT(facts[5].size(), testing::ElementsAre(1, count));
    }
  }
}

TEST_F(VariableInquiryTest, VariablesOfOthersShowTheirSizes) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("inquireVar", {example, 2}),
            "char 1x5 'Image'; char 1x8 'cdf_int4'; double 1x1 [1]; double 1x2 [20 10]; "
            "logical 1x1 [1]; logical 1x2 [1 1]");
  const Given columns = open(distributionSample("cacsst2.cdf"));
  EXPECT_EQ(does("inquireVar", {columns, 2}),
            "char 1x8 'SST     '; char 1x9 'cdf_real4'; double 1x1 [1]; double 1x2 [180 91]; "
            "logical 1x1 [1]; logical 1x2 [1 1]");
  EXPECT_EQ(shown(results("inquireVar", {columns, 0})[4]), "logical 1x1 [0]");
}

TEST_F(VariableInquiryTest, TextVariablesShowTheirLength) {
  const Given file = create();
  createVar(file, {.datatype = 51, .sizes = {3}, .elements = 12});
  EXPECT_EQ(does("inquireVar", {file, 0}),
            "char 1x1 'v'; char 1x8 'cdf_char'; double 1x1 [12]; double 1x1 [3]; "
            "logical 1x1 [1]; logical 1x1 [1]");
}

TEST_F(VariableInquiryTest, RenamingKeepsTheNumber) {
  const Given file = create();
  createVar(file, {.name = "a"});
  createVar(file, {.name = "b"});
  EXPECT_EQ(does("renameVar", {file, 0, "new name"}), "done");
  EXPECT_EQ(does("getVarName", {file, 0}), "char 1x8 'new name'");
  EXPECT_EQ(does("renameVar", {file, 0, "b"}), refused("CDFrenamezVar", kVarExists));
  EXPECT_EQ(does("renameVar", {file, 0, "\x7F"}), refused("CDFrenamezVar", kBadVarName));
  EXPECT_EQ(does("renameVar", {file, 0, 5}), "basic_string::_M_construct null not valid");
}

TEST_F(VariableInquiryTest, LongNamesAreKept) {
  const Given file = create();
  const std::string name(255, 'n');
  createVar(file, {.name = name.c_str()});
  EXPECT_EQ(does("getVarName", {file, 0}), "char 1x255 '" + name + "'");
  EXPECT_EQ(does("getVarNum", {file, name.c_str()}), "double 1x1 [0]");
}

TEST_F(VariableInquiryTest, DeletingRenumbersTheOthers) {
  const Given file = create();
  createVar(file, {.name = "a"});
  createVar(file, {.name = "b"});
  EXPECT_EQ(does("deleteVar", {file, 0}), "done");
  EXPECT_EQ(does("getVarName", {file, 0}), "char 1x1 'b'");
  EXPECT_EQ(does("deleteVar", {file, 1}), refused("CDFdeletezVar", kNoSuchVar));
}

// The standard interface looks for rVariables after zVariables, which zMode forbids.
TEST_F(VariableInquiryTest, AnUnknownNameIsReportedAsClosing) {
  const Given file = create();
  createVar(file, {});
  EXPECT_EQ(does("getVarNum", {file, "V"}), refused("CDFclosezVar", kNoSuchVar));
  EXPECT_EQ(does("getVarNum", {reopen(file), "V"}), refused("CDFclosezVar", kIllegalInZmode));
}

TEST_F(VariableInquiryTest, ClosingAVariableIsForMultiFiles) {
  const Given single = create("single");
  createVar(single, {});
  EXPECT_EQ(does("closeVar", {single, 0}), "done");
  const Given multi = createMultiFile("multi");
  createVar(multi, {});
  results("putVarRecordData", {multi, 0, 0, row<std::int32_t>({4})});
  EXPECT_EQ(does("closeVar", {multi, 0}), "done");
  EXPECT_EQ(does("closeVar", {multi, 0}), "done");
  EXPECT_EQ(does("getVarData", {multi, 0, 0}), "int32 1x1 [4]");
}

}  // namespace
}  // namespace ambrix_test
