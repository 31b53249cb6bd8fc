// The values of attribute entries: every datatype, texts, and entries written by others.
#include <fstream>
#include <sstream>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with the global attribute 0.
class EntryValuesTest : public ModuleTest {
 protected:
  EntryValuesTest() { results("createAttr", {file, "G", 1}); }

  /// Writes the value, reads it back and inquires it, after the file was closed.
  std::string backOf(double datatype, const Given& value) {
    results("putAttrgEntry", {file, 0, 0, datatype, value});
    file = reopen(file);
    return does("getAttrgEntry", {file, 0, 0}) + "; " + does("inquireAttrgEntry", {file, 0, 0});
  }

  Given file = create();
};

TEST_F(EntryValuesTest, EveryDatatypeComesBackInItsClass) {
  EXPECT_EQ(backOf(1, row<std::int8_t>({-128, 127})),
            "int8 1x2 [-128 127]; char 1x8 'cdf_int1'; double 1x1 [2]");
  EXPECT_EQ(backOf(2, row<std::int16_t>({-32768, 32767})),
            "int16 1x2 [-32768 32767]; char 1x8 'cdf_int2'; double 1x1 [2]");
  EXPECT_EQ(backOf(4, row<std::int32_t>({-2147483647 - 1, 2147483647})),
            "int32 1x2 [-2147483648 2147483647]; char 1x8 'cdf_int4'; double 1x1 [2]");
  EXPECT_EQ(backOf(11, row<std::uint8_t>({255})),
            "uint8 1x1 [255]; char 1x9 'cdf_uint1'; double 1x1 [1]");
  EXPECT_EQ(backOf(12, row<std::uint16_t>({65535})),
            "uint16 1x1 [65535]; char 1x9 'cdf_uint2'; double 1x1 [1]");
  EXPECT_EQ(backOf(14, row<std::uint32_t>({4294967295})),
            "uint32 1x1 [4294967295]; char 1x9 'cdf_uint4'; double 1x1 [1]");
  EXPECT_EQ(backOf(21, row<float>({1.5F, -0.25F})),
            "single 1x2 [1.5 -0.25]; char 1x9 'cdf_real4'; double 1x1 [2]");
  EXPECT_EQ(backOf(22, {1.5, 1e300}),
            "double 1x2 [1.5 1.0000000000000001e+300]; char 1x9 'cdf_real8'; double 1x1 [2]");
  EXPECT_EQ(backOf(31, {63113904000000.0}),
            "double 1x1 [63113904000000]; char 1x9 'cdf_epoch'; double 1x1 [1]");
  EXPECT_EQ(backOf(41, row<std::int8_t>({-1})),
            "int8 1x1 [-1]; char 1x8 'cdf_byte'; double 1x1 [1]");
  EXPECT_EQ(backOf(44, row<float>({3})), "single 1x1 [3]; char 1x9 'cdf_float'; double 1x1 [1]");
  EXPECT_EQ(backOf(45, {-7}), "double 1x1 [-7]; char 1x10 'cdf_double'; double 1x1 [1]");
  EXPECT_EQ(backOf(51, "text"), "char 1x4 'text'; char 1x8 'cdf_char'; double 1x1 [4]");
  EXPECT_EQ(backOf(52, "text"), "char 1x4 'text'; char 1x9 'cdf_uchar'; double 1x1 [4]");
}

TEST_F(EntryValuesTest, Epoch16sArePairsOfDoubles) {
  EXPECT_EQ(backOf(32, {63113904000.0, 5, 63113904001.0, 6}),
            "double 2x2 [63113904000 5 63113904001 6]; char 1x11 'cdf_epoch16'; double 1x1 [2]");
  EXPECT_EQ(backOf(32, {1, 2, 3, 4, 5, 6}),
            "double 2x3 [1 2 3 4 5 6]; char 1x11 'cdf_epoch16'; double 1x1 [3]");
}

TEST_F(EntryValuesTest, AnyShapeIsWrittenInStorageOrderAndComesBackAsARow) {
  const std::initializer_list<double> values = {1, 2, 3, 4, 5, 6};
  EXPECT_EQ(backOf(45, Array::of<double>({std::data(values), 6}, {3, 2})),
            "double 1x6 [1 2 3 4 5 6]; char 1x10 'cdf_double'; double 1x1 [6]");
}

TEST_F(EntryValuesTest, TextsComeBackToTheLastCharacter) {
  EXPECT_EQ(backOf(51, "five "), "char 1x5 'five '; char 1x8 'cdf_char'; double 1x1 [5]");
  EXPECT_EQ(backOf(51, " "), "char 1x1 ' '; char 1x8 'cdf_char'; double 1x1 [1]");
}

TEST_F(EntryValuesTest, CharactersKeepTheirLowByteAndComeBackAsBytes) {
  const std::string expected = "char 1x3 'A\\xE9\\xAC'; ";
  EXPECT_EQ(backOf(51, Array::text(u"A\u00E9\u20AC")).substr(0, expected.size()), expected);
  EXPECT_EQ(backOf(52, Array::text(u"A\u00E9\u20AC")).substr(0, expected.size()), expected);
}

TEST_F(EntryValuesTest, EveryByteButZeroSurvives) {
  std::u16string text;
  for (char16_t unit = 1; unit <= 0xFF; ++unit)
    text += unit;
  for (const double datatype : {51, 52}) {
    results("putAttrgEntry", {file, 0, 0, datatype, Array::text(text)});
    file = reopen(file);
    EXPECT_EQ(result("getAttrgEntry", {file, 0, 0}).text(), text);
  }
}

TEST_F(EntryValuesTest, OnlyTheTextAsALongEntryIsKeptWhole) {
  const std::string text(100000, 'x');
  results("putAttrgEntry", {file, 0, 0, 51, text.c_str()});
  EXPECT_EQ(result("getAttrgEntry", {file, 0, 0}).utf8(), text);
}

TEST_F(EntryValuesTest, AnEmptyTextIsTheLibrarysToJudge) {
  for (const double datatype : {51, 52}) {
    const std::string put = does("putAttrgEntry", {file, 0, 0, datatype, ""});
    if (library().hasEmptyTextEntries()) {
      EXPECT_EQ(put, "done");
      EXPECT_EQ(does("getAttrgEntry", {file, 0, 0}), "char 0x0 ''");
    } else {
      EXPECT_EQ(put, refused("CDFputAttrgEntry", kBadNumElems));
    }
  }
}

TEST_F(EntryValuesTest, AnEmptyNumberIsRefused) {
  EXPECT_EQ(does("putAttrgEntry", {file, 0, 0, 45, {}}), refused("CDFputAttrgEntry", kBadNumElems));
  EXPECT_EQ(does("putAttrgEntry", {file, 0, 0, 32, {1}}),
            refused("CDFputAttrgEntry", kBadNumElems));
}

TEST_F(EntryValuesTest, TheValueStandsInTheFileInItsByteOrder) {
  results("putAttrgEntry", {file, 0, 0, 4, row<std::int32_t>({0x01020304, 0x05060708})});
  const bool bigEndian = result("inquire", {file}).utf8() == "NETWORK_ENCODING";
  results("close", {file});
  std::stringstream content;
  content << std::ifstream("new.cdf", std::ios::binary).rdbuf();
  const std::string big("\1\2\3\4\5\6\7\10", 8);
  const std::string little("\4\3\2\1\10\7\6\5", 8);
  EXPECT_THAT(content.str(), testing::HasSubstr(bigEndian ? big : little));
}

TEST_F(EntryValuesTest, EntriesOfOthersAreRead) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("getAttrgEntry", {example, 0, 0}), "char 1x9 'CDF title'");
  EXPECT_EQ(does("getAttrEntry", {example, 2, 0}), "char 1x11 'Hour/Minute'");
}

TEST_F(EntryValuesTest, NumbersOfOthersAreReadInTheirClasses) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double test = number("getAttrNum", {others, "Test"});
  const char* const entries[] = {"double 1x1 [5.3432000000000004]",
                                 "single 1x1 [5.5]",
                                 "single 1x2 [5.5 10.1999998]",
                                 "int8 1x1 [1]",
                                 "int8 1x3 [1 2 3]",
                                 "int16 1x1 [-32768]",
                                 "int16 1x2 [1 2]",
                                 "int32 1x1 [3]",
                                 "int32 1x2 [4 5]",
                                 "char 1x16 'This is a string'",
                                 "uint32 1x1 [4294967295]",
                                 "uint32 1x2 [4294967295 2147483648]",
                                 "uint16 1x1 [65535]",
                                 "uint16 1x2 [65535 65534]",
                                 "uint8 1x1 [255]",
                                 "uint8 1x2 [255 254]"};
  double entry = 0;
  for (const char* expected : entries) {
    EXPECT_EQ(does("getAttrgEntry", {others, test, entry}), expected);
    entry += entry == 0 ? 2 : 1;  // there is no entry 1
  }
  const double dummy = number("getAttrNum", {others, "dummy"});
  EXPECT_EQ(does("getAttrEntry", {others, dummy, 15}), "double 1x1 [63188467200000]");
  EXPECT_EQ(does("getAttrEntry", {others, dummy, 16}), "double 2x1 [63188521681 2003004005]");
}

TEST_F(EntryValuesTest, EntriesOfUnsupportedDatatypesAreRefusedBeforeTheyAreRead) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double dummy = number("getAttrNum", {others, "dummy"});
  const double tt2000 = number("getVarNum", {others, "tt2000"});
  EXPECT_EQ(does("getAttrEntry", {others, dummy, tt2000}), unrecognized(33, "DATATYPE"));
  EXPECT_EQ(does("inquireAttrEntry", {others, dummy, tt2000}), unrecognized(33, "DATATYPE"));
  const double testDate = number("getAttrNum", {others, "TestDate"});
  EXPECT_EQ(does("getAttrgEntry", {others, testDate, 2}), unrecognized(33, "DATATYPE"));
  EXPECT_EQ(does("getAttrgEntry", {others, testDate, 1}), "double 1x1 [63186912000000]");
}

}  // namespace
}  // namespace ambrix_test
