// A file for the Python side of the package.
#pragma once

#include <nanobind/nanobind.h>

#include <memory>
#include <string>
#include <vector>

#include "ambrix/file.h"

namespace ambrix::python {

/// A block of a variable's values as Python asks for it: sizes are in the order of dimensions in
/// arrays of the module.
struct Block {
  std::size_t firstRecord;
  std::size_t records;
  std::size_t recordStep;
  std::vector<std::size_t> start;
  std::vector<std::size_t> count;
  std::vector<std::size_t> step;
};

/// An open file. Each member is one turn with the module.
class OpenFile {
 public:
  /// Opens a file for reading.
  explicit OpenFile(const std::string& path);
  OpenFile(const OpenFile&) = delete;
  OpenFile& operator=(const OpenFile&) = delete;
  /// Closes the file, and tells nobody when that fails. In a child of the process that has opened
  /// it the file is left alone.
  ~OpenFile();

  void close();
  /// What the file is, as dictionaries, lists and arrays; values of entries have no conversion.
  nanobind::object describe();
  nanobind::object read(std::size_t variable, const Block& block);
  /// Reads into the memory of an array that has the order, type and size of the block.
  void readInto(std::size_t variable, const Block& block, nanobind::handle array);
  std::size_t blockingFactor(std::size_t variable);

 private:
  void closeSilently() noexcept;

  std::unique_ptr<File> file_;
  int process_;
};

/// Adds the class to the extension.
void bindOpenFile(nanobind::module_& module);

}  // namespace ambrix::python
