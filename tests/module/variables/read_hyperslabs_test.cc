// "hyperGetVarData": strided blocks of records and dimensions.
#include <numeric>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using ReadHyperslabsTest = ModuleTest;
const std::string kTooLarge = "TOLVEX:ambrix:cdflib:dimSizeTooLarge()";

std::string readingHyperslabFailed(const char* text) {
  return refused("CDFhyperGetzVarData", text);
}

TEST_F(ReadHyperslabsTest, ScalarRecordsAreAColumn) {
  const Given example = open(distributionSample("example2.cdf"));
  EXPECT_EQ(does("hyperGetVarData", {example, 0, 0, 3, 1, {}, {}, {}}), "int32 3x1 [0 100 200]");
  EXPECT_EQ(does("hyperGetVarData", {example, 0, 2, 4, 7, {}, {}, {}}),
            "int32 4x1 [200 900 1600 2300]");
}

// Value 20 r + c + 200 record at CDF indices (r, c), the host's (c, r).
TEST_F(ReadHyperslabsTest, ARowMajorBlockIsGivenAndReturnedInTheHostsOrder) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 0, 2, 1, {5, 1}, {3, 2}, {2, 4}}),
            "int32 3x2x2 [25 27 29 105 107 109 225 227 229 305 307 309]");
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 1, 1, 1, {0, 9}, {20, 1}, {1, 1}}).substr(0, 22),
            "int32 20x1 [380 381 38");
}

TEST_F(ReadHyperslabsTest, AColumnMajorBlockIsAsTheLibraryHasIt) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_testCdfColMajor.cdf");
  EXPECT_EQ(does("hyperGetVarData", {open(path), 0, 0, 1, 1, {0, 0}, {5, 2}, {1, 1}}),
            "single 5x2 [1 0 0 0 0 0 1 0 0 2]");
  EXPECT_EQ(does("hyperGetVarData", {open(path), 0, 0, 1, 1, {1, 1}, {2, 1}, {3, 1}}),
            "single 2x1 [1 2]");
}

TEST_F(ReadHyperslabsTest, WholeVariablesEqualTheirRecords) {
  const Given example = open(distributionSample("example1.cdf"));
  const Array all = result("hyperGetVarData", {example, 2, 0, 3, 1, {0, 0}, {20, 10}, {1, 1}});
  EXPECT_THAT(all.size(), testing::ElementsAre(20, 10, 3));
  std::vector<std::int32_t> expected(600);
  std::iota(expected.begin(), expected.end(), 0);
  EXPECT_THAT(all.data<std::int32_t>(), testing::ElementsAreArray(expected));
}

TEST_F(ReadHyperslabsTest, CountsBeyondADimensionAreTooLarge) {
  const Given file = create();
  const double variable = createVar(file, {.datatype = 22, .sizes = {3, 2}});
  EXPECT_EQ(
      does("hyperGetVarData", {file, variable, 0, 4, 1, {0, 0}, {3, 2}, {1, 1}}).substr(0, 13),
      "double 3x2x4 ");
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 4, 1, {0, 0}, {2, 3}, {1, 1}}), kTooLarge);
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 4, 1, {0, 0}, {4294967296.0, 1}, {1, 1}}),
            kTooLarge);
}

// The library would compute the last record and index in 32 bits and read foreign memory.
TEST_F(ReadHyperslabsTest, RecordsAndIndicesThatWrapAroundAreOutOfRange) {
  const Given file = create();
  createVar(file, {.datatype = 22, .sizes = {5}});
  const auto read = [&](double record, double records, double start, double count, double step) {
    return does("hyperGetVarData", {file, 0, record, records, 1, {start}, {count}, {step}});
  };
  EXPECT_EQ(read(0, 1, 0, 3, 2147483647), readingHyperslabFailed(kBadDimIndex));
  EXPECT_EQ(read(0, 1, 1, 2, 2147483647), readingHyperslabFailed(kBadDimIndex));
  EXPECT_EQ(read(2147483647, 2, 0, 1, 1), readingHyperslabFailed(kBadRecNum));
}

TEST_F(ReadHyperslabsTest, EachVectorMustHaveOneNumberForEachDimension) {
  const Given example = open(distributionSample("example1.cdf"));
  const std::string error = cdflib("badDimSpec", 2L, "Image");
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 0, 1, 1, {0}, {1, 1}, {1, 1}}), error);
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 0, 1, 1, {0, 0}, {1, 1, 1}, {1, 1}}), error);
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 0, 1, 1, {0, 0}, {1, 1}, {1}}), error);
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 0, 1, 1, {0, 0}, {99, 1}, {1, 1, 1}}), error);
  EXPECT_EQ(does("hyperGetVarData", {example, 0, 0, 1, 1, {}, {}, {1}}),
            cdflib("badDimSpec", 0L, "Time"));
}

TEST_F(ReadHyperslabsTest, StartsAndIntervalsAreTheLibrarysToJudge) {
  const Given example = open(distributionSample("example1.cdf"));
  const auto reads = [&](Given record, Given count, Given stride, Given start, Given counts,
                         Given strides) {
    return does("hyperGetVarData", {example, 2, record, count, stride, start, counts, strides});
  };
  const Given zeros = {0, 0}, ones = {1, 1};
  EXPECT_EQ(reads(-1, 1, 1, zeros, ones, ones), readingHyperslabFailed(kBadRecNum));
  EXPECT_EQ(reads(0, 0, 1, zeros, ones, ones), readingHyperslabFailed(kBadRecCount));
  EXPECT_EQ(reads(0, 1, 0, zeros, ones, ones), readingHyperslabFailed(kBadRecInterval));
  EXPECT_EQ(reads(0, 1, 1, {20, 0}, ones, ones), readingHyperslabFailed(kBadDimIndex));
  EXPECT_EQ(reads(0, 1, 1, {-1, 0}, ones, ones), readingHyperslabFailed(kBadDimIndex));
  EXPECT_EQ(reads(0, 1, 1, zeros, {0, 1}, ones), readingHyperslabFailed(kBadDimCount));
  EXPECT_EQ(reads(0, 1, 1, zeros, ones, {0, 1}), readingHyperslabFailed(kBadDimInterval));
  EXPECT_EQ(reads(0, 1, 1, {19, 0}, {2, 1}, ones), readingHyperslabFailed(kBadDimIndex));
}

TEST_F(ReadHyperslabsTest, NumbersBeyond32BitsAreRefusedInTheWordsOfTheirKind) {
  const Given example = open(distributionSample("example1.cdf"));
  const double cut = 4294967296.0;
  const auto reads = [&](Given record, Given stride, Given start, Given strides) {
    return does("hyperGetVarData", {example, 2, record, 1, stride, start, {1, 1}, strides});
  };
  const Given zeros = {0, 0}, ones = {1, 1};
  EXPECT_EQ(reads(cut, 1, zeros, ones), readingHyperslabFailed(kBadRecNum));
  EXPECT_EQ(reads(0, cut + 1, zeros, ones), readingHyperslabFailed(kBadRecInterval));
  EXPECT_EQ(reads(0, 1, {cut, 0}, ones), readingHyperslabFailed(kBadDimIndex));
  EXPECT_EQ(reads(0, 1, zeros, {cut + 1, 1}), readingHyperslabFailed(kBadDimInterval));
}

TEST_F(ReadHyperslabsTest, NegativeCountsAreTheHostsErrorAfterAllChecks) {
  const Given example = open(distributionSample("example1.cdf"));
  const std::string bad = "TOLVEX:host:badDimension";
  EXPECT_THAT(does("hyperGetVarData", {example, 2, 0, -1, 1, {0, 0}, {1, 1}, {1, 1}}),
              testing::StartsWith(bad));
  EXPECT_THAT(does("hyperGetVarData", {example, 2, 0, 1, 1, {0, 0}, {-3, 1}, {1, 1}}),
              testing::StartsWith(bad));
  EXPECT_EQ(does("hyperGetVarData", {example, 2, 0, -1, 1, {0, 0}, {21, 1}, {1, 1}}), kTooLarge);
}

TEST_F(ReadHyperslabsTest, MoreRecordsThanMemoryHoldsAreTheHostsError) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_THAT(does("hyperGetVarData", {example, 0, 0, 9e18, 1, {}, {}, {}}),
              testing::StartsWith("TOLVEX:host:outOfMemory"));
}

TEST_F(ReadHyperslabsTest, TextsKeepTheirCharactersInTheFirstDimension) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double name = number("getVarNum", {others, "Name"});
  EXPECT_EQ(does("hyperGetVarData", {others, name, 0, 2, 1, 0, 2, 1}),
            "char 10x2x2 '123456789 13579     abcd      bcdefghij '");
  EXPECT_EQ(does("hyperGetVarData", {others, name, 0, 2, 1, 1, 1, 1}),
            "char 10x1x2 '13579     bcdefghij '");
}

TEST_F(ReadHyperslabsTest, Epoch16sAreColumnsOfPairs) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double epochs = number("getVarNum", {others, "ep16"});
  const Array all = result("hyperGetVarData", {others, epochs, 0, 3, 1, {}, {}, {}});
  EXPECT_THAT(all.size(), testing::ElementsAre(2, 3));
  const Array first = result("getVarData", {others, epochs, 0});
  EXPECT_EQ(all.data<double>()[0], first.data<double>()[0]);
  EXPECT_EQ(all.data<double>()[1], first.data<double>()[1]);
}

TEST_F(ReadHyperslabsTest, RecordsThatWereNeverWrittenReadAsPadValues) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double sparse = number("getVarNum", {others, "Temp"});
  EXPECT_EQ(does("hyperGetVarData", {others, sparse, 4, 3, 1, 0, 3, 1}).substr(0, 11),
            "single 3x3 ");
  const double scalar = number("getVarNum", {others, "Temperature"});
  EXPECT_EQ(does("hyperGetVarData", {others, scalar, 0, 8, 1, {}, {}, {}}),
            "single 8x1 [55.5499992 66.6600037 -1.00000002e+30 -1.00000002e+30 -1.00000002e+30 "
            "999.98999 -1.00000002e+30 -1.00000002e+30]");
}

TEST_F(ReadHyperslabsTest, AnIntervalBetweenRecordsThatDoNotVaryMakesNoDifference) {
  const Given file = create();
  const double v = createVar(file, {.datatype = 12, .sizes = {2}, .recordsVary = false});
  results("putVarRecordData", {file, v, 0, row<std::uint16_t>({7, 8})});
  // What follows the first record depends on the library.
  const std::string records = does("hyperGetVarData", {file, v, 17, 3, 1, 0, 2, 1});
  EXPECT_THAT(records, testing::StartsWith("uint16 2x3 [7 8 "));
  EXPECT_EQ(does("hyperGetVarData", {file, v, 17, 3, 2, 0, 2, 1}), records);
  EXPECT_EQ(does("hyperGetVarData", {file, v, 17, 3, 2, 0, 1, 1}), "uint16 1x3 [7 7 7]");
  EXPECT_EQ(does("hyperGetVarData", {file, v, 17, 1, 2, 0, 2, 1}), "uint16 2x1 [7 8]");
}

TEST_F(ReadHyperslabsTest, UnsupportedDatatypesAreReportedAfterTheCounts) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double int8 = number("getVarNum", {others, "newI8"});
  EXPECT_EQ(does("hyperGetVarData", {others, int8, 0, 1, 1, 0, 3, 1}), kTooLarge);
  EXPECT_EQ(does("hyperGetVarData", {others, int8, 0, 1, 1, 0, 2, 1}), unrecognized(8, "DATATYPE"));
}

}  // namespace
}  // namespace ambrix_test
