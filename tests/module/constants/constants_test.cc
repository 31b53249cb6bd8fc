// Names and values of the constants, as users see them.
#include "tests/support/constants.h"

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using ConstantsTest = ModuleTest;

std::string unknown(const std::string& name) {
  return cdflib("unrecognizedConstantName", name);
}

TEST_F(ConstantsTest, NamesAreAColumnOfCellsInByteOrder) {
  const Array names = result("getConstantNames");
  EXPECT_EQ(names.classId(), ClassId::kCell);
  EXPECT_THAT(names.size(), testing::ElementsAre(57, 1));
  for (std::size_t i = 0; i < std::size(kConstants); ++i)
    EXPECT_EQ(names.element(i).utf8(), kConstants[i].first);
}

TEST_F(ConstantsTest, EveryNameHasItsValueAsADouble) {
  for (const auto& [name, value] : kConstants) {
    EXPECT_EQ(does("getConstantValue", {name}), "double 1x1 [" + std::to_string(value) + "]")
        << name;
  }
}

TEST_F(ConstantsTest, TheCaseOfANameDoesNotMatter) {
  EXPECT_EQ(does("getConstantValue", {"cdf_epoch16"}), "double 1x1 [32]");
  EXPECT_EQ(does("getConstantValue", {"READONLYon"}), "double 1x1 [-1]");
  EXPECT_EQ(does("getConstantValue", {"readonlyon"}), "double 1x1 [-1]");
  EXPECT_EQ(does("getConstantValue", {"RLE_OF_ZEROs"}), "double 1x1 [0]");
  EXPECT_EQ(does("getConstantValue", {"VALIDATEFILEon"}), "double 1x1 [-1]");
  EXPECT_EQ(does("getConstantValue", {"Gzip_Compression"}), "double 1x1 [5]");
}

TEST_F(ConstantsTest, AnUnknownNameIsReportedInUpperCase) {
  EXPECT_EQ(does("getConstantValue", {"cdf_int3"}), unknown("CDF_INT3"));
  EXPECT_EQ(does("getConstantValue", {""}), unknown(""));
  EXPECT_EQ(does("getConstantValue", {" CDF_INT4"}), unknown(" CDF_INT4"));
  EXPECT_EQ(does("getConstantValue", {"CDF_INT4 "}), unknown("CDF_INT4 "));
  EXPECT_EQ(does("getConstantValue", {"CDF_INT"}), unknown("CDF_INT"));
  EXPECT_EQ(does("getConstantValue", {"CDF_INT8"}), unknown("CDF_INT8"));
  EXPECT_EQ(does("getConstantValue", {"CDF_TIME_TT2000"}), unknown("CDF_TIME_TT2000"));
}

TEST_F(ConstantsTest, BytesBeyondAsciiKeepTheirCase) {
  EXPECT_EQ(does("getConstantValue", {Array::text(u"caf\u00E9")}), unknown("CAF\xE9"));
}

TEST_F(ConstantsTest, Encoding10HasNoName) {
  const Array names = result("getConstantNames");
  for (std::size_t i = 0; i < names.elementCount(); ++i) {
    EXPECT_NE(number("getConstantValue", {Array::copyOf(names.element(i))}), 10);
  }
}

}  // namespace
}  // namespace ambrix_test
