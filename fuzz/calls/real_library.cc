// The CDF library behind the module, with files in the current folder.
#include <cdf.h>

#include <filesystem>
#include <fstream>
#include <string_view>

#include "fuzz/calls/backend.h"

namespace ambrix_fuzz {
namespace {

namespace fs = std::filesystem;

/// Two files that are none of the library's.
void layOutOddFiles() {
  std::ofstream("empty");
  std::ofstream("text.cdf") << "no CDF\n";
}

/// Legal input that makes the library write or compress gigabytes: numbers between `most` and 2^31
/// are replaced. Larger ones are left, for the module and the library to refuse.
struct Exclusion {
  const char* command;
  std::size_t argument;
  double most;
};

// A record is written whole and compressed whole, so records are kept small: their sizes multiply.
constexpr Exclusion kExclusions[] = {
    {"createVar", 3, 100},  // number of elements
    {"createVar", 4, 12},   // sizes of dimensions
};

void exclude(const Exclusion& exclusion, std::vector<ambrix::Array>& arguments) {
  constexpr double kEnd = 2147483648.0;
  if (exclusion.argument >= arguments.size()) return;
  ambrix::Array& argument = arguments[exclusion.argument];
  if (argument.classId() != ambrix::ClassId::kDouble) return;
  for (double& number : argument.mutableData<double>()) {
    if (number > exclusion.most && number < kEnd) number = exclusion.most;
  }
}

}  // namespace

void beginSequence(Choices&) {
  CDFsetValidate(VALIDATEFILEon);
  CDFsetFileBackward(BACKWARDFILEoff);
  layOutOddFiles();
}

void endSequence() {
  std::error_code ignored;
  for (const fs::directory_entry& entry : fs::directory_iterator("."))
    fs::remove_all(entry.path(), ignored);
}

void beforeCall(Choices&) {}

std::optional<Variable> scriptedVariable() {
  return std::nullopt;
}

void confine(const char* command, std::vector<ambrix::Array>& arguments) {
  for (const Exclusion& exclusion : kExclusions) {
    if (std::string_view(command) == exclusion.command) exclude(exclusion, arguments);
  }
}

}  // namespace ambrix_fuzz
