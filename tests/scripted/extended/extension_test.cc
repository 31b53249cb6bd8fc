// What a host adds that offers extended datatypes, and that nothing is there without.
#include <algorithm>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;

/// Calls of variable 3 and of entry 2 of attribute 1.
class ExtensionTest : public ScriptedTest {
 protected:
  ExtensionTest() { module.setExtended(true); }

  void describeDatatype(long datatype) { describe({.datatype = datatype}); }
};

const std::int64_t kBig = 9007199254740993;  // a double does not hold it

Given big() {
  return row<std::int64_t>({kBig});
}

TEST_F(ExtensionTest, WithoutItTheDatatypesAreUnrecognized) {
  module.setExtended(false);
  EXPECT_FALSE(module.extended());
  for (const long datatype : {8L, 33L}) {
    describeDatatype(datatype);
    const std::string unrecognized = cdflib("unrecognizedValue", datatype, "DATATYPE");
    EXPECT_EQ(errorOf("inquireVar", {file(), 3}), unrecognized);
    EXPECT_EQ(errorOf("getVarData", {file(), 3, 0}), unrecognized);
    EXPECT_EQ(errorOf("getVarPadValue", {file(), 3}), unrecognized);
    EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, big()}), unrecognized);
    EXPECT_EQ(errorOf("putAttrEntry", {file(), 1, 2, static_cast<double>(datatype), big()}),
              unrecognized);
  }
}

TEST_F(ExtensionTest, WithoutItTheCommandsAreNone) {
  module.setExtended(false);
  for (const char* command : {"computeTT2000", "tt2000Breakdown"})
    EXPECT_EQ(errorOf(command, {big()}), cdflib("invalidOperation", command));
}

TEST_F(ExtensionTest, WithoutItTheConstantsAreNone) {
  module.setExtended(false);
  EXPECT_THAT(result("getConstantNames").size(), ElementsAre(57, 1));
  for (const char* name : {"CDF_INT8", "CDF_TIME_TT2000"})
    EXPECT_EQ(errorOf("getConstantValue", {name}), cdflib("unrecognizedConstantName", name));
}

TEST_F(ExtensionTest, TwoConstantsAreAmongTheOthersInByteOrder) {
  const Array names = result("getConstantNames");
  std::vector<std::string> texts;
  for (std::size_t i = 0; i < names.elementCount(); ++i)
    texts.push_back(names.element(i).utf8());
  EXPECT_THAT(names.size(), ElementsAre(59, 1));
  EXPECT_TRUE(std::ranges::is_sorted(texts));
  EXPECT_EQ(texts[16], "CDF_INT8");
  EXPECT_EQ(texts[19], "CDF_TIME_TT2000");
  EXPECT_EQ(shown(result("getConstantValue", {"cdf_int8"})), "double 1x1 [8]");
  EXPECT_EQ(shown(result("getConstantValue", {"CDF_TIME_TT2000"})), "double 1x1 [33]");
  EXPECT_EQ(errorOf("getConstantValue", {"cdf_int"}),
            cdflib("unrecognizedConstantName", "CDF_INT"));
}

TEST_F(ExtensionTest, CommandsOfOthersStayUnknown) {
  for (const char* command : {"computett2000", "TT2000breakdown", "computeTT2000 "})
    EXPECT_EQ(errorOf(command, {big()}), cdflib("invalidOperation", command));
}

TEST_F(ExtensionTest, EachCommandTakesOneArgument) {
  for (const char* command : {"computeTT2000", "tt2000Breakdown"}) {
    EXPECT_EQ(errorOf(command), validate("wrongNumberOfInputs"));
    EXPECT_EQ(errorOf(command, {big(), big()}), validate("wrongNumberOfInputs"));
  }
}

TEST_F(ExtensionTest, InquiriesNameTheDatatypes) {
  describeDatatype(8);
  EXPECT_EQ(shown(call("inquireVar", {file(), 3})[1]), "char 1x8 'cdf_int8'");
  describeDatatype(33);
  EXPECT_EQ(shown(call("inquireVar", {file(), 3})[1]), "char 1x15 'cdf_time_tt2000'");
  fake.answer("CDFinquireAttrEntry", {33, 1});
  EXPECT_EQ(shown(call("inquireAttrEntry", {file(), 1, 2})[0]), "char 1x15 'cdf_time_tt2000'");
}

TEST_F(ExtensionTest, ValuesOfVariablesAreInt64) {
  for (const long datatype : {8L, 33L}) {
    describeDatatype(datatype);
    EXPECT_EQ(result("getVarData", {file(), 3, 0}).className(), std::string("int64"));
    EXPECT_EQ(result("getVarRecordData", {file(), 3, 0}).className(), std::string("int64"));
    EXPECT_EQ(result("hyperGetVarData", {file(), 3, 0, 1, 1, {}, {}, {}}).className(),
              std::string("int64"));
    EXPECT_EQ(result("getVarPadValue", {file(), 3}).className(), std::string("int64"));
    call("putVarData", {file(), 3, 0, {}, big()});
    call("putVarRecordData", {file(), 3, 0, big()});
    call("hyperPutVarData", {file(), 3, 0, 1, 1, {}, {}, {}, big()});
    call("setVarPadValue", {file(), 3, big()});
  }
}

TEST_F(ExtensionTest, OtherClassesAreAMismatchWithTheNameOfTheDatatype) {
  describeDatatype(33);
  EXPECT_EQ(errorOf("putVarData", {file(), 3, 0, {}, 5}),
            cdflib("datatypeMismatch", "double", "CDF_TIME_TT2000"));
  EXPECT_EQ(errorOf("setVarPadValue", {file(), 3, elements<std::uint64_t>(1)}),
            cdflib("datatypeMismatch", "uint64", "CDF_TIME_TT2000"));
  EXPECT_EQ(errorOf("putAttrEntry", {file(), 1, 2, 8, 5}),
            cdflib("badPutAttrEntryDatatype", "double", "CDF_INT8"));
}

TEST_F(ExtensionTest, OtherCodesStayUnrecognized) {
  for (const long datatype : {0L, 3L, 7L, 9L, 34L, 53L, -8L, 4294967304L}) {
    describeDatatype(datatype);
    EXPECT_EQ(errorOf("inquireVar", {file(), 3}),
              cdflib("unrecognizedValue", datatype, "DATATYPE"));
  }
}

TEST_F(ExtensionTest, OtherModulesAreNotExtended) {
  ::ambrix::Module moved = std::move(module);
  EXPECT_TRUE(moved.extended());
  EXPECT_FALSE(module.extended());
  module = std::move(moved);
}

}  // namespace
}  // namespace ambrix_test
