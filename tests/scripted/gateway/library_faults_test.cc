// Which faults a version of the library is taken to have.
#include "gateway/library_faults.h"

#include <gtest/gtest.h>

namespace ambrix_test {
namespace {

using TOLVEX::ambrix::faultsOf;

TEST(LibraryFaultsTest, ThoseOfTheOldestAreGoneInTheNewest) {
  EXPECT_TRUE(faultsOf({3, 6, 3}).leavesUnwrittenRecords);
  EXPECT_TRUE(faultsOf({3, 5, 9}).leavesUnwrittenRecords);
  EXPECT_FALSE(faultsOf({3, 9, 1}).leavesUnwrittenRecords);
  EXPECT_FALSE(faultsOf({3, 10, 0}).leavesUnwrittenRecords);
}

TEST(LibraryFaultsTest, ThoseOfTheNewestAreNotInTheOldest) {
  EXPECT_FALSE(faultsOf({3, 6, 3}).freesSelectedAttributeTwice);
  EXPECT_TRUE(faultsOf({3, 9, 1}).freesSelectedAttributeTwice);
}

// Nobody has tried them, so nothing is risked.
TEST(LibraryFaultsTest, VersionsBetweenHaveThemAll) {
  for (const long release : {6, 7, 8, 9}) {
    const TOLVEX::ambrix::LibraryVersion version{3, release, release == 6 ? 4 : 0};
    EXPECT_TRUE(faultsOf(version).leavesUnwrittenRecords);
    EXPECT_TRUE(faultsOf(version).freesSelectedAttributeTwice);
  }
}

}  // namespace
}  // namespace ambrix_test
