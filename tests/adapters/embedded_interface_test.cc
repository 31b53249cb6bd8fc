// The array interface as a module sees it.
#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <limits>
#include <string>

#include "host/qvh.h"

namespace {

using ambrix::Array;
using testing::ElementsAre;

class EmbeddedInterfaceTest : public testing::Test {
 protected:
  void TearDown() override { EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{}); }
};

Array numbers(std::initializer_list<std::size_t> sizes, qvClassID classId = qvDOUBLE_CLASS) {
  return Array::adopt(qvCreateNumericArray(sizes.size(), std::data(sizes), classId, qvREAL));
}

std::string identifierOf(const std::function<void()>& action) {
  try {
    action();
  } catch (const ambrix::Error& error) {
    return error.identifier();
  }
  return "no error";
}

TEST_F(EmbeddedInterfaceTest, TellsClassNameSizesAndElements) {
  const Array array = numbers({2, 3, 4, 1}, qvUINT16_CLASS);
  EXPECT_EQ(qvGetClassID(array.handle()), qvUINT16_CLASS);
  EXPECT_STREQ(qvGetClassName(array.handle()), "uint16");
  EXPECT_EQ(qvGetNumberOfElements(array.handle()), 24U);
  EXPECT_EQ(qvGetNumberOfDimensions(array.handle()), 3U);
  EXPECT_THAT(std::vector(qvGetDimensions(array.handle()), qvGetDimensions(array.handle()) + 3),
              ElementsAre(2, 3, 4));
  EXPECT_EQ(qvGetReadOnlyData(array.handle()), array.bytes().data());
}

TEST_F(EmbeddedInterfaceTest, NewArraysAreZero) {
  const Array matrix = Array::adopt(qvCreateNumericMatrix(2, 500, qvINT32_CLASS, qvREAL));
  EXPECT_THAT(matrix.data<std::int32_t>(), testing::Each(0));
  const std::size_t sizes[] = {3, 1};
  const Array logical = Array::adopt(qvCreateLogicalArray(2, sizes));
  EXPECT_THAT(logical.data<bool>(), ElementsAre(false, false, false));
  EXPECT_EQ(qvGetLogicals(logical.handle()), logical.data<bool>().data());
  EXPECT_EQ(Array::adopt(qvCreateDoubleScalar(-0.5)).data<double>()[0], -0.5);
}

TEST_F(EmbeddedInterfaceTest, UnsetArraysCanBeWritten) {
  const std::size_t sizes[] = {2, 1};
  qvArray* const raw = qvCreateUninitNumericArray(2, sizes, qvSINGLE_CLASS, qvREAL);
  const Array array = Array::adopt(raw);
  const float values[] = {1.5F, 2.5F};
  std::memcpy(qvGetData(raw), values, sizeof(values));
  EXPECT_THAT(array.data<float>(), ElementsAre(1.5F, 2.5F));
  qvArray* const chars = qvCreateCharArray(2, sizes);
  const Array text = Array::adopt(chars);
  qvGetChars(chars)[0] = u'x';
  qvGetChars(chars)[1] = u'\u20ac';
  EXPECT_EQ(text.text(), u"x\u20ac");
  EXPECT_EQ(qvGetReadOnlyChars(chars), qvGetReadOnlyData(chars));
}

TEST_F(EmbeddedInterfaceTest, OneDimensionMakesAColumn) {
  EXPECT_THAT(numbers({4}).size(), ElementsAre(4, 1));
  EXPECT_THAT(numbers({}).size(), ElementsAre(0, 0));
}

TEST_F(EmbeddedInterfaceTest, OnlyRealNumbersAreNumeric) {
  const std::size_t sizes[] = {1, 1};
  EXPECT_THROW(qvCreateNumericArray(2, sizes, qvCHAR_CLASS, qvREAL), std::logic_error);
  EXPECT_THROW(qvCreateNumericArray(2, sizes, qvCELL_CLASS, qvREAL), std::logic_error);
  EXPECT_THROW(qvCreateNumericMatrix(1, 1, qvDOUBLE_CLASS, qvCOMPLEX), std::logic_error);
}

TEST_F(EmbeddedInterfaceTest, AccessorsOfOtherClassesGiveNull) {
  const Array number = numbers({1, 1});
  EXPECT_EQ(qvGetLogicals(number.handle()), nullptr);
  EXPECT_EQ(qvGetReadOnlyChars(number.handle()), nullptr);
  EXPECT_EQ(qvGetCell(number.handle(), 0), nullptr);
  EXPECT_EQ(qvGetReadOnlyData(Array::cell({1, 1}).handle()), nullptr);
  EXPECT_EQ(qvArrayToString(number.handle()), nullptr);
}

TEST_F(EmbeddedInterfaceTest, NegativeSizesAreRefusedBeforeAnythingElse) {
  const std::size_t minusOne = std::numeric_limits<std::size_t>::max();
  const std::size_t mostNegative = std::size_t{1} << 63U;
  for (const std::size_t bad : {minusOne, mostNegative}) {
    EXPECT_EQ(identifierOf([&] { numbers({0, bad}); }), "TOLVEX:host:badDimension");
    EXPECT_EQ(identifierOf([&] {
                numbers({mostNegative - 1, mostNegative - 1, bad});
              }),
              "TOLVEX:host:badDimension");
    EXPECT_EQ(identifierOf([&] { (void)qvCreateCellMatrix(bad, 1); }), "TOLVEX:host:badDimension");
    EXPECT_EQ(identifierOf([&] { (void)qvCreateCharArray(1, &bad); }), "TOLVEX:host:badDimension");
  }
}

TEST_F(EmbeddedInterfaceTest, SizesThatOverflowOrCannotBeHadAreOutOfMemory) {
  const std::size_t half = std::size_t{1} << 32U;
  EXPECT_EQ(identifierOf([&] { numbers({half, half}); }), "TOLVEX:host:outOfMemory");
  EXPECT_EQ(identifierOf([&] { numbers({half, half / 8}); }), "TOLVEX:host:outOfMemory");
  EXPECT_EQ(identifierOf([&] { numbers({half, half / 64}); }), "TOLVEX:host:outOfMemory");
  EXPECT_EQ(identifierOf([&] { (void)qvCreateCellMatrix(half, half / 16); }),
            "TOLVEX:host:outOfMemory");
  EXPECT_THAT(numbers({half, half, 0}).size(), ElementsAre(half, half, 0));
}

TEST_F(EmbeddedInterfaceTest, StringsWidenBytes) {
  EXPECT_EQ(Array::adopt(qvCreateString("a\xff")).text(), u"a\u00ff");
  EXPECT_THAT(Array::adopt(qvCreateString("ab")).size(), ElementsAre(1, 2));
  EXPECT_THAT(Array::adopt(qvCreateString("")).size(), ElementsAre(0, 0));
}

TEST_F(EmbeddedInterfaceTest, NarrowCopiesKeepTheLowBits) {
  char* const copy = qvArrayToString(Array::text(u"a\u0161\u20ac").handle());
  EXPECT_STREQ(copy, "a\x61\xac");
  qvFree(copy);
  char* const empty = qvArrayToString(Array::text(u"").handle());
  EXPECT_STREQ(empty, "");
  qvFree(empty);
}

TEST_F(EmbeddedInterfaceTest, FileNamesAreUtf8) {
  char* const name = qvUtf16ToNarrow(u"\u00e9\U0001F600", 3);
  EXPECT_STREQ(name, "\u00e9\U0001F600");
  qvFree(name);
  EXPECT_EQ(qvUtf16ToNarrow(u"a\xD800", 2), nullptr);
  EXPECT_EQ(qvUtf16ToNarrow(u"\xDC00z", 2), nullptr);
}

TEST_F(EmbeddedInterfaceTest, CellsTakeOverTheirValues) {
  qvArray* const raw = qvCreateCellMatrix(2, 1);
  const Array cell = Array::adopt(raw);
  qvArray* const value = qvCreateDoubleScalar(1);
  qvSetCell(raw, 1, value);
  qvSetCell(raw, 1, value);
  EXPECT_EQ(qvGetCell(raw, 1), value);
  EXPECT_EQ(qvGetCell(raw, 0), nullptr);
  EXPECT_EQ(qvGetCell(raw, 2), nullptr);
  qvSetCell(raw, 1, nullptr);
  EXPECT_EQ(ambrix::liveCounts().arrays, 1U);
  EXPECT_THROW(qvSetCell(raw, 2, nullptr), std::out_of_range);
}

TEST_F(EmbeddedInterfaceTest, ScratchIsCountedAndAligned) {
  void* const memory = qvMalloc(100);
  EXPECT_EQ(reinterpret_cast<std::uintptr_t>(memory) % alignof(std::max_align_t), 0U);
  std::memset(memory, 1, 100);
  EXPECT_EQ(ambrix::liveCounts().scratch, 1U);
  qvFree(memory);
  qvFree(nullptr);
  qvFree(qvMalloc(0));
  EXPECT_EQ(identifierOf([] { (void)qvMalloc(std::numeric_limits<std::size_t>::max()); }),
            "TOLVEX:host:outOfMemory");
}

TEST_F(EmbeddedInterfaceTest, ErrorsCarryTheirMessage) {
  const TOLVEX::ambrix::MessageId id("TOLVEX:ambrix:cdflib", "unrecognizedValue", {8, "DATATYPE"});
  try {
    qvErrMsgId(id);
    FAIL() << "an error does not return";
  } catch (const std::exception& caught) {
    const auto& error = dynamic_cast<const ambrix::Error&>(caught);
    EXPECT_EQ(error.identifier(), "TOLVEX:ambrix:cdflib:unrecognizedValue");
    EXPECT_EQ(error.values(), id.values);
    EXPECT_EQ(error.id().component, "TOLVEX:ambrix:cdflib");
    std::string text;
    qvGetMessageText(id, text);
    EXPECT_EQ(error.what(), text);
    EXPECT_EQ(ambrix::messageText(id), text);
  }
}

TEST_F(EmbeddedInterfaceTest, OutsideACallWarningsAndUnloadHandlersHaveNoReceiver) {
  qvWarningMsgId({"TEST", "warning"});
  qvhAtExit([] { FAIL() << "there is no module to unload"; });
}

}  // namespace
