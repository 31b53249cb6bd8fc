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

constexpr double kLast = 2147483647;  // that the library can tell from others
constexpr double kEnd = 2147483648;

/// Legal input on which the library itself fails or works for hours: of an argument of a command,
/// the numbers from `first` up to and without `end` are replaced. What is beyond 32 bits is left,
/// for the module to refuse.
struct Exclusion {
  const char* command;
  std::size_t argument;
  double first;
  double end;
  double instead;
  bool onlyBefore39 = false;
};

constexpr Exclusion kExclusions[] = {
    // A record is written whole, compressed whole and padded whole, and its sizes multiply.
    {"createVar", 3, 101, kEnd, 100},
    {"createVar", 4, 13, kEnd, 12},
    // Records up to the one that is written, allocated or asked for are written, gigabytes of them.
    {"putVarData", 2, 1001, kLast, 1000},
    {"putVarRecordData", 2, 1001, kLast, 1000},
    {"hyperPutVarData", 2, 1001, kLast - 1, 1000},
    {"hyperPutVarData", 4, 101, kLast - 1000, 100},
    {"setVarAllocBlockRecords", 2, 1001, kEnd, 1000},
    {"setVarAllocBlockRecords", 3, 1001, kEnd, 1000},
    {"setVarInitialRecs", 2, 1001, kEnd, 1000},
    {"setVarBlockingFactor", 2, 1001, kEnd, 1000},
    // CDF 3.6.3 gives a file up when it is compressed with little data in it, and then computes the
    // checksum with memory that it has freed.
    {"setChecksum", 1, 1, 3, 0, true},
    // Of compressed variables it must delete all records: after other deletions it damages the
    // file.
    {"deleteVarRecords", 2, 1, kEnd, 0, true},
    {"deleteVarRecords", 3, 0, kLast, kLast, true},
};

bool isBefore39() {
  long version = 0, release = 0;
  CDFlib(GET_, LIB_VERSION_, &version, LIB_RELEASE_, &release, NULL_);
  return version < 3 || (version == 3 && release < 9);
}

void exclude(const Exclusion& exclusion, std::vector<ambrix::Array>& arguments) {
  if (exclusion.argument >= arguments.size()) return;
  ambrix::Array& argument = arguments[exclusion.argument];
  if (argument.classId() != ambrix::ClassId::kDouble) return;
  for (double& number : argument.mutableData<double>()) {
    if (number >= exclusion.first && number < exclusion.end) number = exclusion.instead;
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
  static const bool before39 = isBefore39();
  for (const Exclusion& exclusion : kExclusions) {
    const bool here = before39 || !exclusion.onlyBefore39;
    if (here && std::string_view(command) == exclusion.command) exclude(exclusion, arguments);
  }
}

}  // namespace ambrix_fuzz
