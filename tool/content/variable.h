// What a variable of a file is.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "ambrix/error.h"
#include "tool/content/cdf_file.h"

namespace ambrix::tool {

/// A variable's definition. Sizes and variances are in the host's order, fastest first.
struct Variable {
  double number = 0;
  std::string name;       // as bytes
  std::string datatype;   // as the module names it: "cdf_int4"
  bool supported = true;  // else nothing below is known
  std::size_t elements = 0;
  std::vector<std::size_t> sizes;
  bool recordVaries = true;
  std::vector<bool> varies;

  /// The host elements of a record.
  [[nodiscard]] std::size_t recordElements() const;
};

Variable inquireVariable(CdfFile& file, double number);

/// The number of variables, which "inquire" does not tell of files in an unknown encoding.
double countVariables(CdfFile& file);

/// The code of the datatype, if the error is that the module does not support it.
std::optional<std::int64_t> unsupportedDatatype(const Error& error);
/// Its name as the module would name it, for the datatypes that the library has.
std::string unsupportedName(std::int64_t code);

/// Whether the library has failed, and not an argument.
bool isLibraryFailure(const Error& error);

}  // namespace ambrix::tool
