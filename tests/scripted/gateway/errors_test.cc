// Every error class: its component, its identifier, and the kinds and order of its values.
#include "gateway/errors.h"

#include "gateway/library_calls.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

namespace cdf = TOLVEX::ambrix::cdflib;
namespace check = TOLVEX::ambrix::validate;
using ErrorsTest = ScriptedTest;

const std::pair<TOLVEX::ambrix::MessageId, const char*> kErrors[] = {
    {cdf::badDimSpec(2, "v"), "cdflib:badDimSpec(2, 'v')"},
    {cdf::badDimensionExtent("v", 2), "cdflib:badDimensionExtent('v', 2)"},
    {cdf::badEpoch16Modulus(), "cdflib:badEpoch16Modulus()"},
    {cdf::badEpochVector(7), "cdflib:badEpochVector(7)"},
    {cdf::badPutAttrEntryDatatype("a", "b"), "cdflib:badPutAttrEntryDatatype('a', 'b')"},
    {cdf::badVarianceDatatype(), "cdflib:badVarianceDatatype()"},
    {cdf::cannotOmitDimSpec(), "cdflib:cannotOmitDimSpec()"},
    {cdf::datatypeMismatch("a", "b"), "cdflib:datatypeMismatch('a', 'b')"},
    {cdf::dimSizeTooLarge(), "cdflib:dimSizeTooLarge()"},
    {cdf::fileCreateError(), "cdflib:fileCreateError()"},
    {cdf::fileOpenError(), "cdflib:fileOpenError()"},
    {cdf::illegalEpochValue(), "cdflib:illegalEpochValue()"},
    {cdf::invalidCharError(), "cdflib:invalidCharError()"},
    {cdf::invalidCompressionParameter(12, "GZIP"),
     "cdflib:invalidCompressionParameter(12, 'GZIP')"},
    {cdf::invalidFileId(), "cdflib:invalidFileId()"},
    {cdf::invalidOperation("fly"), "cdflib:invalidOperation('fly')"},
    {cdf::libraryFailure("CDFx", "text"), "cdflib:libraryFailure('CDFx', 'text')"},
    {cdf::mismatchedVarianceSize(3, 2), "cdflib:mismatchedVarianceSize(3, 2)"},
    {cdf::unrecognizedConstantName("N"), "cdflib:unrecognizedConstantName('N')"},
    {cdf::unrecognizedValue(-1, "K"), "cdflib:unrecognizedValue(-1, 'K')"},
    {cdf::unspecifiedGzipCompressionLevel(), "cdflib:unspecifiedGzipCompressionLevel()"},
    {cdf::varCacheSizeOpInappropriate(), "cdflib:varCacheSizeOpInappropriate()"},
    {cdf::wrongNumberOfHyperPutVarDataElements("[ 3 ]", 2, "v", 6),
     "cdflib:wrongNumberOfHyperPutVarDataElements('[ 3 ]', 2, 'v', 6)"},
    {cdf::wrongNumberOfPadValueElements("v", 4), "cdflib:wrongNumberOfPadValueElements('v', 4)"},
    {cdf::wrongNumberOfPutVarDataElements("v", 1),
     "cdflib:wrongNumberOfPutVarDataElements('v', 1)"},
    {cdf::wrongNumberOfPutVarRecordDataElements("v", 12),
     "cdflib:wrongNumberOfPutVarRecordDataElements('v', 12)"},
    {cdf::closingFileHandle(), "cdflib:closingFileHandle()"},
    {check::argumentNotDoublePrecision("L"), "validate:argumentNotDoublePrecision('L')"},
    {check::argumentNotDoubleScalar("L"), "validate:argumentNotDoubleScalar('L')"},
    {check::argumentNotUint64Scalar("L"), "validate:argumentNotUint64Scalar('L')"},
    {check::argumentOutOfBounds(), "validate:argumentOutOfBounds()"},
    {check::wrongNumberOfInputs(), "validate:wrongNumberOfInputs()"},
};

TEST_F(ErrorsTest, IdentifiersKindsAndOrderAreFixed) {
  for (const auto& [error, text] : kErrors)
    EXPECT_EQ(messageText(error), std::string("TOLVEX:ambrix:") + text);
  EXPECT_EQ(std::size(kErrors), 26U + 5U + 1U);
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
