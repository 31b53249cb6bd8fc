// Functions that get the elements of an array in their own type.
#include <ambrix/embedded.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <span>
#include <stdexcept>
#include <string>
#include <type_traits>

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::ClassId;
using ambrix::Overloaded;

/// Whether a function is called with a span of T, and with these elements.
template <ambrix::ArrayElement T>
bool seesElements(T value) {
  const Array array = Array::row({value, T()});
  return visit(array, Overloaded{[&](std::span<const T> values) {
                                   return values.data() == array.data<T>().data() &&
                                          values.size() == 2;
                                 },
                                 [](auto) { return false; }});
}

TEST(EmbeddedVisitTest, EveryClassHasItsSpan) {
  EXPECT_TRUE(seesElements(true));
  EXPECT_TRUE(seesElements(u'x'));
  EXPECT_TRUE(seesElements(1.5));
  EXPECT_TRUE(seesElements(1.5F));
  EXPECT_TRUE(seesElements(std::int8_t{-1}));
  EXPECT_TRUE(seesElements(std::uint8_t{1}));
  EXPECT_TRUE(seesElements(std::int16_t{-1}));
  EXPECT_TRUE(seesElements(std::uint16_t{1}));
  EXPECT_TRUE(seesElements(std::int32_t{-1}));
  EXPECT_TRUE(seesElements(std::uint32_t{1}));
  EXPECT_TRUE(seesElements(std::int64_t{-1}));
  EXPECT_TRUE(seesElements(std::uint64_t{1}));
}

TEST(EmbeddedVisitTest, ACellArrayIsSeenAsAnArray) {
  Array cell = Array::cell({1, 2});
  cell.setElement(1, Array::fromNarrow("inside"));
  const auto inside = Overloaded{[](ArrayView cells) { return cells.element(1).utf8(); },
                                 [](auto) { return std::string("elements"); }};
  EXPECT_EQ(visit(cell, inside), "inside");
  EXPECT_EQ(visit(cell.element(1), inside), "elements");
}

TEST(EmbeddedVisitTest, AClassHasTheTypeThatHasTheClass) {
  const auto classOf = []<typename T>(std::type_identity<T>) { return ambrix::classIdOf<T>(); };
  const auto isArrayView = []<typename T>(std::type_identity<T>) {
    return std::is_same_v<T, ArrayView>;
  };
  for (const ClassId classId : ambrix::kClassIds) {
    const bool isCell = classId == ClassId::kCell;
    EXPECT_EQ(visitClass(classId, isArrayView), isCell);
    EXPECT_EQ(visitClass(classId, classOf), isCell ? ClassId::kUnknown : classId);
  }
  EXPECT_EQ(ambrix::kClassIds.size(), 13U);
}

TEST(EmbeddedVisitTest, TheFunctionMayReturnNothingOrAReference) {
  int calls = 0;
  visit(Array::scalar(1.0), [&](const auto&) { ++calls; });
  EXPECT_EQ(calls, 1);
  int& same = visit(Array::scalar(1.0), [&](const auto&) -> int& { return calls; });
  EXPECT_EQ(&same, &calls);
}

TEST(EmbeddedVisitTest, WithoutAnArrayThereIsNothingToSee) {
  EXPECT_THROW(visit(ArrayView(), [](const auto&) {}), std::logic_error);
  EXPECT_THROW(visitClass(ClassId::kUnknown, [](auto) {}), std::logic_error);
}

}  // namespace
