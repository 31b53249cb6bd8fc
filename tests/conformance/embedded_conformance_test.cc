// The embedded host passes what every host must.
#include <ambrix/embedded.h>
#include <gtest/gtest.h>

#include <cstddef>
#include <string>
#include <vector>

#include "host/qvh.h"

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::LiveCounts;

class EmbeddedConformanceTest : public testing::Test {
 protected:
  void TearDown() override { EXPECT_EQ(ambrix::liveCounts(), LiveCounts{}); }

  static Array number(std::size_t index) { return Array::scalar(static_cast<double>(index)); }

  ambrix::Module module_ = ambrix::Module(qvhFunction);
};

TEST_F(EmbeddedConformanceTest, EveryCheckPasses) {
  const auto results = module_.call("conformance");
  const ArrayView names = results.at(0);
  ASSERT_GT(names.elementCount(), 0U);
  for (std::size_t i = 0; i < names.elementCount(); ++i)
    EXPECT_EQ(results.at(1).element(i).utf8(), "") << names.element(i).utf8();
}

TEST_F(EmbeddedConformanceTest, WhatCannotBeIsRefused) {
  const auto results = module_.call("refusals");
  const ArrayView names = results.at(0);
  ASSERT_GT(names.elementCount(), 0U);
  const LiveCounts before = ambrix::liveCounts();
  for (std::size_t i = 0; i < names.elementCount(); ++i) {
    try {
      module_.call("refuse", {number(i)});
      ADD_FAILURE() << names.element(i).utf8() << " is not refused";
    } catch (const ambrix::Error& error) {
      EXPECT_EQ(error.identifier(), results.at(1).element(i).utf8()) << names.element(i).utf8();
    }
    EXPECT_EQ(ambrix::liveCounts(), before) << names.element(i).utf8();
  }
}

TEST_F(EmbeddedConformanceTest, ArraysComeBackAsTheyWent) {
  const auto results = module_.call("samples");
  const ArrayView names = results.at(0);
  ASSERT_GT(names.elementCount(), 0U);
  for (std::size_t i = 0; i < names.elementCount(); ++i) {
    const auto sample = module_.call("sample", {number(i)});
    const auto found = module_.call("recognise", {number(i), sample.at(0)});
    EXPECT_EQ(found.at(0).utf8(), "") << names.element(i).utf8();
  }
}

}  // namespace
