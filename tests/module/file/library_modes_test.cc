// The modes of the library as a whole.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using LibraryModesTest = ModuleTest;

TEST_F(LibraryModesTest, ValidationIsOnUntilItIsSwitchedOff) {
  EXPECT_EQ(does("getValidate"), "char 1x14 'VALIDATEFILEon'");
  EXPECT_EQ(does("setValidate", {0}), "done");
  EXPECT_EQ(does("getValidate"), "char 1x15 'VALIDATEFILEoff'");
  EXPECT_EQ(does("setValidate", {-1}), "done");
  EXPECT_EQ(does("getValidate"), "char 1x14 'VALIDATEFILEon'");
}

TEST_F(LibraryModesTest, SetValidateTakesMinusOneForOnAndRefusesOne) {
  for (const long mode : {1L, 2L, -2L, 4294967296L, 4294967295L}) {
    EXPECT_EQ(does("setValidate", {static_cast<double>(mode)}),
              unrecognized(mode, "file validation mode"));
  }
  EXPECT_EQ(does("getValidate"), "char 1x14 'VALIDATEFILEon'");
}

TEST_F(LibraryModesTest, BackwardFilesAreSwitchedOnWithOne) {
  EXPECT_EQ(does("getFileBackward"), "char 1x15 'BACKWARDFILEoff'");
  EXPECT_EQ(does("setFileBackward", {1}), "done");
  EXPECT_EQ(does("getFileBackward"), "char 1x14 'BACKWARDFILEon'");
  EXPECT_EQ(does("setFileBackward", {0}), "done");
  EXPECT_EQ(does("getFileBackward"), "char 1x15 'BACKWARDFILEoff'");
}

TEST_F(LibraryModesTest, SetFileBackwardRefusesEverythingButZeroAndOne) {
  for (const long mode : {2L, -1L, 4294967296L, 4294967297L}) {
    EXPECT_EQ(does("setFileBackward", {static_cast<double>(mode)}),
              unrecognized(mode, "BACKWARD MODE"));
  }
  EXPECT_EQ(does("getFileBackward"), "char 1x15 'BACKWARDFILEoff'");
}

TEST_F(LibraryModesTest, BackwardFilesAreOfVersion27) {
  results("setFileBackward", {1});
  const Given file = create("old");
  EXPECT_EQ(does("createVar", {file, "t", 32, 1, {}, -1, {}}),
            refused("CDFcreatezVar", kBadDataType));
  createVar(file, {});
  results("close", {file});
  EXPECT_EQ(does("getVersion", {open("old")}).substr(0, 31), "double 1x1 [2]; double 1x1 [7];");
}

}  // namespace
}  // namespace ambrix_test
