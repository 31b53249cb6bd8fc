// Values of the extended datatypes in files: every command that takes or gives values.
#include <cstdint>
#include <limits>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

constexpr std::int64_t kLeast = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kMost = std::numeric_limits<std::int64_t>::max();
constexpr long kInt8 = 8;
constexpr long kTt2000 = 33;

Given int64(std::int64_t value) {
  return row<std::int64_t>({value});
}

/// Begins with a row-major file, for each of the two datatypes.
class ExtendedValuesTest : public ModuleTest, public testing::WithParamInterface<long> {
 protected:
  ExtendedValuesTest() { module.setExtended(true); }

  Given file = create();
};

INSTANTIATE_TEST_SUITE_P(, ExtendedValuesTest, testing::Values(kInt8, kTt2000));

TEST_P(ExtendedValuesTest, InquiriesNameTheDatatype) {
  const double variable = createVar(file, {.datatype = GetParam(), .sizes = {2, 3}});
  EXPECT_EQ(results("inquireVar", {file, variable})[1].utf8(),
            GetParam() == kInt8 ? "cdf_int8" : "cdf_time_tt2000");
}

TEST_P(ExtendedValuesTest, SingleValuesAreExact) {
  const double variable = createVar(file, {.datatype = GetParam(), .sizes = {2, 3}});
  EXPECT_EQ(does("putVarData", {file, variable, 4, {1, 2}, int64(9007199254740993)}), "done");
  EXPECT_EQ(does("getVarData", {file, variable, 4, {1, 2}}), "int64 1x1 [9007199254740993]");
}

TEST_P(ExtendedValuesTest, RecordsKeepTheirShape) {
  const double variable = createVar(file, {.datatype = GetParam(), .sizes = {2, 3}});
  const Given record = row<std::int64_t>({kLeast, kLeast + 1, -1, 0, 1, kMost});
  EXPECT_EQ(does("putVarRecordData", {file, variable, 0, record}), "done");
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}),
            "int64 2x3 [-9223372036854775808 -9223372036854775807 -1 0 1 9223372036854775807]");
}

TEST_P(ExtendedValuesTest, HyperslabsAreStridedAndSurviveClosing) {
  const double variable = createVar(file, {.datatype = GetParam(), .sizes = {4}});
  const Given values = row<std::int64_t>({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, kMost});
  EXPECT_EQ(does("hyperPutVarData", {file, variable, 0, 3, 1, {0}, {4}, {1}, values}), "done");
  const Given again = reopen(file);
  EXPECT_EQ(does("hyperGetVarData", {again, variable, 0, 2, 2, {1}, {2}, {2}}),
            "int64 2x2 [2 4 10 9223372036854775807]");
}

TEST_P(ExtendedValuesTest, CompressedValuesAreExact) {
  const double variable = createVar(file, {.datatype = GetParam()});
  results("setVarCompression", {file, variable, 5, 6});
  const Given values =
      row<std::int64_t>({kLeast + 2, -9007199254740993, 0, 9007199254740993, kMost});
  results("hyperPutVarData", {file, variable, 0, 5, 1, {}, {}, {}, values});
  const Given again = reopen(file);
  EXPECT_EQ(does("hyperGetVarData", {again, variable, 0, 5, 1, {}, {}, {}}),
            "int64 5x1 [-9223372036854775806 -9007199254740993 0 9007199254740993 "
            "9223372036854775807]");
}

TEST_P(ExtendedValuesTest, ThePadValueIsThatOfTheLibraryUntilItIsSet) {
  const double variable = createVar(file, {.datatype = GetParam()});
  EXPECT_EQ(does("getVarPadValue", {file, variable}), "int64 1x1 [-9223372036854775807]");
  EXPECT_EQ(does("setVarPadValue", {file, variable, int64(kLeast)}), "done");
  EXPECT_EQ(does("getVarPadValue", {file, variable}), "int64 1x1 [-9223372036854775808]");
  results("putVarRecordData", {file, variable, 2, int64(5)});
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 3, 1, {}, {}, {}}),
            "int64 3x1 [-9223372036854775808 -9223372036854775808 5]");
  const auto wrong = cdflib("wrongNumberOfPadValueElements", "v", 1);
  EXPECT_EQ(does("setVarPadValue", {file, variable, row<std::int64_t>({1, 2})}), wrong);
}

TEST_P(ExtendedValuesTest, UnwrittenRecordsReadAsPadValues) {
  const double variable = createVar(file, {.datatype = GetParam(), .recordsVary = false});
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "int64 1x1 [-9223372036854775807]");
}

TEST_P(ExtendedValuesTest, EntriesAreExact) {
  const double global = number("createAttr", {file, "g", 1});
  const double ofVariables = number("createAttr", {file, "v", 2});
  const Given values = row<std::int64_t>({kLeast, kMost, 9007199254740993});
  createVar(file, {.datatype = GetParam()});
  EXPECT_EQ(does("putAttrgEntry", {file, global, 0, static_cast<double>(GetParam()), values}),
            "done");
  EXPECT_EQ(does("putAttrEntry", {file, ofVariables, 0, static_cast<double>(GetParam()), values}),
            "done");
  const Given again = reopen(file);
  const char* expected = "int64 1x3 [-9223372036854775808 9223372036854775807 9007199254740993]";
  EXPECT_EQ(does("getAttrgEntry", {again, global, 0}), expected);
  EXPECT_EQ(does("getAttrEntry", {again, ofVariables, 0}), expected);
  EXPECT_EQ(does("inquireAttrgEntry", {again, global, 0}),
            GetParam() == kInt8 ? "char 1x8 'cdf_int8'; double 1x1 [3]"
                                : "char 1x15 'cdf_time_tt2000'; double 1x1 [3]");
}

TEST_P(ExtendedValuesTest, OtherClassesAreRefused) {
  const double variable = createVar(file, {.datatype = GetParam()});
  const char* name = GetParam() == kInt8 ? "CDF_INT8" : "CDF_TIME_TT2000";
  EXPECT_EQ(does("putVarData", {file, variable, 0, {}, 5}),
            cdflib("datatypeMismatch", "double", name));
  EXPECT_EQ(does("putVarRecordData", {file, variable, 0, row<std::uint64_t>({5})}),
            cdflib("datatypeMismatch", "uint64", name));
  EXPECT_EQ(does("hyperPutVarData", {file, variable, 0, 1, 1, {}, {}, {}, row<std::int32_t>({5})}),
            cdflib("datatypeMismatch", "int32", name));
}

TEST_P(ExtendedValuesTest, WhatOneCallWroteAnotherCannotReadWithoutTheExtension) {
  const double variable = createVar(file, {.datatype = GetParam()});
  results("putVarData", {file, variable, 0, {}, int64(5)});
  module.setExtended(false);
  EXPECT_EQ(does("getVarData", {file, variable, 0}), unrecognized(GetParam(), "DATATYPE"));
  module.setExtended(true);
  EXPECT_EQ(does("getVarData", {file, variable, 0}), "int64 1x1 [5]");
}

}  // namespace
}  // namespace ambrix_test
