// Whether an error in reading a file is the file's fault.
#include <algorithm>
#include <array>
#include <optional>
#include <string>
#include <string_view>
#include <variant>

#include "ambrix/file.h"
#include "tool/check/check.h"
#include "tool/supervision/scarcity.h"

namespace ambrix::tool {
namespace {

/// What the library calls its failures for want of something.
constexpr std::array<std::string_view, 7> kWants = {
    "BAD_MALLOC",          "SCRATCH_CREATE_ERROR", "SCRATCH_DELETE_ERROR", "SCRATCH_READ_ERROR",
    "SCRATCH_WRITE_ERROR", "BAD_SCRATCH_DIR",      "UNABLE_TO_PROCESS_CDF"};

bool isWant(const Error& error) {
  if (error.identifier() == "TOLVEX:host:outOfMemory") return true;
  if (!isLibraryFailure(error)) return false;
  const auto* const status = std::get_if<std::string>(&error.values().at(1));
  return status != nullptr && std::ranges::any_of(kWants, [&](std::string_view name) {
           return status->starts_with(name);
         });
}

void reportCause(const Problem& problem, bool want) {
  const Scarcity* const scarcity = findScarcity();
  if (scarcity != nullptr) reportUnread(problemOf(*scarcity));
  if (scarcity != nullptr || want) return reportUnread(problem);
  reportProblem(problem);
}

}  // namespace

void reportError(const std::string& place, const Error& error) {
  reportCause({place, error.identifier(), error.what()}, isWant(error));
}

void reportRefusal(const OpenError& error) {
  reportCause({"", error.identifier(), error.what()}, false);
}

}  // namespace ambrix::tool
