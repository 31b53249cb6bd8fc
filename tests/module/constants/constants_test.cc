// Names and values of the constants, as users see them.
#include "tests/support/constants.h"

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using ConstantsTest = ModuleTest;

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

}  // namespace
}  // namespace ambrix_test
