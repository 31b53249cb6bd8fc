// Prints the records of a variable of numbers, each after its time.
//
// usage: show_times FILE VARIABLE

#include <ambrix/file.h>
#include <ambrix/texts.h>
#include <ambrix/times.h>
#include <ambrix/visit.h>

#include <cstddef>
#include <exception>
#include <iostream>
#include <span>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::File;
using ambrix::Variable;

/// The variable of the times: the attribute DEPEND_0 has its name.
Variable timesOf(File& file, const Variable& variable) {
  const auto name = file.attributeValue(variable, "DEPEND_0");
  if (!name) throw std::runtime_error(variable.name + " has no DEPEND_0");
  return file.variable(ambrix::bytesOf(*name));
}

/// All elements of the records lie one after the other.
void printRecords(std::span<const double> numbers, const std::vector<std::string>& times) {
  const std::size_t width = times.empty() ? 0 : numbers.size() / times.size();
  for (std::size_t record = 0; record < times.size(); ++record) {
    std::cout << times[record] << ':';
    for (const double number : numbers.subspan(record * width, width))
      std::cout << ' ' << number;
    std::cout << '\n';
  }
}

/// The elements of an array of any class of numbers.
std::vector<double> asDoubles(ArrayView values) {
  return ambrix::visit(values, ambrix::Overloaded{[](ArrayView) { return std::vector<double>(); },
                                                  [](auto elements) {
                                                    return std::vector<double>(elements.begin(),
                                                                               elements.end());
                                                  }});
}

void showTimes(const char* path, const char* name) {
  ambrix::Module module;
  File file = File::open(module, path);
  const Variable variable = file.variable(name);
  const Variable times = timesOf(file, variable);
  const Array values = file.read(variable);
  printRecords(asDoubles(values), ambrix::timesAsText(module, file.read(times), times.datatype));
}

}  // namespace

int main(int argumentCount, char** arguments) {
  if (argumentCount != 3) {
    std::cerr << "usage: show_times FILE VARIABLE\n";
    return 2;
  }
  try {
    showTimes(arguments[1], arguments[2]);
    return 0;
  } catch (const std::exception& error) {
    std::cerr << "show_times: " << error.what() << '\n';
    return 1;
  }
}
