// Variables: finding, defining, describing them.
#include <algorithm>
#include <utility>
#include <variant>

#include "adapters/file/extended_calls.h"
#include "adapters/file/names.h"
#include "adapters/file/numbers.h"
#include "ambrix/file.h"
#include "ambrix/texts.h"

namespace ambrix {
namespace {

/// A name of a datatype that is new to the table is of a later library; it has no code here.
Variable definitionOf(std::size_t number, const std::vector<Array>& facts) {
  Variable variable;
  variable.number = number;
  variable.name = bytesOf(facts.at(0));
  const auto datatype = datatypeNamed(bytesOf(facts.at(1)));
  variable.datatype = datatype.value_or(Datatype{});
  variable.supported = datatype.has_value();
  variable.elements = sizeOf(facts.at(2).data<double>().front());
  for (const double size : facts.at(3).data<double>())
    variable.sizes.push_back(sizeOf(size));
  variable.recordVaries = facts.at(4).data<bool>().front();
  for (const bool varies : facts.at(5).data<bool>())
    variable.varies.push_back(varies);
  return variable;
}

Array rowOfLogicals(const std::vector<bool>& values) {
  Array row = Array::zeros(ClassId::kLogical, {1, values.size()});
  std::ranges::copy(values, row.mutableData<bool>().begin());
  return row;
}

}  // namespace

bool isLibraryFailure(const Error& error) {
  return error.identifier() == "TOLVEX:ambrix:cdflib:libraryFailure";
}

bool isLibraryFailure(const Error& error, std::string_view status) {
  if (!isLibraryFailure(error)) return false;
  const auto* const text = std::get_if<std::string>(&error.values().at(1));
  return text != nullptr && text->starts_with(std::string(status) + ':');
}

std::optional<Datatype> unsupportedDatatype(const Error& error) {
  if (error.identifier() != "TOLVEX:ambrix:cdflib:unrecognizedValue") return std::nullopt;
  if (error.values().at(1) != MessageArg(std::string("DATATYPE"))) return std::nullopt;
  return static_cast<Datatype>(std::get<std::int64_t>(error.values().front()));
}

/// "inquire" does not tell of files in an unknown encoding.
std::size_t File::variableCount() try {
  return sizeOf(attempt("inquire").at(3).data<double>().front());
} catch (const Error& error) {
  if (isLibraryFailure(error)) fail(error);
  std::size_t count = 0;
  try {
    for (;; ++count)
      attempt("getVarName", static_cast<double>(count));
  } catch (const Error& end) {
    if (!isLibraryFailure(end, "NO_SUCH_VAR")) fail(end);
    return count;
  }
}

Variable File::variable(std::size_t number) try {
  announce(Step::Kind::kVariable, number);
  const ExtendedCalls extended(*module_);
  return definitionOf(number, attempt("inquireVar", static_cast<double>(number)));
} catch (const Error& error) {
  const auto datatype = unsupportedDatatype(error);
  if (!datatype) fail(error);
  Variable variable;
  variable.number = number;
  variable.name = text("getVarName", {static_cast<double>(number)});
  variable.datatype = *datatype;
  variable.supported = false;
  return variable;
}

std::optional<std::size_t> File::find(std::string_view command, std::string_view name,
                                      std::span<const std::string_view> missing) try {
  const Array text = Array::fromNarrow(name);
  const ArrayView arguments[] = {text};
  return sizeOf(attempt(command, arguments).at(0).data<double>().front());
} catch (const Error& error) {
  const auto isStatus = [&](std::string_view status) { return isLibraryFailure(error, status); };
  if (std::ranges::none_of(missing, isStatus)) fail(error);
  return std::nullopt;
}

std::optional<std::size_t> File::findVariable(std::string_view name) {
  // Of a file that was opened, not created, the library takes zVariables only: "illegal" stands for
  // "no such variable" there.
  constexpr std::string_view kMissing[] = {"NO_SUCH_VAR", "ILLEGAL_IN_zMODE", "BAD_VAR_NAME"};
  return find("getVarNum", name, kMissing);
}

Variable File::variable(std::string_view name) {
  if (const auto number = findVariable(name)) return variable(*number);
  const auto nameOf = [this](std::size_t number) {
    return text("getVarName", {static_cast<double>(number)});
  };
  throw FileError(path(), "noSuchVariable",
                  missing("variable", name, namesOf(variableCount(), nameOf)));
}

std::vector<Variable> File::variables() {
  std::vector<Variable> all;
  const std::size_t count = variableCount();
  for (std::size_t number = 0; number < count; ++number)
    all.push_back(variable(number));
  return all;
}

Variable File::createVariable(Variable definition) {
  if (definition.varies.empty()) definition.varies.assign(definition.sizes.size(), true);
  const Array name = Array::fromNarrow(definition.name);
  const Array datatype = Array::scalar(static_cast<double>(definition.datatype));
  const Array elements = Array::scalar(static_cast<double>(definition.elements));
  const Array sizes = rowOf(definition.sizes);
  const Array recordVaries = Array::scalar(definition.recordVaries);
  const Array varies = rowOfLogicals(definition.varies);
  const ArrayView arguments[] = {name, datatype, elements, sizes, recordVaries, varies};
  definition.number = sizeOf(change("createVar", arguments).at(0).data<double>().front());
  return definition;
}

void File::renameVariable(const Variable& variable, std::string_view name) {
  const Array number = Array::scalar(numberOf(variable));
  const Array text = Array::fromNarrow(name);
  const ArrayView arguments[] = {number, text};
  change("renameVar", arguments);
}

void File::deleteVariable(const Variable& variable) {
  change("deleteVar", {numberOf(variable)});
}

VariableDescription File::describeVariable(std::size_t number) {
  VariableDescription description;
  description.definition = variable(number);
  const Variable& variable = description.definition;
  description.records = recordCount(variable);
  description.written = recordsWritten(variable);
  description.compression = compression(variable);
  description.sparseRecords = sparseRecords(variable);
  if (variable.supported) description.padValue = padValue(variable);
  return description;
}

}  // namespace ambrix
