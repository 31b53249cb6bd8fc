// The array interface outside of any call. What every host must do is in tests/conformance.
#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
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

TEST_F(EmbeddedInterfaceTest, WithASizeOfZeroTheOthersMayBeLarge) {
  const std::size_t half = std::size_t{1} << 32U;
  EXPECT_THAT(numbers({half, half, 0}).size(), ElementsAre(half, half, 0));
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
