#include "ambrix/file_error.h"

namespace ambrix {

FileError::FileError(const std::string& file, const char* identifier, const std::string& reason)
    : std::runtime_error(file + ": " + reason),
      identifier_(std::string("ambrix:") + identifier),
      file_(file),
      reason_(reason) {}

FileError::~FileError() = default;

}  // namespace ambrix
