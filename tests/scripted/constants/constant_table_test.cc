// The table of constants and the commands over it.
#include "constants/constant_table.h"

#include <cctype>
#include <clocale>
#include <cstdlib>
#include <filesystem>

#include "tests/support/constants.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using ConstantTableTest = ScriptedTest;

/// While it lives, characters are those of German in ISO 8859-1, if the locale could be made.
class LatinLocale {
 public:
  LatinLocale() {
    const std::string folder = testing::TempDir() + "ambrix_locale";
    std::filesystem::create_directories(folder);
    const std::string make =
        "localedef -i de_DE -f ISO-8859-1 '" + folder + "/latin' >/dev/null 2>&1";
    const bool made = std::system(make.c_str()) == 0;
    setenv("LOCPATH", folder.c_str(), 1);
    isSet_ = made && std::setlocale(LC_CTYPE, "latin") != nullptr;
    unsetenv("LOCPATH");
    std::filesystem::remove_all(folder);
  }
  ~LatinLocale() { std::setlocale(LC_CTYPE, "C"); }
  LatinLocale(const LatinLocale&) = delete;
  LatinLocale& operator=(const LatinLocale&) = delete;

  [[nodiscard]] bool isSet() const { return isSet_; }

 private:
  bool isSet_ = false;
};

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

TEST_F(ConstantTableTest, TheUpperCaseIsThatOfTheLocale) {
  const LatinLocale latin;
  if (!latin.isSet()) GTEST_SKIP() << "localedef can't make de_DE (package locales)";
  EXPECT_EQ(errorOf("getConstantValue", {"vary\xE9\xFF\x80"}),
            cdflib("unrecognizedConstantName", "VARY\xC9\xFF\x80"));
  EXPECT_EQ(result("getConstantValue", {"vary"}).data<double>()[0], -1);
}

TEST_F(ConstantTableTest, UnsupportedDatatypesHaveNoName) {
  for (const char* name : {"CDF_INT8", "CDF_TIME_TT2000"})
    EXPECT_EQ(errorOf("getConstantValue", {name}), cdflib("unrecognizedConstantName", name));
}

}  // namespace
}  // namespace ambrix_test
