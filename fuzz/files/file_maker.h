// Making a file with commands of the module.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "ambrix/module.h"

namespace ambrix::fuzz {

struct NewVariable {
  std::string name;
  const char* datatype;
  double elements = 1;
  std::vector<double> sizes = {};
};

/// A file that is being made. Constants are named as the library names them.
class FileMaker {
 public:
  FileMaker(Module& module, const std::string& path);

  double constant(const char* name);
  /// Calls a command whose further arguments are numbers.
  void set(const char* command, const std::vector<double>& numbers);

  /// Creates a variable and returns its number.
  double createVariable(const NewVariable& variable);
  /// Writes records from `first` on: values that every run has, and every compression likes.
  void fill(double number, const NewVariable& variable, double first, double records);
  void addVariable(const NewVariable& variable, double records);
  /// Creates an attribute and as many entries, texts and numbers in turns.
  void addAttribute(const std::string& name, const char* scope, double entries);
  void close();

 private:
  std::vector<Array> call(const char* command, std::span<const Array> arguments);

  Module& module_;
  Array id_;
  double attributes_ = 0;
};

}  // namespace ambrix::fuzz
