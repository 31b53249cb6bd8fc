#include "tool/content/variable.h"

#include <fmt/format.h>

#include <string>
#include <variant>

#include "tool/content/values.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

Variable describe(double number, const std::vector<Array>& facts) {
  Variable variable;
  variable.number = number;
  variable.name = bytesOf(facts.at(0));
  variable.datatype = bytesOf(facts.at(1));
  variable.elements = static_cast<std::size_t>(facts.at(2).data<double>().front());
  for (const double size : facts.at(3).data<double>())
    variable.sizes.push_back(static_cast<std::size_t>(size));
  variable.recordVaries = facts.at(4).data<bool>().front();
  for (const bool varies : facts.at(5).data<bool>())
    variable.varies.push_back(varies);
  return variable;
}

}  // namespace

std::size_t Variable::recordElements() const {
  std::size_t count = hostElements(datatype, elements);
  for (const std::size_t size : sizes)
    count *= size;
  return count;
}

Variable inquireVariable(CdfFile& file, double number) try {
  beginStep(fmt::format("reading the definition of variable {}", number));
  return describe(number, file.call("inquireVar", {number}));
} catch (const Error& error) {
  const auto code = unsupportedDatatype(error);
  if (!code) throw;
  Variable variable;
  variable.number = number;
  variable.name = file.text("getVarName", {number});
  variable.datatype = unsupportedName(*code);
  variable.supported = false;
  return variable;
}

double countVariables(CdfFile& file) try {
  return file.call("inquire").at(3).data<double>().front();
} catch (const Error& error) {
  if (isLibraryFailure(error)) throw;
  double count = 0;
  try {
    for (;; ++count)
      file.call("getVarName", {count});
  } catch (const Error&) {
    return count;
  }
}

std::optional<std::int64_t> unsupportedDatatype(const Error& error) {
  if (error.identifier() != "TOLVEX:ambrix:cdflib:unrecognizedValue") return std::nullopt;
  if (error.values().at(1) != MessageArg(std::string("DATATYPE"))) return std::nullopt;
  return std::get<std::int64_t>(error.values().front());
}

std::string unsupportedName(std::int64_t code) {
  constexpr std::int64_t kInt8 = 8;
  constexpr std::int64_t kTimeTt2000 = 33;
  if (code == kInt8) return "cdf_int8";
  if (code == kTimeTt2000) return "cdf_time_tt2000";
  return "datatype " + std::to_string(code);
}

bool isLibraryFailure(const Error& error) {
  return error.identifier() == "TOLVEX:ambrix:cdflib:libraryFailure";
}

}  // namespace ambrix::tool
