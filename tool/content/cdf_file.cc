#include "tool/content/cdf_file.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "tool/content/failure.h"
#include "tool/format/open_failure.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {

std::string bytesOf(ArrayView characters) {
  std::string bytes;
  std::ranges::transform(characters.chars(), std::back_inserter(bytes),
                         [](char16_t unit) { return static_cast<char>(unit); });
  return bytes;
}

CdfFile CdfFile::from(Module& module, std::string_view command, std::string_view path) try {
  return {module, path, std::move(module.call(command, {Array::fromUtf8(path)}).at(0))};
} catch (const std::invalid_argument&) {
  throw ToolError("badFileName", "the name of the file is not valid UTF-8");
}

CdfFile CdfFile::open(Module& module, const std::string& path) try {
  beginStep("opening the file");
  requireOpenable(path);
  return from(module, "open", path);
} catch (const Error& error) {
  if (!isOpenFailure(error)) throw;
  throw OpenError(explainRefusal(module, path));
}

CdfFile CdfFile::create(Module& module, std::string_view path, const std::string& shownName) try {
  CdfFile file = from(module, "create", path);
  file.shownName_ = shownName;
  return file;
} catch (const Error& error) {
  throw FileError(shownName, error.identifier(), error.what());
}

CdfFile::CdfFile(CdfFile&& other) noexcept
    : module_(other.module_),
      path_(std::move(other.path_)),
      id_(std::exchange(other.id_, Array())),
      shownName_(std::move(other.shownName_)) {}

CdfFile::~CdfFile() {
  try {
    close();
  } catch (const std::exception&) {
    // Another failure is on its way, or nobody wants to know.
  }
}

std::vector<Array> CdfFile::call(std::string_view command, std::span<const ArrayView> arguments) {
  std::vector<ArrayView> all = {id_};
  all.insert(all.end(), arguments.begin(), arguments.end());
  return callNamed(command, all);
}

/// Errors of a file that was created are told of it.
std::vector<Array> CdfFile::callNamed(std::string_view command,
                                      std::span<const ArrayView> arguments) try {
  return module_->call(command, arguments);
} catch (const Error& error) {
  if (shownName_.empty()) throw;
  throw FileError(shownName_, error.identifier(), error.what());
}

std::vector<Array> CdfFile::call(std::string_view command,
                                 std::initializer_list<double> arguments) {
  std::vector<Array> scalars;
  for (const double argument : arguments)
    scalars.push_back(Array::scalar(argument));
  return call(command, std::vector<ArrayView>(scalars.begin(), scalars.end()));
}

double CdfFile::number(std::string_view command, std::initializer_list<double> arguments) {
  return call(command, arguments).at(0).data<double>().front();
}

std::string CdfFile::text(std::string_view command, std::initializer_list<double> arguments) {
  return bytesOf(call(command, arguments).at(0));
}

void CdfFile::close() {
  if (!id_) return;
  const Array id = std::exchange(id_, Array());
  const ArrayView arguments[] = {id};
  callNamed("close", arguments);
}

double constantValue(Module& module, std::string_view name) {
  return module.call("getConstantValue", {Array::fromNarrow(name)}).at(0).data<double>().front();
}

}  // namespace ambrix::tool
