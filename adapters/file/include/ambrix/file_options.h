// How a file is opened.
#pragma once

#include <cstddef>
#include <filesystem>
#include <string_view>

#include "ambrix/error.h"
#include "ambrix/export.h"

namespace ambrix {

/// Something that begins in a file and may take long, or never end with a damaged file.
struct Step {
  enum class Kind { kOpening, kVariable, kAttribute, kValues };
  Kind kind;
  std::size_t number = 0;      // of the variable or attribute
  std::string_view name = {};  // its name, if that is known already
};

/// Is told what happens in a file.
class AMBRIX_EXPORT FileObserver {
 public:
  virtual ~FileObserver();
  virtual void begins(const Step& step);
  /// A command on the file has raised this error, which the file is about to throw. May throw
  /// another in its place.
  virtual void failed(const Error& error);
};

enum class Access { kRead, kWrite };

struct FileOptions {
  /// A file opened for reading is quicker, and members of `File` refuse to change it. Commands
  /// called by `File::call` are refused by the library, but not in a file with more than 2^20
  /// numbers of entries: the library cannot make that one read-only.
  Access access = Access::kRead;
  FileObserver* observer = nullptr;  // must outlive the file
  /// Where a copy of the file may be, if it takes one to find its entries; empty means the folder
  /// for temporary files.
  std::filesystem::path scratchFolder = {};
};

}  // namespace ambrix
