// What files and the library say of themselves.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using FileInquiryTest = ScriptedTest;

const char* const kInquire =
    "SELECT_ CDF_ 7 | GET_ rVARs_NUMDIMS_ | rVARs_DIMSIZES_ | CDF_ENCODING_ | CDF_MAJORITY_ | "
    "rVARs_MAXREC_ | CDF_NUMrVARS_ | zVARs_MAXREC_ | CDF_NUMzVARS_ | CDF_NUMATTRS_";

TEST_F(FileInquiryTest, InquireReturnsEncodingMajorityAndThreeNumbers) {
  fake.answer("CDF_ENCODING_", {6});
  fake.answer("CDF_MAJORITY_", {1});
  fake.answer("rVARs_MAXREC_", {99});
  fake.answer("CDF_NUMrVARS_", {98});
  fake.answer("rVARs_NUMDIMS_", {10});
  fake.answer("rVARs_DIMSIZES_", Numbers(10, 97));
  fake.answer("zVARs_MAXREC_", {-1});
  fake.answer("CDF_NUMzVARS_", {5});
  fake.answer("CDF_NUMATTRS_", {12});
  EXPECT_THAT(shown(call("inquire", {file()})),
              ElementsAre("char 1x14 'IBMPC_ENCODING'", "char 1x9 'ROW_MAJOR'", "double 1x1 [-1]",
                          "double 1x1 [5]", "double 1x1 [12]"));
  EXPECT_THAT(calls(), ElementsAre(kInquire));
}

TEST_F(FileInquiryTest, EncodingsHaveTheModulesOwnNames) {
  const std::pair<long, const char*> encodings[] = {
      {1, "NETWORK_ENCODING"},    {2, "SUN_ENCODING"},        {3, "VAX_ENCODING"},
      {4, "DECSTATION_ENCODING"}, {5, "SGI_ENCODING"},        {6, "IBMPC_ENCODING"},
      {7, "IBMRS_ENCODING"},      {8, "HOST_ENCODING"},       {9, "MAC_ENCODING"},
      {11, "HP_ENCODING"},        {12, "NEXT_ENCODING"},      {13, "ALPHAOSF1_ENCODING"},
      {14, "ALPHAMVSD_ENCODING"}, {15, "ALPHAMVSG_ENCODING"}, {16, "ALPHAMVSI_ENCODING"}};
  fake.answer("CDF_MAJORITY_", {2});
  for (const auto& [number, name] : encodings) {
    fake.answer("CDF_ENCODING_", {number});
    EXPECT_EQ(result("inquire", {file()}).utf8(), name);
  }
}

TEST_F(FileInquiryTest, OtherEncodingsAreUnrecognized) {
  fake.answer("CDF_MAJORITY_", {2});
  for (const long number : {17L, 18L, 10L, 0L, -1L}) {
    fake.answer("CDF_ENCODING_", {number});
    EXPECT_EQ(errorOf("inquire", {file()}), unrecognized(number, "ENCODING"));
  }
}

TEST_F(FileInquiryTest, AnUnknownMajorityIsUnrecognized) {
  fake.answer("CDF_ENCODING_", {1});
  fake.answer("CDF_MAJORITY_", {3});
  EXPECT_EQ(errorOf("inquire", {file()}), unrecognized(3, "MAJORITY"));
}

TEST_F(FileInquiryTest, TheEncodingIsLookedAtBeforeTheMajority) {
  fake.answer("CDF_ENCODING_", {17});
  fake.answer("CDF_MAJORITY_", {3});
  EXPECT_EQ(errorOf("inquire", {file()}), unrecognized(17, "ENCODING"));
}

TEST_F(FileInquiryTest, GetVersionReturnsThreeDoubles) {
  fake.answer("CDF_VERSION_", {3});
  fake.answer("CDF_RELEASE_", {6});
  fake.answer("CDF_INCREMENT_", {2});
  EXPECT_THAT(shown(call("getVersion", {file()})),
              ElementsAre("double 1x1 [3]", "double 1x1 [6]", "double 1x1 [2]"));
  EXPECT_THAT(calls(),
              ElementsAre("SELECT_ CDF_ 7 | GET_ CDF_VERSION_ | CDF_RELEASE_ | CDF_INCREMENT_"));
}

TEST_F(FileInquiryTest, GetLibraryVersionFetchesTheSubIncrementAndKeepsItBack) {
  fake.answer("LIB_VERSION_", {3});
  fake.answer("LIB_RELEASE_", {9});
  fake.answer("LIB_INCREMENT_", {1});
  EXPECT_THAT(shown(call("getLibraryVersion")),
              ElementsAre("double 1x1 [3]", "double 1x1 [9]", "double 1x1 [1]"));
  EXPECT_THAT(calls(),
              ElementsAre("GET_ LIB_VERSION_ | LIB_RELEASE_ | LIB_INCREMENT_ | LIB_subINCREMENT_"));
}

TEST_F(FileInquiryTest, GetNameConfirmsTheName) {
  const std::string longest(512, 'n');
  fake.answerText("CDF_NAME_", longest);
  EXPECT_EQ(result("getName", {file()}).utf8(), longest);
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CONFIRM_ CDF_NAME_"));
}

TEST_F(FileInquiryTest, CopyrightsComeAsTheyAreLineBreaksIncluded) {
  const std::string text = "\nCommon Data Format\n" + std::string(236, 'c');
  fake.answerText("CDF_COPYRIGHT_", text);
  EXPECT_EQ(result("getCopyright", {file()}).utf8(), text);
  fake.answerText("LIB_COPYRIGHT_", text);
  EXPECT_EQ(result("getLibraryCopyright").utf8(), text);
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | GET_ CDF_COPYRIGHT_", "GET_ LIB_COPYRIGHT_"));
}

TEST_F(FileInquiryTest, AnEmptyTextIsAnEmptyArray) {
  EXPECT_EQ(shown(result("getCopyright", {file()})), "char 0x0 ''");
}

}  // namespace
}  // namespace ambrix_test
