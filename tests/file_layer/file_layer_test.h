// Tests of ambrix::File, in a temporary folder with a module of its own.
#pragma once

#include <ambrix/file.h>
#include <ambrix/texts.h>
#include <ambrix/times.h>

#include <functional>
#include <string>

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
};

/// A row of numbers of a class.
template <typename T>
Array rowOf(std::initializer_list<T> values) {
  return Array::row(values);
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
