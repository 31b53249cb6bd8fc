// The stand-in for the CDF library is as strict as it must be.
#include "tests/support/fake_cdflib.h"

#include <cdf.h>
#include <gmock/gmock.h>
#include <gtest/gtest-spi.h>
#include <gtest/gtest.h>

namespace ambrix_test {
namespace {

using testing::ElementsAre;

class FakeCdflibTest : public testing::Test {
 protected:
  FakeCdflibTest() { fakeCdflib() = FakeCdflib(); }
  FakeCdflib& fake = fakeCdflib();
};

TEST_F(FakeCdflibTest, WritesCallsAsTheManualDoes) {
  long format = 0;
  const auto handle = reinterpret_cast<CDFid>(7L);
  fake.answer("CDF_FORMAT_", {2});
  EXPECT_EQ(CDFlib(SELECT_, CDF_, handle, zVAR_, 3L, GET_, CDF_FORMAT_, &format, NULL_), CDF_OK);
  EXPECT_EQ(format, 2);
  EXPECT_THAT(fake.calls(), ElementsAre("SELECT_ CDF_ 7 | zVAR_ 3 | GET_ CDF_FORMAT_"));
}

TEST_F(FakeCdflibTest, RefusesListsThatTheLibraryWouldNotUnderstand) {
  EXPECT_NONFATAL_FAILURE(CDFlib(GET_, 999L, NULL_), "would not understand");
  EXPECT_NONFATAL_FAILURE(CDFlib(PUT_, CDF_ENCODING_, 1L, NULL_), "would not understand");
  EXPECT_NONFATAL_FAILURE(CDFlib(CLOSE_, CDF_, 4000L, NULL_), "would not understand");
  EXPECT_NONFATAL_FAILURE(CDFlib(SELECT_, NULL_), "would not understand");
}

TEST_F(FakeCdflibTest, RefusesNullPointersForData) {
  EXPECT_NONFATAL_FAILURE(CDFputAttrEntry(nullptr, 1, 0, 0, 51, 1, nullptr), "null pointer");
  EXPECT_NONFATAL_FAILURE(CDFgetAttrEntry(nullptr, 1, 0, 0, nullptr), "null pointer");
  EXPECT_TRUE(fake.sawNullData());
}

TEST_F(FakeCdflibTest, FailsTheCallThatItIsToldToFail) {
  fake.failCall(2, -2013);
  EXPECT_EQ(CDFlib(CLOSE_, CDF_, NULL_), CDF_OK);
  EXPECT_EQ(CDFlib(CLOSE_, CDF_, NULL_), -2013);
  EXPECT_EQ(CDFlib(CLOSE_, CDF_, NULL_), CDF_OK);
}

}  // namespace
}  // namespace ambrix_test
