// Modules in shared libraries: which are loaded, which are refused, and that they go again.
#include <ambrix/embedded.h>
#include <dlfcn.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <filesystem>
#include <string>
#include <utility>

namespace {

using ambrix::Array;
using ambrix::Module;
using testing::AllOf;
using testing::HasSubstr;
using testing::SizeIs;

std::filesystem::path moduleNamed(const std::string& name) {
  return std::filesystem::path(TEST_MODULES) / (name + ".so");
}

double calls(Module& module) {
  return module.call("calls").at(0).data<double>()[0];
}

std::string reasonToRefuse(const std::filesystem::path& path) {
  try {
    const Module module(path);
  } catch (const ambrix::LoadError& error) {
    return error.what();
  }
  return "it was loaded";
}

TEST(EmbeddedLoadingTest, LoadsAndCallsAModule) {
  Module module(moduleNamed("counting_module"));
  EXPECT_EQ(calls(module), 1);
  EXPECT_EQ(calls(module), 2);
  EXPECT_EQ(module.leaks(), ambrix::LiveCounts{});
}

TEST(EmbeddedLoadingTest, ErrorsOfALoadedModuleAreCaughtByType) {
  Module module(moduleNamed("counting_module"));
  try {
    module.call("other");
    FAIL() << "the error was lost";
  } catch (const ambrix::Error& error) {
    EXPECT_EQ(error.identifier(), "TEST:module:noSuchCommand");
    EXPECT_THAT(error.values(), testing::ElementsAre(ambrix::MessageArg("other")));
  }
}

TEST(EmbeddedLoadingTest, UnloadingRunsTheHandlerAndThenForgetsTheModule) {
  int unloadings = 0;
  for (int round = 1; round <= 1000; ++round) {
    Module module(moduleNamed("counting_module"));
    const Array address = Array::scalar(reinterpret_cast<std::uint64_t>(&unloadings));
    EXPECT_EQ(module.call("calls", {address}).at(0).data<double>()[0], 1);
    EXPECT_EQ(calls(module), 2);
    module.unload();
    EXPECT_EQ(unloadings, round);
    EXPECT_THAT(module.lastWarnings(), SizeIs(1));
    EXPECT_EQ(dlopen(moduleNamed("counting_module").c_str(), RTLD_NOW | RTLD_NOLOAD), nullptr);
  }
  EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{});
}

TEST(EmbeddedLoadingTest, AModuleIsLoadedOnlyOnce) {
  Module module(moduleNamed("counting_module"));
  EXPECT_THAT(reasonToRefuse(moduleNamed("counting_module")), HasSubstr("loaded already"));
  EXPECT_EQ(calls(module), 1);
  module.unload();
  EXPECT_EQ(reasonToRefuse(moduleNamed("counting_module")), "it was loaded");
}

TEST(EmbeddedLoadingTest, ModulesForOtherHostsAreRefused) {
  EXPECT_THAT(reasonToRefuse(moduleNamed("other_release_module")),
              AllOf(HasSubstr("other_release_module.so"), HasSubstr("02000000"),
                    HasSubstr("this host is release 01000000")));
  EXPECT_THAT(reasonToRefuse(moduleNamed("other_api_module")),
              AllOf(HasSubstr("00010001"), HasSubstr("array interface 00010000")));
  EXPECT_EQ(dlopen(moduleNamed("other_api_module").c_str(), RTLD_NOW | RTLD_NOLOAD), nullptr);
}

TEST(EmbeddedLoadingTest, WhatIsNoModuleIsRefused) {
  EXPECT_THAT(reasonToRefuse(moduleNamed("incomplete_module")),
              HasSubstr("lacks qvhfilerequiredapiversion"));
  EXPECT_THAT(reasonToRefuse(moduleNamed("unlinkable_module")), HasSubstr("functionOfNoHost"));
  EXPECT_THAT(reasonToRefuse(moduleNamed("missing_module")), HasSubstr("missing_module.so"));
  EXPECT_THAT(reasonToRefuse("libm.so.6"), HasSubstr("libm.so.6"));
  EXPECT_THAT(reasonToRefuse(TEST_MODULES), HasSubstr("can't be loaded"));
}

TEST(EmbeddedLoadingTest, PathsMayBeRelative) {
  Module module(std::filesystem::relative(moduleNamed("counting_module")));
  EXPECT_EQ(calls(module), 1);
}

TEST(EmbeddedLoadingTest, TheModuleIsExpectedBesideTheLibrary) {
  const std::filesystem::path path = ambrix::defaultModulePath();
  EXPECT_EQ(path.filename(), "ambrix_module.so");
  EXPECT_TRUE(std::filesystem::exists(path.parent_path() / "libambrix_embedded.so"));
}

}  // namespace
