// The constants that users see, restated.
#include "constants/constant_table.h"

#include <cctype>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using ConstantTableTest = ScriptedTest;

// In the order in which "getConstantNames" lists them.
const std::pair<std::string, double> kConstants[] = {
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

TEST_F(ConstantTableTest, NamesComeInByteOrderAsAColumnOfCells) {
  const Array names = result("getConstantNames");
  EXPECT_EQ(names.classId(), ClassId::kCell);
  EXPECT_THAT(names.size(), testing::ElementsAre(57, 1));
  for (std::size_t i = 0; i < std::size(kConstants); ++i)
    EXPECT_EQ(names.element(i).utf8(), kConstants[i].first);
}

TEST_F(ConstantTableTest, EachNameHasItsValueInAnyCase) {
  for (const auto& [name, value] : kConstants) {
    std::string lower = name;
    for (char& c : lower)
      c = static_cast<char>(std::tolower(c));
    for (const std::string& given : {name, lower}) {
      const Array found = result("getConstantValue", {given.c_str()});
      EXPECT_EQ(found.className(), std::string("double")) << given;
      EXPECT_EQ(found.data<double>()[0], value) << given;
    }
  }
  EXPECT_EQ(TOLVEX::ambrix::ConstantNameTable.size(), 57U);
}

TEST_F(ConstantTableTest, SpellingsOfTheGettersAreAccepted) {
  const std::pair<const char*, double> spellings[] = {
      {"READONLYon", -1},     {"READONLYoff", 0},    {"RLE_OF_ZEROs", 0},   {"VALIDATEFILEon", -1},
      {"BACKWARDFILEoff", 0}, {"BACKWARDFILEon", 1}, {"cdf_epoch16", 32.0},
  };
  for (const auto& [name, value] : spellings)
    EXPECT_EQ(result("getConstantValue", {name}).data<double>()[0], value) << name;
}

TEST_F(ConstantTableTest, UnknownNamesAreReportedInUpperCase) {
  EXPECT_EQ(errorOf("getConstantValue", {"cdf_int3"}),
            cdflib("unrecognizedConstantName", "CDF_INT3"));
  EXPECT_EQ(errorOf("getConstantValue", {" CDF_INT4"}),
            cdflib("unrecognizedConstantName", " CDF_INT4"));
  EXPECT_EQ(errorOf("getConstantValue", {"CDF_INT"}),
            cdflib("unrecognizedConstantName", "CDF_INT"));
  EXPECT_EQ(errorOf("getConstantValue", {""}), cdflib("unrecognizedConstantName", ""));
  EXPECT_EQ(errorOf("getConstantValue", {"\xE9\xB5"}),
            cdflib("unrecognizedConstantName", "\xE9\xB5"));
}

TEST_F(ConstantTableTest, UnsupportedDatatypesHaveNoName) {
  for (const char* name : {"CDF_INT8", "CDF_TIME_TT2000"})
    EXPECT_EQ(errorOf("getConstantValue", {name}), cdflib("unrecognizedConstantName", name));
}

TEST_F(ConstantTableTest, ANameThatIsNoTextIsALogicError) {
  EXPECT_EQ(errorOf("getConstantValue", {5}), "basic_string::_M_construct null not valid");
}

}  // namespace
}  // namespace ambrix_test
