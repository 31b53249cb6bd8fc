// Tests of the module's commands over the stand-in for the CDF library.
#pragma once

#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

#include "gateway/cdf_id.h"
#include "tests/support/fake_cdflib.h"
#include "tests/support/given.h"
#include "tests/support/message_text.h"
#include "tests/support/shown_array.h"

namespace ambrix_test {

/// Begins with one open file, `file()`, no calls, and a library without the faults that only some
/// versions have. Ends by asking whether anything is left
/// alive.
class ScriptedTest : public testing::Test {
 protected:
  ScriptedTest();
  ~ScriptedTest() override;

  /// The results of a command that succeeds.
  std::vector<Array> call(const std::string& command, const Arguments& arguments = {});
  /// The first result.
  Array result(const std::string& command, const Arguments& arguments = {});
  /// The message of a command that fails; also tests that it filled no output, left nothing alive
  /// and left the set of open files alone. "no error" when it succeeds.
  std::string errorOf(const std::string& command, const Arguments& arguments = {});
  /// The calls of the library since the last question.
  std::vector<std::string> calls();
  /// The warnings of the last command.
  std::vector<std::string> warnings();

  /// What the library says of the variable when it is asked.
  struct Variable {
    long datatype = 22;
    long elements = 1;
    Numbers sizes = {};
    Numbers variances = {};
    long majority = 2;
    std::string name = "v";
    long recordVariance = -1;
  };
  void describe(const Variable& variable);

  FakeCdflib& fake = fakeCdflib();
  ::ambrix::Module module;
};

/// The inquiry that begins the reading and writing of variable 3.
inline const std::string kInquiry =
    "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_NAME_ | zVAR_DATATYPE_ | zVAR_NUMELEMS_ | "
    "zVAR_NUMDIMS_ | zVAR_DIMSIZES_ | zVAR_RECVARY_ | zVAR_DIMVARYS_";
inline const std::string kOnVariable = "SELECT_ CDF_ 7 | zVAR_ 3 | ";
inline const std::string kMajority = "SELECT_ CDF_ 7 | GET_ CDF_MAJORITY_";

/// The files that the module holds open.
std::set<TOLVEX::ambrix::CdfId> openFiles();

std::vector<std::string> shown(const std::vector<Array>& arrays);

}  // namespace ambrix_test
