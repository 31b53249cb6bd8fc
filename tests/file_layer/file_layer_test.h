// Tests of ambrix::File, in a temporary folder with a module of its own.
#pragma once

#include <ambrix/file.h>
#include <ambrix/texts.h>
#include <ambrix/times.h>

#include <fstream>
#include <functional>
#include <string>

#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {

using ::ambrix::Access;
using ::ambrix::Attribute;
using ::ambrix::Compression;
using ::ambrix::Datatype;
using ::ambrix::Entry;
using ::ambrix::File;
using ::ambrix::FileError;
using ::ambrix::FileOptions;
using ::ambrix::Slab;
using ::ambrix::Variable;

class FileLayerTest : public ModuleTest {
 protected:
  File create(const char* name = "new") { return File::create(module, name); }
  File open(const std::string& name = "new", Access access = Access::kRead) {
    return File::open(module, name, {access});
  }
  /// Lets the module open damaged files.
  void setValidationOff() {
    const double off = ::ambrix::constantValue(module, "VALIDATEFILEOFF");
    module.call("setValidate", {Array::scalar(off)});
  }
};

/// A row of numbers of a class.
template <typename T>
Array rowOf(std::initializer_list<T> values) {
  return Array::row(values);
}

/// How far before the name of a variable or an attribute its other facts are in a file.
constexpr std::size_t kDatatypeToName = 64;
constexpr std::size_t kNextToName = 72;
constexpr std::size_t kEntriesToName = 20;
constexpr std::size_t kMaxEntryToName = 8;

/// A place in a file behind its end.
const std::string kFarPlace("\0\0\0\0\x7F\0\0\0", 8);

/// Puts bytes before the name of a variable or an attribute.
inline void changeBeforeName(const std::string& path, const std::string& name, std::size_t distance,
                             const std::string& bytes) {
  const std::size_t place = fileBytes(path).find(name + '\0');
  std::fstream file(path, std::ios::in | std::ios::out | std::ios::binary);
  file.seekp(static_cast<std::streamoff>(place - distance));
  file << bytes;
}

/// What the error of the file says: "ambrix:noSuchVariable: new: there is no ...".
inline std::string errorOf(const std::function<void()>& action) {
  try {
    action();
  } catch (const FileError& error) {
    return error.identifier() + ": " + error.what();
  } catch (const ::ambrix::Error& error) {
    return messageText(error.id());
  }
  return "no error";
}

}  // namespace ambrix_test
