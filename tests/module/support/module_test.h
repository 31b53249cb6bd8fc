// Tests of the loaded module with the real CDF library and real files.
#pragma once

#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/module/support/library_differences.h"
#include "tests/module/support/status_texts.h"
#include "tests/support/given.h"
#include "tests/support/message_text.h"
#include "tests/support/shown_array.h"

namespace ambrix_test {

/// Runs in a temporary folder with a module of its own and the library's modes at their defaults.
/// After every call it tests that nothing is alive but the arrays returned.
class ModuleTest : public testing::Test {
 protected:
  ModuleTest();
  ~ModuleTest() override;

  /// What a command does, in one text: its results as `shown`, separated by "; ", or the whole
  /// message of its error. "done" when there are no results.
  std::string does(const std::string& command, const Arguments& arguments = {});
  /// The results of a command that must succeed.
  std::vector<Array> results(const std::string& command, const Arguments& arguments = {});
  /// The first of them.
  Array result(const std::string& command, const Arguments& arguments = {});
  /// The same as a number, e.g. of a variable.
  double number(const std::string& command, const Arguments& arguments = {});
  /// The warnings of the last command, or of unloading.
  std::vector<std::string> warnings() const;

  /// A new file in the temporary folder, row-major as the library makes them.
  Given create(const char* name = "new");
  Given createColumnMajor(const char* name = "new");
  /// A new multi-file CDF.
  Given createMultiFile(const char* name = "new");
  Given open(const std::string& name);
  /// Closes the file of that name and opens it again.
  Given reopen(const Given& file, const char* name = "new");

  struct NewVariable {
    long datatype = 4;
    std::vector<double> sizes = {};
    long elements = 1;
    const char* name = "v";
    bool recordsVary = true;
    std::vector<double> variances = {};  // all vary if there are none
  };
  double createVar(const Given& file, const NewVariable& variable);

  /// The file of the CDF distribution, or of the other samples; throws when there is none.
  static std::string distributionSample(const char* name);
  /// Empty when the folder of samples is absent.
  static std::string sample(const char* name);

  /// What the running library does unlike others.
  LibraryDifferences library();

  ::ambrix::Module module;

 private:
  void callAndWatch(const std::string& command, const Arguments& arguments,
                    std::vector<Array>& found);

  std::string folder_;
  std::string previousFolder_;
};

/// All of them, separated by "; ".
std::string shown(const std::vector<Array>& arrays);

/// A failure of the library, with the text of its status.
inline std::string refused(const char* routine, const char* statusText) {
  return cdflib("libraryFailure", routine, statusText);
}

inline const std::string kOutOfBounds = "TOLVEX:ambrix:validate:argumentOutOfBounds()";
inline const std::string kWrongNumberOfInputs = "TOLVEX:ambrix:validate:wrongNumberOfInputs()";
inline const std::string kInvalidFileId = "TOLVEX:ambrix:cdflib:invalidFileId()";
inline const std::string kCreateError = "TOLVEX:ambrix:cdflib:fileCreateError()";

// Skips the test where the folder of samples is absent.
#define AMBRIX_NEED_SAMPLE(variable, name)   \
  const std::string variable = sample(name); \
  if (variable.empty()) GTEST_SKIP() << "no " name ": set AMBRIX_SAMPLES to the folder of samples"

}  // namespace ambrix_test
