// Every error class: its component, its identifier, and the kinds and order of its values.
#include "gateway/errors.h"

#include "gateway/library_calls.h"
#include "tests/support/known_messages.h"
#include "tests/support/raised_errors.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

namespace cdf = TOLVEX::ambrix::cdflib;
using ErrorsTest = ScriptedTest;

TEST_F(ErrorsTest, IdentifiersKindsAndOrderAreFixed) {
  std::vector<std::string> made, known;
  for (const ErrorMaker& make : errorMakers())
    made.push_back(messageText(make("first", "second")));
  for (const KnownMessage& message : knownMessages()) {
    if (message.id.component != "TOLVEX:host") known.push_back(messageText(message.id));
  }
  EXPECT_EQ(made, known);
  EXPECT_EQ(made.size(), 26U + 5U + 1U);
}

TEST_F(ErrorsTest, BadDimSpecAndBadDimensionExtentHaveTheirValuesInOppositeOrder) {
  EXPECT_EQ(cdf::badDimSpec(2, "v").values[0], TOLVEX::ambrix::MessageArg(2));
  EXPECT_EQ(cdf::badDimensionExtent("v", 2).values[1], TOLVEX::ambrix::MessageArg(2));
}

TEST_F(ErrorsTest, AFreshValueIsTheIntegerZero) {
  EXPECT_EQ(TOLVEX::ambrix::MessageArg(), TOLVEX::ambrix::MessageArg(0));
}

TEST_F(ErrorsTest, EveryStatusOfZeroOrMorePasses) {
  for (const long status : {0L, 1L, 1003L})
    EXPECT_NO_THROW(TOLVEX::ambrix::checkLibraryStatus(status, "CDFx"));
  EXPECT_THAT(fake.statusCalls(), testing::IsEmpty());
}

TEST_F(ErrorsTest, EveryNegativeStatusFailsWithTheLibrarysText) {
  for (const long status : {-1L, -1007L, -2013L}) {
    try {
      TOLVEX::ambrix::checkLibraryStatus(status, "CDFx");
      FAIL() << status;
    } catch (const ::ambrix::Error& error) {
      EXPECT_EQ(messageText(error.id()), libraryFailure("CDFx", status));
    }
  }
  EXPECT_EQ(fake.statusCalls().back(), "SELECT_ CDF_STATUS_ -2013 | GET_ STATUS_TEXT_");
}

}  // namespace
}  // namespace ambrix_test
