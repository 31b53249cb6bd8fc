// Names and values of the constants, as users see them.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using ConstantsTest = ModuleTest;

struct Constant {
  const char* name;
  int value;
};

// In the order in which "getConstantNames" gives them.
const Constant kConstants[] = {
    {"AHUFF_COMPRESSION", 3},
    {"ALPHAMVSD_ENCODING", 14},
    {"ALPHAMVSG_ENCODING", 15},
    {"ALPHAMVSI_ENCODING", 16},
    {"ALPHAOSF1_ENCODING", 13},
    {"BACKWARDFILEOFF", 0},
    {"BACKWARDFILEON", 1},
    {"CDF_BYTE", 41},
    {"CDF_CHAR", 51},
    {"CDF_DOUBLE", 45},
    {"CDF_EPOCH", 31},
    {"CDF_EPOCH16", 32},
    {"CDF_FLOAT", 44},
    {"CDF_INT1", 1},
    {"CDF_INT2", 2},
    {"CDF_INT4", 4},
    {"CDF_REAL4", 21},
    {"CDF_REAL8", 22},
    {"CDF_UCHAR", 52},
    {"CDF_UINT1", 11},
    {"CDF_UINT2", 12},
    {"CDF_UINT4", 14},
    {"COLUMN_MAJOR", 2},
    {"DECSTATION_ENCODING", 4},
    {"GLOBAL_SCOPE", 1},
    {"GZIP_COMPRESSION", 5},
    {"HOST_ENCODING", 8},
    {"HP_ENCODING", 11},
    {"HUFF_COMPRESSION", 2},
    {"IBMPC_ENCODING", 6},
    {"IBMRS_ENCODING", 7},
    {"MAC_ENCODING", 9},
    {"MD5_CHECKSUM", 1},
    {"MULTI_FILE", 2},
    {"NETWORK_ENCODING", 1},
    {"NEXT_ENCODING", 12},
    {"NOVARY", 0},
    {"NO_CHECKSUM", 0},
    {"NO_COMPRESSION", 0},
    {"NO_SPARSERECORDS", 0},
    {"OPTIMAL_ENCODING_TREES", 0},
    {"OTHER_CHECKSUM", 2},
    {"PAD_SPARSERECORDS", 1},
    {"PREV_SPARSERECORDS", 2},
    {"READONLYOFF", 0},
    {"READONLYON", -1},
    {"RLE_COMPRESSION", 1},
    {"RLE_OF_ZEROS", 0},
    {"ROW_MAJOR", 1},
    {"SGI_ENCODING", 5},
    {"SINGLE_FILE", 1},
    {"SUN_ENCODING", 2},
    {"VALIDATEFILEOFF", 0},
    {"VALIDATEFILEON", -1},
    {"VARIABLE_SCOPE", 2},
    {"VARY", -1},
    {"VAX_ENCODING", 3},
};
static_assert(std::size(kConstants) == 57);

std::string unknown(const std::string& name) {
  return cdflib("unrecognizedConstantName", name);
}

TEST_F(ConstantsTest, NamesAreAColumnOfCellsInByteOrder) {
  const Array names = result("getConstantNames");
  EXPECT_EQ(names.classId(), ClassId::kCell);
  EXPECT_THAT(names.size(), testing::ElementsAre(57, 1));
  for (std::size_t i = 0; i < std::size(kConstants); ++i)
    EXPECT_EQ(names.element(i).utf8(), kConstants[i].name);
}

TEST_F(ConstantsTest, EveryNameHasItsValueAsADouble) {
  for (const Constant& constant : kConstants) {
    EXPECT_EQ(does("getConstantValue", {constant.name}),
              "double 1x1 [" + std::to_string(constant.value) + "]")
        << constant.name;
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

TEST_F(ConstantsTest, TheNumberOfArgumentsIsChecked) {
  EXPECT_EQ(does("getConstantNames", {"x"}), kWrongNumberOfInputs);
  EXPECT_EQ(does("getConstantValue"), kWrongNumberOfInputs);
}

}  // namespace
}  // namespace ambrix_test
