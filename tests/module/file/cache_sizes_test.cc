// Numbers of cache buffers of a file.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using CacheSizesTest = ModuleTest;

struct CacheSize {
  const char* getter;
  const char* setter;
  const char* routine;
};

const CacheSize kSizes[] = {
    {"getCacheSize", "setCacheSize", "CDFsetCacheSize"},
    {"getStageCacheSize", "setStageCacheSize", "CDFsetStageCacheSize"},
    {"getCompressionCacheSize", "setCompressionCacheSize", "CDFsetCompressionCacheSize"},
};

TEST_F(CacheSizesTest, AreDoubleScalarsThatCanBeSet) {
  const Given file = create();
  for (const CacheSize& size : kSizes) {
    EXPECT_GT(number(size.getter, {file}), 0);
    EXPECT_EQ(does(size.setter, {file, 17.9}), "done");
    EXPECT_EQ(does(size.getter, {file}), "double 1x1 [17]");
  }
}

TEST_F(CacheSizesTest, NoneIsTheDefaultAgain) {
  const Given file = create();
  for (const CacheSize& size : kSizes) {
    const double byDefault = number(size.getter, {file});
    results(size.setter, {file, 17});
    EXPECT_EQ(does(size.setter, {file, 0}), "done");
    EXPECT_EQ(number(size.getter, {file}), byDefault);
  }
}

TEST_F(CacheSizesTest, NegativeNumbersAreRefused) {
  const Given file = create();
  for (const CacheSize& size : kSizes) {
    EXPECT_EQ(does(size.setter, {file, -1}), refused(size.routine, kBadCacheSize));
    EXPECT_EQ(does(size.setter, {file, 4294967301.0}), refused(size.routine, kBadCacheSize));
  }
}

TEST_F(CacheSizesTest, DefaultsDependOnTheFormat) {
  EXPECT_EQ(does("getCacheSize", {create("single")}), "double 1x1 [300]");
  EXPECT_EQ(does("getCacheSize", {createMultiFile("multi")}), "double 1x1 [40]");
}

TEST_F(CacheSizesTest, OfAllVariablesHaveNoEffectOnASingleFile) {
  const Given file = create();
  createVar(file, {});
  EXPECT_EQ(does("setVarsCacheSize", {file, 5}), "done");
}

TEST_F(CacheSizesTest, OfAllVariablesAreThoseOfEachInAMultiFile) {
  const Given file = createMultiFile();
  createVar(file, {});
  createVar(file, {.name = "w"});
  EXPECT_EQ(does("setVarsCacheSize", {file, 5}), "done");
  EXPECT_EQ(does("getVarCacheSize", {file, 0}), "double 1x1 [5]");
  EXPECT_EQ(does("getVarCacheSize", {file, 1}), "double 1x1 [5]");
  EXPECT_EQ(does("setVarsCacheSize", {file, -1}), refused("CDFsetzVarsCacheSize", kBadCacheSize));
}

TEST_F(CacheSizesTest, GettersCheckTheIdentifier) {
  for (const CacheSize& size : kSizes) {
    EXPECT_EQ(does(size.getter, {1}), validate("argumentNotUint64Scalar", "CDFID"));
  }
}

}  // namespace
}  // namespace ambrix_test
