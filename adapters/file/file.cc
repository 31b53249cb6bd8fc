// Opening, calling and closing.
#include "ambrix/file.h"

#include <unistd.h>

#include <stdexcept>
#include <system_error>
#include <utility>

#include "adapters/file/extended_calls.h"
#include "ambrix/texts.h"

namespace ambrix {
namespace {

namespace fs = std::filesystem;

/// How many numbers the library may list in its tables.
constexpr std::int64_t kNumbersListed = 1 << 20;

/// The working directory may be another one later.
fs::path absolute(const fs::path& path) {
  std::error_code error;
  fs::path place = fs::absolute(path, error);
  return error ? path : place;
}

}  // namespace

fs::path fileOnDisk(const fs::path& path) {
  std::error_code ignored;
  for (const char* const extension : {"", ".cdf", ".CDF"}) {
    fs::path file = path;
    file += extension;
    if (fs::is_regular_file(file, ignored)) return file;
  }
  return path;
}

double constantValue(Module& module, std::string_view name) {
  return module.call("getConstantValue", {Array::fromNarrow(name)}).at(0).data<double>().front();
}

File::File(Module& module, std::string_view command, std::string path, const FileOptions& options)
    : module_(&module),
      path_(std::make_shared<const std::string>(std::move(path))),
      place_(absolute(*path_)),
      options_(options),
      process_(::getpid()) {
  try {
    id_ = std::move(module.call(command, {Array::fromUtf8(*path_)}).at(0));
  } catch (const Error& error) {
    fail(error);
  } catch (const std::invalid_argument&) {
    throw FileError(*path_, "badFileName", "the name of the file is not valid UTF-8");
  }
}

File File::open(Module& module, const fs::path& path, const FileOptions& options) {
  if (options.observer != nullptr) options.observer->begins({Step::Kind::kOpening});
  File file(module, "open", path.string(), options);
  if (options.access == Access::kRead) file.setReadOnly();
  return file;
}

File File::create(Module& module, const fs::path& path, const FileOptions& options) {
  File file(module, "create", path.string(), options);
  file.options_.access = Access::kWrite;
  return file;
}

/// Asks the library not to keep the file ready for changes, which makes it much quicker. It then
/// has a table of all numbers that entries could have: not where that would fill the memory.
void File::setReadOnly() {
  const std::size_t attributes = attributeCount();
  std::int64_t numbers = 0;
  for (std::size_t number = 0; number < attributes && numbers <= kNumbersListed; ++number)
    numbers += attribute(number).maxEntry + 1;
  if (numbers > kNumbersListed) return;
  call("setReadOnlyMode", {constantValue(*module_, "READONLYON")});
}

File::File(File&& other) noexcept
    : module_(other.module_),
      path_(other.path_),
      place_(std::move(other.place_)),
      options_(std::move(other.options_)),
      id_(std::exchange(other.id_, Array())),
      process_(other.process_) {}

File& File::operator=(File&& other) noexcept {
  if (this == &other) return *this;
  const File old(std::move(*this));
  module_ = other.module_;
  path_ = other.path_;
  place_ = std::move(other.place_);
  options_ = std::move(other.options_);
  id_ = std::exchange(other.id_, Array());
  process_ = other.process_;
  return *this;
}

File::~File() {
  options_.observer = nullptr;
  try {
    close();
  } catch (...) {
    // Another failure is on its way, or nobody wants to know.
  }
}

void File::close() {
  if (!id_) return;
  const Array id = std::exchange(id_, Array());
  if (process_ != ::getpid()) return;
  try {
    module_->call("close", {id});
  } catch (const Error& error) {
    fail(error);
  }
}

void File::remove() {
  change("delete", {});
}

/// Inside a handler. What the observer throws takes the place of the error.
void File::fail(const Error& error) const {
  if (options_.observer != nullptr) options_.observer->failed(error);
  throw;
}

std::vector<Array> File::attempt(std::string_view command, std::span<const ArrayView> arguments) {
  requireOpen();
  std::vector<ArrayView> all;
  all.reserve(arguments.size() + 1);
  all.push_back(id_);
  all.insert(all.end(), arguments.begin(), arguments.end());
  return module_->call(command, all);
}

std::vector<Array> File::attempt(std::string_view command, double argument) {
  const Array number = Array::scalar(argument);
  const ArrayView arguments[] = {number};
  return attempt(command, arguments);
}

std::vector<Array> File::call(std::string_view command, std::span<const ArrayView> arguments) try {
  std::vector<Array> results = attempt(command, arguments);
  if (command == "close" || command == "delete") id_ = Array();
  return results;
} catch (const Error& error) {
  fail(error);
}

std::vector<Array> File::call(std::string_view command, std::initializer_list<double> arguments) {
  std::vector<Array> scalars;
  scalars.reserve(arguments.size());
  for (const double argument : arguments)
    scalars.push_back(Array::scalar(argument));
  return call(command, std::vector<ArrayView>(scalars.begin(), scalars.end()));
}

std::vector<Array> File::change(std::string_view command, std::span<const ArrayView> arguments) {
  requireWritable();
  const ExtendedCalls extended(*module_);
  return call(command, arguments);
}

std::vector<Array> File::change(std::string_view command, std::initializer_list<double> arguments) {
  requireWritable();
  const ExtendedCalls extended(*module_);
  return call(command, arguments);
}

void File::requireOpen() const {
  if (!id_) throw FileError(*path_, "fileClosed", "the file is closed; open it again");
}

void File::requireWritable() const {
  if (options_.access == Access::kWrite) return;
  throw FileError(*path_, "openedForReading",
                  "the file was opened for reading; open it with Access::kWrite to change it");
}

double File::number(std::string_view command, std::initializer_list<double> arguments) {
  return call(command, arguments).at(0).data<double>().front();
}

std::string File::text(std::string_view command, std::initializer_list<double> arguments) {
  return bytesOf(call(command, arguments).at(0));
}

void File::announce(Step::Kind kind, std::size_t number, std::string_view name) const {
  if (options_.observer != nullptr) options_.observer->begins({kind, number, name});
}

}  // namespace ambrix
