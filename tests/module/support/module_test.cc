#include "tests/module/support/module_test.h"

#include <unistd.h>

#include <cstdlib>
#include <exception>
#include <filesystem>
#include <stdexcept>
#include <utility>

namespace ambrix_test {
namespace {

namespace fs = std::filesystem;

std::size_t arraysIn(ArrayView array) {
  std::size_t count = 1;
  if (array.classId() != ClassId::kCell) return count;
  for (std::size_t i = 0; i < array.elementCount(); ++i)
    count += arraysIn(array.element(i));
  return count;
}

std::string newFolder() {
  std::string name = (fs::temp_directory_path() / "ambrix-test-XXXXXX").string();
  if (mkdtemp(name.data()) == nullptr) throw std::runtime_error("no temporary folder");
  return name;
}

fs::path samplesFolder() {
  if (const char* folder = std::getenv("AMBRIX_SAMPLES")) return folder;
  return fs::path(AMBRIX_ROOT) / "../shared/samples";
}

}  // namespace

// The library may leave scratch files in the current folder.
ModuleTest::ModuleTest() : folder_(newFolder()), previousFolder_(fs::current_path().string()) {
  fs::current_path(folder_);
  module.call("setValidate", {Array::scalar(-1.0)});
  module.call("setFileBackward", {Array::scalar(0.0)});
}

ModuleTest::~ModuleTest() {
  EXPECT_EQ(module.leaks(), ::ambrix::LiveCounts{});
  module.unload();
  fs::current_path(previousFolder_);
  std::error_code ignored;
  fs::remove_all(folder_, ignored);
}

void ModuleTest::callAndWatch(const std::string& command, const Arguments& arguments,
                              std::vector<Array>& found) {
  const auto before = ::ambrix::liveCounts();
  const auto watch = [&] {
    std::size_t returned = 0;
    for (const Array& array : found)
      returned += arraysIn(array);
    EXPECT_EQ(::ambrix::liveCounts().arrays, before.arrays + returned) << "after " << command;
    EXPECT_EQ(::ambrix::liveCounts().scratch, before.scratch) << "after " << command;
  };
  try {
    found = module.call(command, viewsOf(arguments));
  } catch (...) {
    watch();
    throw;
  }
  watch();
}

std::string ModuleTest::does(const std::string& command, const Arguments& arguments) {
  std::vector<Array> found;
  try {
    callAndWatch(command, arguments, found);
  } catch (const ::ambrix::Error& error) {
    return messageText(error.id());
  } catch (const std::exception& error) {
    return error.what();
  }
  return found.empty() ? "done" : shown(found);
}

std::vector<Array> ModuleTest::results(const std::string& command, const Arguments& arguments) {
  std::vector<Array> found;
  try {
    callAndWatch(command, arguments, found);
  } catch (const ::ambrix::Error& error) {
    throw std::runtime_error(command + " failed: " + messageText(error.id()));
  }
  return found;
}

Array ModuleTest::result(const std::string& command, const Arguments& arguments) {
  return std::move(results(command, arguments).at(0));
}

double ModuleTest::number(const std::string& command, const Arguments& arguments) {
  return result(command, arguments).data<double>()[0];
}

std::vector<std::string> ModuleTest::warnings() const {
  std::vector<std::string> texts;
  for (const auto& warning : module.lastWarnings())
    texts.push_back(messageText(warning));
  return texts;
}

Given ModuleTest::create(const char* name) {
  return result("create", {name});
}

Given ModuleTest::createColumnMajor(const char* name) {
  Given file = create(name);
  results("setMajority", {file, 2});
  return file;
}

Given ModuleTest::createMultiFile(const char* name) {
  Given file = create(name);
  results("setFormat", {file, 2});
  return file;
}

Given ModuleTest::open(const std::string& name) {
  return result("open", {name.c_str()});
}

Given ModuleTest::reopen(const Given& file, const char* name) {
  results("close", {file});
  return open(name);
}

double ModuleTest::createVar(const Given& file, const NewVariable& variable) {
  std::vector<double> variances = variable.variances;
  if (variances.empty()) variances.assign(variable.sizes.size(), -1);
  return number("createVar",
                {file, variable.name, static_cast<double>(variable.datatype),
                 static_cast<double>(variable.elements), Array::row<double>(variable.sizes),
                 Array::scalar(variable.recordsVary), Array::row<double>(variances)});
}

std::string ModuleTest::distributionSample(const char* name) {
  const fs::path path = fs::path(AMBRIX_CDF_SAMPLES) / name;
  if (!fs::exists(path)) throw std::runtime_error("no sample file " + path.string());
  return path.string();
}

std::string ModuleTest::sample(const char* name) {
  const fs::path path = samplesFolder() / name;
  return fs::exists(path) ? path.string() : "";
}

LibraryDifferences ModuleTest::library() {
  int version = 0;
  for (const Array& part : results("getLibraryVersion"))
    version = 10 * version + static_cast<int>(part.data<double>()[0]);
  return LibraryDifferences(version);
}

std::string shown(const std::vector<Array>& arrays) {
  std::string text;
  for (const Array& array : arrays)
    text += (text.empty() ? "" : "; ") + shown(array);
  return text;
}

}  // namespace ambrix_test
