// Tests of what all commands have in common.
#pragma once

#include "tests/support/command_signatures.h"
#include "tests/support/examples.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {

/// File 7 with its variable 3, which is 2 by 3 doubles, and its attribute 2 with an entry 5.
class CommandTest : public ScriptedTest, public testing::WithParamInterface<Command> {
 protected:
  CommandTest() {
    describe({.sizes = {2, 3}});
    fake.answer("CDF_FORMAT_", {2});
    fake.answer("CDF_ENCODING_", {6});
    fake.answer("ATTR_SCOPE_", {1});
    fake.answer("CDFinquireAttr", {1, 0, 0, 0});
    fake.answer("CDFinquireAttrEntry", {45, 1});
    fake.answer("CDFgetValidate", {1});
  }

  [[nodiscard]] const std::string& command() const { return GetParam().name; }
  [[nodiscard]] Arguments arguments() const { return examplesOf(GetParam()); }
  [[nodiscard]] const std::vector<std::string>& reported() const { return GetParam().reported; }
};

/// The place of the first call that is not a guard's.
inline std::size_t firstReported(const Command& command) {
  return command.reported[0] == "?" ? 1 : 0;
}

/// How the failure reads.
inline std::string reportOf(const std::string& reported, long status) {
  return reported.starts_with("CDF") ? libraryFailure(reported, status) : cdflib(reported.c_str());
}

inline std::string nameOf(const testing::TestParamInfo<Command>& given) {
  return given.param.name;
}

}  // namespace ambrix_test
