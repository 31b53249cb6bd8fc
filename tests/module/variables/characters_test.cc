// Characters on their way between the host's 16 bits and the bytes of a file.
#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

class CharactersTest : public ModuleTest {
 protected:
  /// Every character from 1 to 255, a zero alone at the end.
  static std::u16string everyByte() {
    std::u16string text;
    for (char16_t unit = 1; unit <= 0xFF; ++unit)
      text += unit;
    return text;
  }
  /// How they read: bytes are signed.
  static std::u16string everyByteAsRead() {
    std::u16string text = everyByte();
    for (char16_t& unit : text)
      unit = unit < 0x80 ? unit : static_cast<char16_t>(unit | 0xFF00);
    return text;
  }
  Given file = create();
};

TEST_F(CharactersTest, BytesAreWidenedAsSignedValuesByEveryReader) {
  for (const long datatype : {51L, 52L}) {
    const std::string name = "v" + std::to_string(datatype);
    const double variable =
        createVar(file, {.datatype = datatype, .elements = 255, .name = name.c_str()});
    results("putVarRecordData", {file, variable, 0, Array::text(everyByte())});
    EXPECT_EQ(result("getVarRecordData", {file, variable, 0}).text(), everyByteAsRead());
    EXPECT_EQ(result("getVarData", {file, variable, 0}).text(), everyByteAsRead());
    EXPECT_EQ(result("hyperGetVarData", {file, variable, 0, 1, 1, {}, {}, {}}).text(),
              everyByteAsRead());
  }
  results("close", {file});
  std::string bytes;
  for (int byte = 1; byte <= 0xFF; ++byte)
    bytes += static_cast<char>(byte);
  EXPECT_THAT(fileBytes("new.cdf"), testing::HasSubstr(bytes));
}

TEST_F(CharactersTest, WhatWasReadWritesBackTheSameBytes) {
  const double variable = createVar(file, {.datatype = 51, .elements = 255});
  results("putVarRecordData", {file, variable, 0, Array::text(everyByteAsRead())});
  EXPECT_EQ(result("getVarRecordData", {file, variable, 0}).text(), everyByteAsRead());
}

TEST_F(CharactersTest, OneCharacterMayBeAnyByteButZero) {
  const double variable = createVar(file, {.datatype = 52, .sizes = {255}});
  results("putVarRecordData", {file, variable, 0, Array::text(everyByte())});
  EXPECT_EQ(result("getVarRecordData", {file, variable, 0}).text(), everyByteAsRead());
}

TEST_F(CharactersTest, AZeroEndsAText) {
  const double variable = createVar(file, {.datatype = 51, .elements = 6});
  const Array text = Array::text(std::u16string_view(u"ab\0cde", 6));
  results("putVarRecordData", {file, variable, 0, text.clone()});
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}),
            "char 6x1 'ab" + library().behindZero(4) + "'");
}

TEST_F(CharactersTest, TextsOfARowMajorFileStandAsColumns) {
  const double variable = createVar(file, {.datatype = 51, .sizes = {2, 3}, .elements = 2});
  results("putVarRecordData", {file, variable, 0, "aabbccddeeff"});
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "char 2x2x3 'aabbccddeeff'");
  EXPECT_EQ(does("getVarData", {file, variable, 0, {1, 0}}), "char 2x1 'bb'");
  EXPECT_EQ(does("getVarData", {file, variable, 0, {0, 2}}), "char 2x1 'ee'");
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 1, 1, {1, 0}, {1, 2}, {1, 2}}),
            "char 2x1x2 'bbff'");
  results("close", {file});
  EXPECT_THAT(fileBytes("new.cdf"), testing::HasSubstr("aabbccddeeff"));
}

TEST_F(CharactersTest, TextsAreWrittenAsHyperslabs) {
  const double variable = createVar(file, {.datatype = 51, .sizes = {2}, .elements = 3});
  EXPECT_EQ(does("hyperPutVarData", {file, variable, 0, 2, 1, 0, 2, 1, "abcdefghijkl"}), "done");
  EXPECT_EQ(does("getVarRecordData", {file, variable, 1}), "char 3x2 'ghijkl'");
}

TEST_F(CharactersTest, UnwrittenTextsReadAsThePadValue) {
  const double variable = createVar(file, {.datatype = 51, .elements = 4});
  results("setVarPadValue", {file, variable, "none"});
  EXPECT_EQ(does("getVarData", {file, variable, 3}), "char 4x1 'none'");
}

}  // namespace
}  // namespace ambrix_test
