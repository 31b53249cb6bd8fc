// Limits on memory, and failures of allocation that tests ask for.
#include <ambrix/embedded.h>
#include <gtest/gtest.h>
#include <sys/resource.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <functional>
#include <limits>
#include <memory>
#include <string>
#include <vector>

#include "host/qvh.h"

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::ClassId;
using ambrix::Module;

class EmbeddedMemoryTest : public testing::Test {
 protected:
  void TearDown() override {
    ambrix::failAllocation(0);
    ambrix::setByteLimit(std::numeric_limits<std::size_t>::max());
    EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{});
  }

  static bool isOutOfMemory(const std::function<void()>& action) {
    try {
      action();
    } catch (const ambrix::Error& error) {
      return error.identifier() == "TOLVEX:host:outOfMemory" && error.values().empty();
    }
    return false;
  }
};

TEST_F(EmbeddedMemoryTest, TheLimitIsTheMostBytesOfOneArrayOrBuffer) {
  ambrix::setByteLimit(800);
  EXPECT_EQ(ambrix::byteLimit(), 800U);
  EXPECT_EQ(Array::zeros(ClassId::kDouble, {10, 10}).elementCount(), 100U);
  EXPECT_TRUE(isOutOfMemory([] { Array::zeros(ClassId::kDouble, {101, 1}); }));
  EXPECT_TRUE(isOutOfMemory([] { Array::uninitialized(ClassId::kChar, {401, 1}); }));
  EXPECT_TRUE(isOutOfMemory([] { Array::cell({101, 1}); }));
  qvFree(qvMalloc(800));
  EXPECT_TRUE(isOutOfMemory([] { (void)qvMalloc(801); }));
}

TEST_F(EmbeddedMemoryTest, ANegativeSizeIsTheWorseMistake) {
  ambrix::setByteLimit(8);
  const std::size_t negative = std::numeric_limits<std::size_t>::max();
  try {
    Array::zeros(ClassId::kDouble, {1000, negative});
    FAIL() << "a negative size was taken";
  } catch (const ambrix::Error& error) {
    EXPECT_EQ(error.identifier(), "TOLVEX:host:badDimension");
  }
}

TEST_F(EmbeddedMemoryTest, TheAllocationAskedForFailsOnce) {
  ambrix::failAllocation(2);
  EXPECT_TRUE(ambrix::failurePending());
  const Array first = Array::scalar(1.0);
  EXPECT_TRUE(isOutOfMemory([] { Array::scalar(2.0); }));
  EXPECT_FALSE(ambrix::failurePending());
  const Array third = Array::scalar(3.0);
  ambrix::failAllocation(1);
  ambrix::failAllocation(0);
  const Array fourth = Array::scalar(4.0);
  EXPECT_EQ(ambrix::liveCounts().arrays, 3U);
}

TEST_F(EmbeddedMemoryTest, LargeArraysFailWholeAtEitherAllocation) {
  for (const std::uint64_t n : {1U, 2U}) {
    ambrix::failAllocation(n);
    EXPECT_TRUE(isOutOfMemory([] { Array::zeros(ClassId::kDouble, {1000, 1}); }));
    EXPECT_FALSE(ambrix::failurePending());
  }
}

#ifdef __linux__
TEST_F(EmbeddedMemoryTest, ArraysOfManyBytesBeginWhereAHugePageCan) {
  constexpr std::size_t kHugePage = std::size_t{2} << 20U;
  for (const std::size_t bytes : {kHugePage, kHugePage + 1, 8 * kHugePage - 1}) {
    const Array array = Array::uninitialized(ClassId::kInt8, {bytes, 1});
    const auto data = array.bytes();
    EXPECT_EQ(reinterpret_cast<std::uintptr_t>(data.data()) % kHugePage, 0U);
    std::memset(const_cast<std::byte*>(data.data()), 1, bytes);  // all of it is there
    EXPECT_EQ(data.back(), std::byte{1});
  }
}
#endif

TEST_F(EmbeddedMemoryTest, ArraysOfManyBytesAreZeroWhereTheyAreToBe) {
  const std::size_t bytes = std::size_t{16} << 20U;
  for (int i = 0; i < 2; ++i) {  // the second may get the memory that the first has left
    const Array array = Array::zeros(ClassId::kInt8, {bytes, 1});
    const auto data = array.bytes();
    EXPECT_TRUE(std::ranges::all_of(data, [](std::byte byte) { return byte == std::byte{0}; }));
    std::memset(const_cast<std::byte*>(data.data()), 1, bytes);
  }
}

TEST_F(EmbeddedMemoryTest, TheLimitAndFailuresHoldForManyBytes) {
  const std::size_t bytes = std::size_t{16} << 20U;
  ambrix::failAllocation(2);
  EXPECT_TRUE(isOutOfMemory([&] { Array::uninitialized(ClassId::kInt8, {bytes, 1}); }));
  EXPECT_TRUE(isOutOfMemory([] {
    Array::uninitialized(ClassId::kInt8, {std::size_t{1} << 60U, 1});
  }));
  ambrix::setByteLimit(bytes - 1);
  EXPECT_TRUE(isOutOfMemory([&] { Array::uninitialized(ClassId::kInt8, {bytes, 1}); }));
}

TEST_F(EmbeddedMemoryTest, CopiesOfCellsFailWhole) {
  Array cell = Array::cell({1, 2});
  cell.setElement(0, Array::cell({1, 1}));
  cell.setElement(1, Array::scalar(1.0));
  for (std::uint64_t n = 1; n <= 3; ++n) {
    ambrix::failAllocation(n);
    EXPECT_TRUE(isOutOfMemory([&] { (void)cell.clone(); }));
  }
  EXPECT_EQ(ambrix::liveCounts().arrays, 3U);
}

/// Takes scratch, makes arrays and puts one into a cell: what commands do.
void busyModule(int, qvArray* outputs[], int, const qvArray* inputs[]) {
  char* const command = qvArrayToString(inputs[0]);
  qvArray* const cell = qvCreateCellMatrix(2, 1);
  qvSetCell(cell, 0, qvCreateString(command));
  qvSetCell(cell, 1, qvCreateNumericMatrix(100, 100, qvDOUBLE_CLASS, qvREAL));
  qvFree(command);
  outputs[0] = cell;
  outputs[1] = qvCreateDoubleScalar(1);
}

TEST_F(EmbeddedMemoryTest, ACallThatRunsOutOfMemoryAtAnyPointLeavesNothing) {
  Module module(busyModule);
  const Array command = Array::fromNarrow("command");
  int failures = 0;
  for (std::uint64_t n = 1;; ++n) {
    ambrix::failAllocation(n);
    if (!isOutOfMemory([&] { module.call(command); })) break;
    EXPECT_EQ(ambrix::liveCounts(), (ambrix::LiveCounts{1, 0}));
    ++failures;
  }
  EXPECT_EQ(failures, 6);
  EXPECT_TRUE(ambrix::failurePending());
  EXPECT_EQ(module.leaks(), ambrix::LiveCounts{});
}

#ifdef __GLIBC__
long pageFaults() {
  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  return usage.ru_minflt;
}

/// Takes as much in small pieces as the library does for a compressed file, and frees it.
void takeAndFree() {
  std::vector<std::unique_ptr<char[]>> pieces(200);
  for (auto& piece : pieces) {
    piece = std::make_unique<char[]>(10'000);
  }
}

TEST_F(EmbeddedMemoryTest, FreedMemoryIsKeptWhereThatIsAskedFor) {
#ifdef __SANITIZE_ADDRESS__
  GTEST_SKIP() << "the sanitizer has an allocator of its own";
#endif
  ASSERT_TRUE(ambrix::keepFreedMemory());
  takeAndFree();
  const long before = pageFaults();
  for (int i = 0; i < 20; ++i)
    takeAndFree();
  EXPECT_LT(pageFaults() - before, 20);
}
#endif

}  // namespace
