// The compression of a file and of a variable: twins that differ, each as users know it.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using GetCompressionTest = ScriptedTest;

TEST_F(GetCompressionTest, AFileHasTypeParameterAndPercentage) {
  const std::pair<Numbers, std::vector<std::string>> answers[] = {
      {{0}, {"char 1x14 'NO_COMPRESSION'", "double 0x0 []", "double 1x1 [0]"}},
      {{1, 0, 100},
       {"char 1x15 'RLE_COMPRESSION'", "char 1x12 'RLE_OF_ZEROS'", "double 1x1 [100]"}},
      {{2, 0, 50},
       {"char 1x16 'HUFF_COMPRESSION'", "char 1x22 'OPTIMAL_ENCODING_TREES'", "double 1x1 [50]"}},
      {{3, 0, 51},
       {"char 1x17 'AHUFF_COMPRESSION'", "char 1x22 'OPTIMAL_ENCODING_TREES'", "double 1x1 [51]"}},
      {{5, 6, 9}, {"char 1x16 'GZIP_COMPRESSION'", "double 1x1 [6]", "double 1x1 [9]"}},
  };
  for (const auto& [answer, results] : answers) {
    fake.answer("CDF_COMPRESSION_", answer);
    EXPECT_EQ(shown(call("getCompression", {file()})), results);
    EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | GET_ CDF_COMPRESSION_"));
  }
}

TEST_F(GetCompressionTest, AFilesParameterIsNotLookedAtExceptForGzip) {
  fake.answer("CDF_COMPRESSION_", {1, 3, 100});
  EXPECT_EQ(call("getCompression", {file()})[1].utf8(), "RLE_OF_ZEROS");
  fake.answer("CDF_COMPRESSION_", {3, 3, 100});
  EXPECT_EQ(call("getCompression", {file()})[1].utf8(), "OPTIMAL_ENCODING_TREES");
  EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(GetCompressionTest, AVariableHasTypeParameterAndPercentage) {
  const std::pair<Numbers, std::vector<std::string>> answers[] = {
      {{0, 0, 100}, {"char 1x14 'NO_COMPRESSION'", "double 0x0 []", "double 1x1 [100]"}},
      {{2, 0, 50},
       {"char 1x16 'HUFF_COMPRESSION'", "char 1x22 'OPTIMAL_ENCODING_TREES'", "double 1x1 [50]"}},
      {{3, 0, 51},
       {"char 1x17 'AHUFF_COMPRESSION'", "char 1x22 'OPTIMAL_ENCODING_TREES'", "double 1x1 [51]"}},
      {{5, 6, 9}, {"char 1x16 'GZIP_COMPRESSION'", "double 1x1 [6]", "double 1x1 [9]"}},
  };
  for (const auto& [answer, results] : answers) {
    fake.answer("zVAR_COMPRESSION_", answer);
    EXPECT_EQ(shown(call("getVarCompression", {file(), 3})), results);
    EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_COMPRESSION_"));
    EXPECT_THAT(warnings(), IsEmpty());
  }
}

TEST_F(GetCompressionTest, AVariablesRunLengthParameterEndsInASmallS) {
  fake.answer("zVAR_COMPRESSION_", {1, 0, 100});
  EXPECT_EQ(call("getVarCompression", {file(), 3})[1].utf8(), "RLE_OF_ZEROs");
}

TEST_F(GetCompressionTest, AVariablesOddParameterIsWarnedOfAndReturnedAsANumber) {
  const std::pair<long, const char*> types[] = {{1, "RLE"}, {2, "HUFF"}, {3, "AHUFF"}};
  for (const auto& [type, name] : types) {
    fake.answer("zVAR_COMPRESSION_", {type, 3, 40});
    const std::vector<Array> results = call("getVarCompression", {file(), 3});
    EXPECT_EQ(shown(results[1]), "double 1x1 [3]");
    EXPECT_EQ(shown(results[2]), "double 1x1 [40]");
    EXPECT_THAT(warnings(), ElementsAre(cdflib("invalidCompressionParameter", 3, name)));
  }
}

TEST_F(GetCompressionTest, AGzipLevelIsNeverWarnedOf) {
  fake.answer("zVAR_COMPRESSION_", {5, 12, 40});
  EXPECT_EQ(shown(call("getVarCompression", {file(), 3})[1]), "double 1x1 [12]");
  EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(GetCompressionTest, UnknownTypesAreUnrecognized) {
  for (const long type : {4L, 6L, -1L}) {
    fake.answer("CDF_COMPRESSION_", {type});
    EXPECT_EQ(errorOf("getCompression", {file()}), unrecognized(type, "COMPRESSION"));
    fake.answer("zVAR_COMPRESSION_", {type});
    EXPECT_EQ(errorOf("getVarCompression", {file(), 3}), unrecognized(type, "COMPRESSION"));
  }
}

TEST_F(GetCompressionTest, AParameterThatTheLibraryLeavesUntouchedReadsAsZero) {
  fake.answer("zVAR_COMPRESSION_", {5});
  EXPECT_EQ(shown(call("getVarCompression", {file(), 3})[1]), "double 1x1 [0]");
}

}  // namespace
}  // namespace ambrix_test
