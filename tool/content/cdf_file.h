// An open CDF file, reached through the module's commands.
#pragma once

#include <cstddef>
#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "ambrix/module.h"

namespace ambrix::tool {

/// The bytes of a text from the module: the low 8 bits of each unit.
std::string bytesOf(ArrayView characters);

/// An open file, which is closed with this object.
class CdfFile {
 public:
  /// Throws `OpenError` with the cause when the file cannot be opened.
  static CdfFile open(Module& module, const std::string& path);
  /// Creates a file; the library appends ".cdf" to a path without that extension. Errors of the
  /// file, those of creating it included, become `FileError` with the name that people know.
  static CdfFile create(Module& module, std::string_view path, const std::string& shownName);
  CdfFile(CdfFile&& other) noexcept;
  CdfFile& operator=(CdfFile&&) = delete;
  /// Closes the file, silently; call `close` to learn whether that works.
  ~CdfFile();

  /// Calls a command with the file as its first argument.
  std::vector<Array> call(std::string_view command, std::span<const ArrayView> arguments);
  std::vector<Array> call(std::string_view command, std::initializer_list<double> arguments = {});

  /// The first result of a command, as a number or as the bytes of a text.
  double number(std::string_view command, std::initializer_list<double> arguments = {});
  std::string text(std::string_view command, std::initializer_list<double> arguments = {});

  void close();
  /// After a command that has closed or deleted the file.
  void forget() noexcept { id_ = Array(); }
  [[nodiscard]] Module& module() const noexcept { return *module_; }
  /// The name by which it was opened.
  [[nodiscard]] const std::string& path() const noexcept { return path_; }
  /// The file as an argument.
  [[nodiscard]] ArrayView id() const noexcept { return id_; }

 private:
  CdfFile(Module& module, std::string_view path, Array id)
      : module_(&module), path_(path), id_(std::move(id)) {}
  std::vector<Array> callNamed(std::string_view command, std::span<const ArrayView> arguments);
  static CdfFile from(Module& module, std::string_view command, std::string_view path);

  Module* module_;
  std::string path_;
  Array id_;
  std::string shownName_;  // of a file that was created
};

/// The value of a named constant.
double constantValue(Module& module, std::string_view name);

}  // namespace ambrix::tool
