// Which identifiers are accepted.
#include "gateway/open_file_registry.h"

#include <cstdlib>

#include "tests/support/failure_of.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using testing::ElementsAre;

constexpr CdfId kFive{5}, kSix{6}, kHuge{0xFFFFFFFFFFFFFFFFU};

class OpenFileRegistryTest : public HostTest {
 protected:
  ~OpenFileRegistryTest() override {
    for (const CdfId id : {kFive, kSix, kHuge})
      openFileRegistry().erase(id);
  }
};

TEST_F(OpenFileRegistryTest, KeepsEachIdentifierOnceInAscendingOrder) {
  OpenFileRegistry registry;
  EXPECT_EQ(registry.size(), 0U);
  for (const CdfId id : {kHuge, kSix, kFive, kSix})
    registry.insert(id);
  EXPECT_EQ(registry.size(), 3U);
  EXPECT_THAT(registry.files(), ElementsAre(kFive, kSix, kHuge));
}

TEST_F(OpenFileRegistryTest, ErasingWhatIsNotThereDoesNothing) {
  OpenFileRegistry registry;
  registry.insert(kFive);
  registry.erase(kSix);
  EXPECT_TRUE(registry.contains(kFive));
  registry.erase(kFive);
  EXPECT_FALSE(registry.contains(kFive));
  registry.erase(kFive);
  EXPECT_EQ(registry.size(), 0U);
}

TEST_F(OpenFileRegistryTest, AFreedFileStaysRegisteredUntilItsIdentifierIsHandedOutAnew) {
  OpenFileRegistry registry;
  registry.insert(kFive);
  registry.markFreed(kFive);
  EXPECT_TRUE(registry.isFreed(kFive));
  EXPECT_TRUE(registry.contains(kFive));
  registry.insert(kFive);
  EXPECT_FALSE(registry.isFreed(kFive));
  registry.markFreed(kFive);
  registry.erase(kFive);
  EXPECT_FALSE(registry.isFreed(kFive));
}

TEST_F(OpenFileRegistryTest, OnlyRegisteredFilesAreMarkedAsFreed) {
  OpenFileRegistry registry;
  registry.markFreed(kFive);
  registry.insert(kFive);
  EXPECT_FALSE(registry.isFreed(kFive));
}

TEST_F(OpenFileRegistryTest, OnlyRegisteredFilesAreMarkedAsWritten) {
  OpenFileRegistry registry;
  registry.markWritten(kFive);
  registry.insert(kFive);
  EXPECT_FALSE(registry.isWritten(kFive));
  registry.markWritten(kFive);
  EXPECT_TRUE(registry.isWritten(kFive));
}

TEST_F(OpenFileRegistryTest, AFileThatIsOpenedAnewWasNotWritten) {
  OpenFileRegistry registry;
  registry.insert(kFive);
  registry.markWritten(kFive);
  registry.insert(kFive);
  EXPECT_FALSE(registry.isWritten(kFive));
}

TEST_F(OpenFileRegistryTest, AClearedRegistryKnowsNoFile) {
  OpenFileRegistry registry;
  registry.insert(kFive);
  registry.markFreed(kFive);
  registry.clear();
  EXPECT_EQ(registry.size(), 0U);
  EXPECT_FALSE(registry.isFreed(kFive));
}

TEST_F(OpenFileRegistryTest, FilesBelongToTheProcessThatHasOpenedThem) {
  OpenFileRegistry registry;
  for (const CdfId id : {kSix, kHuge})
    registry.insert(id);
  EXPECT_TRUE(registry.isOfThisProcess(kSix));
  EXPECT_EXIT(
      {
        registry.insert(kFive);
        registry.erase(kSix);
        const bool own = registry.isOfThisProcess(kFive);
        std::_Exit(own && !registry.isOfThisProcess(kHuge) ? 0 : 1);
      },
      testing::ExitedWithCode(0), "");
}

TEST_F(OpenFileRegistryTest, AnIdentifierIsOneUint64) {
  const Given others[] = {5,
                          {},
                          "x",
                          row<std::int64_t>({5}),
                          row<std::uint64_t>({5, 6}),
                          row<std::uint64_t>({}),
                          row<std::uint32_t>({5})};
  openFileRegistry().insert(kFive);
  for (const Given& other : others) {
    EXPECT_EQ(failureOf([&] { getCdfIdArg(other.view().handle()); }),
              validate("argumentNotUint64Scalar", "CDFID"));
  }
}

TEST_F(OpenFileRegistryTest, AnIdentifierMustBeRegistered) {
  openFileRegistry().insert(kHuge);
  EXPECT_EQ(getCdfIdArg(file(0xFFFFFFFFFFFFFFFFU).view().handle()), kHuge);
  EXPECT_EQ(failureOf([] { getCdfIdArg(file(6).view().handle()); }), cdflib("invalidFileId"));
}

TEST_F(OpenFileRegistryTest, AnIdentifierGoesToTheHostAsOneUint64) {
  const Array array = Array::adopt(makeCdfIdScalar(kHuge));
  EXPECT_EQ(array.className(), std::string("uint64"));
  EXPECT_THAT(array.size(), ElementsAre(1, 1));
  EXPECT_EQ(array.data<std::uint64_t>()[0], 0xFFFFFFFFFFFFFFFFU);
}

}  // namespace
}  // namespace ambrix_test
