// Compression of a whole file and of one variable: twins that differ in their checks.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using FileCompressionTest = ModuleTest;
using VariableCompressionTest = ModuleTest;

const std::string kNoLevel = "TOLVEX:ambrix:cdflib:unspecifiedGzipCompressionLevel()";

TEST_F(FileCompressionTest, AnUncompressedFileHasNoParameter) {
  EXPECT_EQ(does("getCompression", {create()}),
            "char 1x14 'NO_COMPRESSION'; double 0x0 []; double 1x1 [100]");
}

TEST_F(FileCompressionTest, EveryTypeIsReturnedByItsNameWithItsParameter) {
  const auto compressed = [this](Arguments compression) {
    const Given file = create();
    compression.insert(compression.begin(), file);
    results("setCompression", compression);
    const std::string text = does("getCompression", {file});
    results("delete", {file});
    return text;
  };
  EXPECT_EQ(compressed({1}),
            "char 1x15 'RLE_COMPRESSION'; char 1x12 'RLE_OF_ZEROS'; double 1x1 [0]");
  EXPECT_EQ(compressed({2, 0}),
            "char 1x16 'HUFF_COMPRESSION'; char 1x22 'OPTIMAL_ENCODING_TREES'; double 1x1 [0]");
  EXPECT_EQ(compressed({3}),
            "char 1x17 'AHUFF_COMPRESSION'; char 1x22 'OPTIMAL_ENCODING_TREES'; double 1x1 [0]");
  EXPECT_EQ(compressed({5, 7}), "char 1x16 'GZIP_COMPRESSION'; double 1x1 [7]; double 1x1 [0]");
  EXPECT_EQ(compressed({0}), "char 1x14 'NO_COMPRESSION'; double 0x0 []; double 1x1 [100]");
  EXPECT_EQ(compressed({0, 5}), "char 1x14 'NO_COMPRESSION'; double 0x0 []; double 1x1 [100]");
}

TEST_F(FileCompressionTest, DataSurviveEveryType) {
  for (const double type : {1, 2, 3, 5}) {
    const Given file = create();
    results("setCompression", {file, type, type == 5 ? 6 : 0});
    const double variable = createVar(file, {.sizes = {1000}});
    const Array zeros = Array::zeros(ClassId::kInt32, {1, 1000});
    results("putVarRecordData", {file, variable, 0, zeros.clone()});
    results("close", {file});
    const Given again = open("new");
    EXPECT_EQ(shown(result("getVarRecordData", {again, variable, 0})).substr(0, 16),
              "int32 1000x1 [0 ");
    const double percentage = results("getCompression", {again})[2].data<double>()[0];
    EXPECT_GT(percentage, 0);
    EXPECT_LT(percentage, 100);
    results("delete", {again});
  }
}

TEST_F(FileCompressionTest, FilesOfOthersShowTheirCompression) {
  EXPECT_THAT(does("getCompression", {open(distributionSample("d103a2x.cdf"))}),
              testing::StartsWith("char 1x16 'GZIP_COMPRESSION'; double 1x1 ["));
}

TEST_F(FileCompressionTest, AGzipLevelIsCheckedBeforeTheLibraryIsAsked) {
  const Given file = create();
  for (const long level : {0L, 10L, -1L, 4294967297L}) {
    EXPECT_EQ(does("setCompression", {file, 5, static_cast<double>(level)}),
              cdflib("invalidCompressionParameter", level, "GZIP"));
  }
  EXPECT_EQ(does("setCompression", {file, 5}), kNoLevel);
  EXPECT_EQ(does("setCompression", {file, 5, 1}), "done");
  EXPECT_EQ(does("setCompression", {file, 5, 9.9}), "done");
}

TEST_F(FileCompressionTest, OtherParametersAreTheLibrarysToJudge) {
  const Given file = create();
  for (const double type : {1, 2, 3}) {
    EXPECT_EQ(does("setCompression", {file, type, 7}),
              refused("CDFsetCompression", kBadCompressionParm));
    EXPECT_EQ(does("setCompression", {file, type, 4294967296.0}),
              refused("CDFsetCompression", kBadCompressionParm));
  }
}

TEST_F(FileCompressionTest, AnUnknownTypeIsReportedBeforeAnyParameterIsRead) {
  const Given file = create();
  for (const long type : {4L, 6L, -1L, 4294967301L}) {
    EXPECT_EQ(does("setCompression", {file, static_cast<double>(type), "x"}),
              unrecognized(type, "COMPRESSION"));
  }
}

TEST_F(FileCompressionTest, AMultiFileCannotBeCompressed) {
  EXPECT_EQ(does("setCompression", {createMultiFile(), 1}),
            refused("CDFsetCompression", kCannotCompress));
}

TEST_F(VariableCompressionTest, RleOfZerosEndsInASmallS) {
  const Given file = create();
  const double variable = createVar(file, {});
  results("setVarCompression", {file, variable, 1});
  EXPECT_EQ(does("getVarCompression", {file, variable}).substr(0, 52),
            "char 1x15 'RLE_COMPRESSION'; char 1x12 'RLE_OF_ZEROs");
}

TEST_F(VariableCompressionTest, EveryTypeIsReturnedByItsNameWithItsParameter) {
  const Given file = create();
  const double variable = createVar(file, {});
  const auto compressed = [&](Arguments compression) {
    compression.insert(compression.begin(), {file, variable});
    results("setVarCompression", compression);
    EXPECT_THAT(warnings(), testing::IsEmpty());
    std::vector<Array> found = results("getVarCompression", {file, variable});
    EXPECT_EQ(found.at(2).classId(), ClassId::kDouble);
    found.pop_back();
    return shown(found);
  };
  EXPECT_EQ(compressed({0}), "char 1x14 'NO_COMPRESSION'; double 0x0 []");
  EXPECT_EQ(compressed({1, 0}), "char 1x15 'RLE_COMPRESSION'; char 1x12 'RLE_OF_ZEROs'");
  EXPECT_EQ(compressed({2}), "char 1x16 'HUFF_COMPRESSION'; char 1x22 'OPTIMAL_ENCODING_TREES'");
  EXPECT_EQ(compressed({3}), "char 1x17 'AHUFF_COMPRESSION'; char 1x22 'OPTIMAL_ENCODING_TREES'");
  EXPECT_EQ(compressed({5, 9}), "char 1x16 'GZIP_COMPRESSION'; double 1x1 [9]");
}

TEST_F(VariableCompressionTest, AGzipLevelReachesTheLibraryUnchecked) {
  const Given file = create();
  const double variable = createVar(file, {});
  for (const double level : {0.0, 10.0, 12.0, -1.0, 4294967297.0}) {
    EXPECT_EQ(does("setVarCompression", {file, variable, 5, level}),
              refused("CDFsetzVarCompression", kBadCompressionParm));
  }
  EXPECT_EQ(does("setVarCompression", {file, variable, 5}), kNoLevel);
}

TEST_F(VariableCompressionTest, IsFixedOnceThereAreData) {
  const Given file = create();
  const double variable = createVar(file, {});
  results("putVarRecordData", {file, variable, 0, row<std::int32_t>({1})});
  EXPECT_EQ(does("setVarCompression", {file, variable, 1}),
            refused("CDFsetzVarCompression", kCannotCompress));
}

TEST_F(VariableCompressionTest, DataSurviveEveryType) {
  const Given file = create();
  std::vector<std::int32_t> values(2000);
  for (std::size_t i = 0; i < values.size(); ++i)
    values[i] = static_cast<std::int32_t>(i % 7 == 0 ? i : 0);
  for (const double type : {1, 2, 3, 5}) {
    const std::string name = "v" + std::to_string(static_cast<int>(type));
    const double variable = createVar(file, {.sizes = {2000}, .name = name.c_str()});
    results("setVarCompression", {file, variable, type, type == 5 ? 6 : 0});
    results("putVarRecordData", {file, variable, 0, Array::row<std::int32_t>(values)});
  }
  const Given again = reopen(file);
  for (const double variable : {0, 1, 2, 3}) {
    const Array data = result("getVarRecordData", {again, variable, 0});
    EXPECT_THAT(data.data<std::int32_t>(), testing::ElementsAreArray(values));
  }
}

}  // namespace
}  // namespace ambrix_test
