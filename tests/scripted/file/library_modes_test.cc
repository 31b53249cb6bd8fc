// The two modes of the library as a whole.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using LibraryModesTest = ScriptedTest;

TEST_F(LibraryModesTest, GetValidateKnowsOneAsOnAndZeroAsOff) {
  fake.answer("CDFgetValidate", {1});
  EXPECT_EQ(result("getValidate").utf8(), "VALIDATEFILEon");
  fake.answer("CDFgetValidate", {0});
  EXPECT_EQ(result("getValidate").utf8(), "VALIDATEFILEoff");
  EXPECT_THAT(calls(), ElementsAre("CDFgetValidate", "CDFgetValidate"));
}

TEST_F(LibraryModesTest, GetValidateDoesNotKnowMinusOneAlthoughSetValidateTakesIt) {
  fake.answer("CDFgetValidate", {-1});
  EXPECT_EQ(errorOf("getValidate"), unrecognized(-1, "VALIDATION MODE"));
  EXPECT_THAT(call("setValidate", {-1}), IsEmpty());
}

TEST_F(LibraryModesTest, GetFileBackwardNamesTheMode) {
  fake.answer("CDFgetFileBackward", {1});
  EXPECT_EQ(result("getFileBackward").utf8(), "BACKWARDFILEon");
  fake.answer("CDFgetFileBackward", {0});
  EXPECT_EQ(result("getFileBackward").utf8(), "BACKWARDFILEoff");
  for (const long mode : {-1L, 2L}) {
    fake.answer("CDFgetFileBackward", {mode});
    EXPECT_EQ(errorOf("getFileBackward"), unrecognized(mode, "BACKWARDS FILE MODE"));
  }
}

TEST_F(LibraryModesTest, ANegativeModeIsNoStatus) {
  fake.answer("CDFgetValidate", {-2013});
  EXPECT_EQ(errorOf("getValidate"), unrecognized(-2013, "VALIDATION MODE"));
  EXPECT_THAT(fake.statusCalls(), IsEmpty());
}

TEST_F(LibraryModesTest, SetValidateTakesZeroAndMinusOneOnly) {
  EXPECT_THAT(call("setValidate", {0}), IsEmpty());
  EXPECT_THAT(call("setValidate", {-1.9}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("CDFsetValidate 0", "CDFsetValidate -1"));
  for (const long mode : {1L, 2L, -2L}) {
    EXPECT_EQ(errorOf("setValidate", {static_cast<double>(mode)}),
              unrecognized(mode, "file validation mode"));
  }
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(LibraryModesTest, SetFileBackwardTakesZeroAndOneOnly) {
  EXPECT_THAT(call("setFileBackward", {0}), IsEmpty());
  EXPECT_THAT(call("setFileBackward", {1}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("CDFsetFileBackward 0", "CDFsetFileBackward 1"));
  for (const long mode : {2L, -1L, 4294967297L}) {
    EXPECT_EQ(errorOf("setFileBackward", {static_cast<double>(mode)}),
              unrecognized(mode, "BACKWARD MODE"));
  }
  EXPECT_THAT(calls(), IsEmpty());
}

}  // namespace
}  // namespace ambrix_test
