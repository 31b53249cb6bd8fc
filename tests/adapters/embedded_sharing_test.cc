// Arrays over memory of the caller's, and elements that an array gives up.
#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <stdexcept>
#include <thread>
#include <utility>
#include <vector>

#include "host/qvh.h"

namespace {

using ambrix::Array;
using ambrix::ClassId;
using ambrix::LiveCounts;
using ambrix::Module;
using ambrix::OwnedElements;
using testing::ElementsAre;

class EmbeddedSharingTest : public testing::Test {
 protected:
  void TearDown() override {
    ambrix::failAllocation(0);
    ambrix::setByteLimit(std::numeric_limits<std::size_t>::max());
    EXPECT_EQ(ambrix::liveCounts(), LiveCounts{});
  }
};

using EmbeddedBorrowedTest = EmbeddedSharingTest;
using EmbeddedReleasedTest = EmbeddedSharingTest;

Array borrowed(const std::vector<double>& values, ambrix::Sizes sizes,
               std::shared_ptr<const void> keeper = nullptr) {
  return Array::borrowed(std::span<const double>(values), sizes, std::move(keeper));
}

TEST_F(EmbeddedBorrowedTest, ElementsAreReadWhereTheyAre) {
  for (const std::size_t count : {2U, 3000U}) {  // the host would keep them in different places
    std::vector<double> values(2 * count, 1.5);
    const Array array = borrowed(values, {2, count, 1});
    EXPECT_EQ(array.classId(), ClassId::kDouble);
    EXPECT_THAT(array.size(), ElementsAre(2, count));
    EXPECT_EQ(array.elementCount(), 2 * count);
    EXPECT_EQ(array.data<double>().data(), values.data());
    EXPECT_EQ(qvGetReadOnlyData(array.handle()), values.data());
    values.back() = 7;
    EXPECT_EQ(array.data<double>().back(), 7);
    EXPECT_EQ(ambrix::liveCounts(), (LiveCounts{1, 0}));
  }
}

TEST_F(EmbeddedBorrowedTest, NumbersLogicalsAndCharactersCanBeBorrowed) {
  const std::array<std::int8_t, 3> numbers = {-1, 0, 1};
  const Array row = Array::borrowed(std::span<const std::int8_t>(numbers), {1, 3});
  EXPECT_STREQ(row.className(), "int8");
  EXPECT_THAT(row.data<std::int8_t>(), ElementsAre(-1, 0, 1));
  const std::array<bool, 2> answers = {true, false};
  const Array logicals = Array::borrowed(std::span<const bool>(answers), {2});
  EXPECT_EQ(qvGetLogicals(logicals.handle()), answers.data());
  const std::u16string_view text = u"a\u20ac";
  const Array chars = Array::borrowed(std::span<const char16_t>(text), {1, 2});
  EXPECT_EQ(qvGetReadOnlyChars(chars.handle()), text.data());
  EXPECT_EQ(chars.text(), text);
}

TEST_F(EmbeddedBorrowedTest, TheKeeperGoesWithTheArray) {
  auto values = std::make_shared<std::vector<double>>(100, 2.5);
  const std::weak_ptr<std::vector<double>> alive = values;
  Array array = borrowed(*values, {10, 10}, values);
  values.reset();
  EXPECT_THAT(array.data<double>(), testing::Each(2.5));
  Array moved = std::move(array);
  EXPECT_FALSE(alive.expired());
  moved = Array();
  EXPECT_TRUE(alive.expired());
}

TEST_F(EmbeddedBorrowedTest, ACellArrayKeepsTheKeeper) {
  const auto values = std::make_shared<std::vector<double>>(3, 2.5);
  Array cell = Array::cell({1, 2});
  cell.setElement(0, borrowed(*values, {1, 3}, values));
  cell.setElement(1, borrowed(*values, {3, 1}, values));
  EXPECT_EQ(values.use_count(), 3);
  cell.setElement(1, Array());
  EXPECT_EQ(values.use_count(), 2);
  cell = Array();
  EXPECT_EQ(values.use_count(), 1);
}

TEST_F(EmbeddedBorrowedTest, ACopyOwnsItsMemory) {
  Array copy;
  {
    const auto values = std::make_shared<std::vector<double>>(3, 2.5);
    copy = borrowed(*values, {1, 3}, values).clone();
    EXPECT_EQ(values.use_count(), 1);
  }
  EXPECT_THAT(copy.data<double>(), ElementsAre(2.5, 2.5, 2.5));
  copy.mutableData<double>()[0] = 1;
}

TEST_F(EmbeddedBorrowedTest, NobodyWritesToThem) {
  const std::vector<double> values(3);
  Array array = borrowed(values, {1, 3});
  EXPECT_THROW((void)array.mutableData<double>(), std::logic_error);
  EXPECT_THROW((void)array.releaseElements(), std::logic_error);
  EXPECT_EQ(array.data<double>().data(), values.data());
}

TEST_F(EmbeddedBorrowedTest, WhatDoesNotFitIsRefusedAndNotKept) {
  const auto values = std::make_shared<std::vector<double>>(4);
  const auto bytes = std::as_bytes(std::span(*values));
  EXPECT_THROW(borrowed(*values, {1, 3}, values), std::invalid_argument);
  EXPECT_THROW(borrowed(*values, {}, values), std::invalid_argument);
  EXPECT_THROW(Array::borrowed(ClassId::kSingle, {1, 4}, bytes.subspan(2, 16), values),
               std::invalid_argument);
  EXPECT_THROW(Array::borrowed(ClassId::kCell, {1, 4}, bytes, values), std::invalid_argument);
  EXPECT_THROW(Array::borrowed(ClassId::kUnknown, {0, 0}, {}, values), std::invalid_argument);
  const std::size_t negative = std::numeric_limits<std::size_t>::max();
  EXPECT_THROW(borrowed(*values, {4, negative}, values), ambrix::Error);
  ambrix::failAllocation(1);
  EXPECT_THROW(borrowed(*values, {1, 4}, values), ambrix::Error);
  EXPECT_EQ(values.use_count(), 1);
}

TEST_F(EmbeddedBorrowedTest, NoElementsNeedNoMemory) {
  const Array array = Array::borrowed(std::span<const double>(), {0, 5});
  EXPECT_THAT(array.size(), ElementsAre(0, 5));
  EXPECT_TRUE(array.data<double>().empty());
}

TEST_F(EmbeddedBorrowedTest, TheByteLimitIsForTheHostsOwnMemory) {
  const std::vector<double> values(1000);
  ambrix::setByteLimit(100);
  EXPECT_EQ(borrowed(values, {1000}).elementCount(), 1000U);
}

/// Returns the address of its argument's elements, as a number, and what the first of them is.
void addressModule(int, qvArray* outputs[], int, const qvArray* inputs[]) {
  const auto* const elements = static_cast<const double*>(qvGetReadOnlyData(inputs[1]));
  outputs[0] = qvCreateNumericMatrix(1, 1, qvUINT64_CLASS, qvREAL);
  *static_cast<std::uint64_t*>(qvGetData(outputs[0])) = reinterpret_cast<std::uintptr_t>(elements);
  outputs[1] = qvCreateDoubleScalar(elements[0]);
}

TEST_F(EmbeddedBorrowedTest, AModuleReadsTheCallersMemory) {
  Module module(addressModule);
  const std::vector<double> values(50'000, 4.5);
  const Array array = borrowed(values, {50, 1000});
  const std::vector<Array> results = module.call("address", {array});
  EXPECT_EQ(results.at(0).data<std::uint64_t>()[0],
            reinterpret_cast<std::uintptr_t>(values.data()));
  EXPECT_EQ(results.at(1).data<double>()[0], 4.5);
  EXPECT_EQ(module.leaks(), LiveCounts{});
}

/// Hands its argument back, which is not its own.
void returningModule(int, qvArray* outputs[], int, const qvArray* inputs[]) {
  outputs[0] = const_cast<qvArray*>(inputs[1]);
}

TEST_F(EmbeddedBorrowedTest, AModuleCannotReturnThem) {
  Module module(returningModule);
  const std::vector<double> values(3);
  EXPECT_THROW(module.call("return", {borrowed(values, {1, 3})}), std::logic_error);
}

TEST_F(EmbeddedReleasedTest, ElementsStayWhereTheyAre) {
  for (const std::size_t count : {1U, 32U, 33U, 3000U, 1'000'000U}) {
    Array array = Array::uninitialized(ClassId::kDouble, {count});
    array.mutableData<double>().back() = 1.5;
    const void* const place = array.data<double>().data();
    const OwnedElements elements = array.releaseElements();
    EXPECT_FALSE(array);
    EXPECT_EQ(elements.get(), place);
    auto* const values = static_cast<double*>(elements.get());
    EXPECT_EQ(values[count - 1], 1.5);
    values[0] = 2.5;
    EXPECT_EQ(ambrix::liveCounts(), (LiveCounts{1, 0}));
  }
}

TEST_F(EmbeddedReleasedTest, AResultOutlivesItsModule) {
  OwnedElements elements;
  {
    Module module(addressModule);
    std::vector<Array> results = module.call("address", {Array::scalar(6.5)});
    elements = results.at(1).releaseElements();
  }
  EXPECT_EQ(*static_cast<const double*>(elements.get()), 6.5);
}

TEST_F(EmbeddedReleasedTest, TheDeleterFreesThemLaterAndElsewhere) {
  OwnedElements elements = Array::zeros(ClassId::kInt16, {1000}).releaseElements();
  const ambrix::FreeElements freeElements = elements.get_deleter();
  void* const memory = elements.release();
  EXPECT_EQ(ambrix::liveCounts(), (LiveCounts{1, 0}));
  std::thread([&] { freeElements(memory); }).join();
  EXPECT_EQ(ambrix::liveCounts(), LiveCounts{});
}

TEST_F(EmbeddedReleasedTest, ASharedPointerTakesThemOver) {
  Array array = Array::row({1.0, 2.0, 3.0});
  const std::shared_ptr<void> elements = array.releaseElements();
  const std::span values(static_cast<const double*>(elements.get()), 3);
  const Array again = Array::borrowed(values, {3, 1}, elements);
  EXPECT_EQ(elements.use_count(), 2);
  EXPECT_THAT(again.data<double>(), ElementsAre(1, 2, 3));
}

TEST_F(EmbeddedReleasedTest, WhereThereAreNoneNothingIsLeft) {
  Array array = Array::zeros(ClassId::kDouble, {0, 5});
  EXPECT_EQ(array.releaseElements(), nullptr);
  EXPECT_FALSE(array);
  EXPECT_EQ(ambrix::liveCounts(), LiveCounts{});
}

TEST_F(EmbeddedReleasedTest, CellsAreKept) {
  Array cell = Array::cell({1, 1});
  EXPECT_THROW((void)cell.releaseElements(), std::logic_error);
  EXPECT_THAT(cell.size(), ElementsAre(1, 1));
  EXPECT_THROW((void)Array().releaseElements(), std::logic_error);
}

}  // namespace
