// The table of constants and the commands over it.
#include "constants/constant_table.h"

#include <cctype>

#include "tests/support/constants.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using ConstantTableTest = ScriptedTest;

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
    for (const std::string& given : {std::string(name), lower}) {
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
