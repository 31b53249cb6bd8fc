// What people read: every message has a sentence, and no values can upset it.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "adapters/catalogue/message_catalogue.h"
#include "adapters/catalogue/unicode.h"
#include "tests/support/known_messages.h"

namespace {

using ambrix::catalogue::messageText;
using testing::HasSubstr;
using testing::Not;
using TOLVEX::ambrix::MessageArg;
using TOLVEX::ambrix::MessageId;

constexpr const char* kCdflib = "TOLVEX:ambrix:cdflib";
constexpr const char* kValidate = "TOLVEX:ambrix:validate";

TEST(CatalogueTest, EveryMessageIsASentenceWithItsValuesInPlace) {
  for (const auto& message : ambrix_test::knownMessages()) {
    const std::string text = messageText(message.id);
    SCOPED_TRACE(text);
    EXPECT_THAT(text, Not(HasSubstr(message.id.identifier)));
    EXPECT_THAT(text, Not(HasSubstr("{")));
    EXPECT_GT(text.size(), message.shown.empty() ? 30U : 20U);
    std::size_t from = 0;
    for (const std::string& value : message.shown) {
      from = text.find(value, from);
      ASSERT_NE(from, std::string::npos) << value;
    }
  }
}

TEST(CatalogueTest, WordsTheLibrarysFailure) {
  EXPECT_EQ(messageText({kCdflib, "libraryFailure", {"CDFgetzVarName", "NO_SUCH_VAR: none."}}),
            "The CDF library reports in CDFgetzVarName: NO_SUCH_VAR: none.");
}

TEST(CatalogueTest, MissingAndFurtherValuesDoNoHarm) {
  for (const auto& message : ambrix_test::knownMessages()) {
    MessageId id = message.id;
    id.values.clear();
    const std::string bare = messageText(id);
    EXPECT_EQ(bare.find('?') != std::string::npos, !message.shown.empty()) << bare;
    id = message.id;
    id.values.insert(id.values.end(), 20, MessageArg("surplus"));
    EXPECT_EQ(messageText(id), messageText(message.id));
  }
}

TEST(CatalogueTest, ValuesMayBeOfAnyKind) {
  EXPECT_EQ(messageText({kCdflib, "libraryFailure", {std::int64_t{-5}, u"\u00e9\U0001F600"}}),
            "The CDF library reports in -5: \u00e9\U0001F600");
}

TEST(CatalogueTest, NarrowBytesAreTakenOverAndNeverReadAsPlaceholders) {
  EXPECT_EQ(messageText({kCdflib, "libraryFailure", {"{2}\xff", "{1}{"}}),
            "The CDF library reports in {2}\xff: {1}{");
}

TEST(CatalogueTest, AnUnknownMessageShowsItsIdentifierAndValues) {
  EXPECT_EQ(messageText({"X:y", "z", {1, "two", u"three"}}), "X:y:z: 1, two, three");
  EXPECT_EQ(messageText({"X:y", "z"}), "X:y:z");
  EXPECT_EQ(messageText({"", ""}), ":");
}

TEST(CatalogueTest, ComponentAndNameAreToldApart) {
  EXPECT_EQ(messageText({"TOLVEX:ambrix", "cdflib:fileOpenError"}),
            messageText({kCdflib, "fileOpenError"}));
  EXPECT_EQ(messageText({kValidate, "fileOpenError"}), "TOLVEX:ambrix:validate:fileOpenError");
}

TEST(UnicodeTest, UnpairedSurrogatesAreReplacedOneByOne) {
  EXPECT_EQ(ambrix::catalogue::toUtf8(u"a\xD800z\xDC00"), "a\uFFFDz\uFFFD");
  EXPECT_EQ(ambrix::catalogue::toUtf8(u"\xD800\xD83D\xDE00"), "\uFFFD\U0001F600");
  EXPECT_EQ(ambrix::catalogue::toUtf8(u"\xD800"), "\uFFFD");
  EXPECT_EQ(ambrix::catalogue::toUtf8(u""), "");
}

TEST(UnicodeTest, ValidTextConvertsBothWaysAndInvalidTextNot) {
  using ambrix::catalogue::toUtf16;
  using ambrix::catalogue::toValidUtf8;
  const std::u16string text = u"x\u00e9\u20ac\U0001F600";
  EXPECT_EQ(toValidUtf8(text), "x\u00e9\u20ac\U0001F600");
  EXPECT_EQ(toUtf16("x\u00e9\u20ac\U0001F600"), text);
  EXPECT_EQ(toUtf16(std::string_view("a\0b", 3)), std::u16string(u"a\0b", 3));
  for (const char16_t* bad : {u"\xD800", u"a\xDC00", u"\xD800z"})
    EXPECT_FALSE(toValidUtf8(bad));
  for (const char* bad : {"\xff", "\xc3", "\xed\xa0\x80", "\xc0\x80", "\xf5\x80\x80\x80"}) {
    EXPECT_FALSE(toUtf16(bad));
  }
}

}  // namespace
