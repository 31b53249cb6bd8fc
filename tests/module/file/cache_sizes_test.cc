// Numbers of cache buffers of a file.
#include <cmath>
#include <limits>
#include <string>

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

// Buffers are made when they are needed, so numbers that no memory could hold do no harm.
TEST_F(CacheSizesTest, AnyNumberOf31BitsLeavesFilesUsable) {
  const char* const setters[] = {"setCacheSize", "setStageCacheSize", "setCompressionCacheSize",
                                 "setVarsCacheSize"};
  for (const double buffers : {0., 1., 1e6, 2147483647.}) {
    for (const bool multi : {false, true}) {
      const std::string name = std::to_string(buffers) + (multi ? "multi" : "single");
      const Given file = multi ? createMultiFile(name.c_str()) : create(name.c_str());
      const double v = createVar(file, {.sizes = {3}});
      if (!multi) results("setVarCompression", {file, v, 5, 6});
      for (const char* const setter : setters)
        EXPECT_EQ(does(setter, {file, buffers}), "done") << setter << name;
      for (int record = 0; record < 40; ++record)
        results("putVarRecordData", {file, v, record, row<std::int32_t>({record, 1, 2})});
      EXPECT_EQ(does("getVarRecordData", {file, v, 39}), "int32 3x1 [39 1 2]") << name;
      const Given again = reopen(file, name.c_str());
      EXPECT_EQ(does("getVarRecordData", {again, v, 38}), "int32 3x1 [38 1 2]") << name;
    }
  }
}

TEST_F(CacheSizesTest, NumbersBeyondAreRefused) {
  const double infinity = std::numeric_limits<double>::infinity();
  for (const Given& file : {create("single"), createMultiFile("multi")}) {
    for (const double beyond : {2147483648., 4294967296., 1099511627776., std::nan("")}) {
      for (const CacheSize& size : kSizes)
        EXPECT_EQ(does(size.setter, {file, beyond}), refused(size.routine, kBadCacheSize));
      EXPECT_EQ(does("setVarsCacheSize", {file, beyond}),
                refused("CDFsetzVarsCacheSize", kBadCacheSize));
    }
    EXPECT_EQ(does("setVarsCacheSize", {file, infinity}), kOutOfBounds);
    EXPECT_EQ(does("setCacheSize", {file, -infinity}), kOutOfBounds);
  }
}

TEST_F(CacheSizesTest, GettersCheckTheIdentifier) {
  for (const CacheSize& size : kSizes) {
    EXPECT_EQ(does(size.getter, {1}), validate("argumentNotUint64Scalar", "CDFID"));
  }
}

}  // namespace
}  // namespace ambrix_test
