// Records that do not exist are read with a fill value, which the library looks for among the
// attributes. With CDF 3.9.1 that ended the process if an attribute had been selected before
// read-only mode was turned on.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

class ReadOnlyModeTest : public ModuleTest {
 protected:
  ReadOnlyModeTest() {
    Given file = create("filled");
    const double v = createVar(file, {.datatype = 22});
    results("createAttr", {file, "FILLVAL", 2});
    results("putAttrEntry", {file, 0, v, 22, 3});
    results("close", {file});
    file_ = open("filled");
  }
  std::string missing() { return does("getVarRecordData", {file_, 0, 5}); }

  Given file_;
};

TEST_F(ReadOnlyModeTest, CanBeTurnedOnAfterAttributesWereLookedAt) {
  const std::string before = missing();
  results("getAttrName", {file_, 0});
  results("setReadOnlyMode", {file_, -1});
  EXPECT_EQ(missing(), before);
  EXPECT_EQ(does("getVarData", {file_, 0, 5}), before);
  EXPECT_EQ(does("hyperGetVarData", {file_, 0, 5, 1, 1, {}, {}, {}}), before);
}

TEST_F(ReadOnlyModeTest, CanBeTurnedOffAndOnAgain) {
  const std::string before = missing();
  for (const double mode : {-1.0, 0.0, -1.0}) {
    results("setReadOnlyMode", {file_, mode});
    EXPECT_EQ(missing(), before) << mode;
  }
}

TEST_F(ReadOnlyModeTest, NeedsNoAttributes) {
  const Given written = create("bare");
  createVar(written, {.datatype = 22});
  const Given file = reopen(written, "bare");
  EXPECT_EQ(does("setReadOnlyMode", {file, -1}), "done");
  EXPECT_EQ(does("getReadOnlyMode", {file}), "char 1x10 'READONLYon'");
}

}  // namespace
}  // namespace ambrix_test
