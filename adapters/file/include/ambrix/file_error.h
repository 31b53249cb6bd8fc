// What File itself refuses. Errors of the module's commands remain `Error`.
#pragma once

#include <stdexcept>
#include <string>

#include "ambrix/export.h"

namespace ambrix {

/// `what()` tells the file, what is wrong and what to do about it.
///
/// | identifier | when |
/// |---|---|
/// | ambrix:noSuchVariable | there is no variable of that name |
/// | ambrix:noSuchAttribute | there is no attribute of that name |
/// | ambrix:unsupportedDatatype | the values are of a datatype that is not known |
/// | ambrix:wrongScope | a global attribute is to be set for a variable, or the reverse |
/// | ambrix:partOfRecord | what is to be written is no number of whole records |
/// | ambrix:wrongSize | the memory for values is of another size than these |
/// | ambrix:openedForReading | a file that was opened for reading is to be changed |
/// | ambrix:fileClosed | the file was closed, deleted or moved from |
/// | ambrix:badFileName | the name of the file is no valid UTF-8 |
/// | ambrix:noScratchCopy | entries cannot be found without a copy of the file |
///
/// Entries with numbers far apart are looked for in a copy of the file. There is none if it cannot
/// be written, and if the file was opened for writing.
class AMBRIX_EXPORT FileError : public std::runtime_error {
 public:
  FileError(const std::string& file, const char* identifier, const std::string& reason);
  ~FileError() override;

  [[nodiscard]] const std::string& identifier() const noexcept { return identifier_; }
  /// The file, by the name with which it was opened.
  [[nodiscard]] const std::string& file() const noexcept { return file_; }
  /// `what()` without the file.
  [[nodiscard]] const std::string& reason() const noexcept { return reason_; }

 private:
  std::string identifier_;
  std::string file_;
  std::string reason_;
};

}  // namespace ambrix
