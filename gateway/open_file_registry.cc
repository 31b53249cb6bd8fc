#include "gateway/open_file_registry.h"

#include <unistd.h>

#include <cstdint>
#include <new>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

void insertInto(std::vector<CdfId>& files, CdfId file) {
  const auto place = std::ranges::lower_bound(files, file);
  if (place == files.end() || *place != file) files.insert(place, file);
}

}  // namespace

void OpenFileRegistry::reserve() {
  if (open_.size() == open_.capacity()) open_.reserve(2 * open_.size() + 1);
  openers_.reserve(open_.capacity());
  freed_.reserve(open_.capacity());  // so that a file can be marked at any time
  written_.reserve(open_.capacity());
}

void OpenFileRegistry::insert(CdfId file) {
  erase(file);
  reserve();
  const auto place = std::ranges::lower_bound(open_, file);
  openers_.insert(openers_.begin() + (place - open_.begin()), getpid());
  open_.insert(place, file);
}

void OpenFileRegistry::erase(CdfId file) {
  if (!contains(file)) return;
  const auto place = std::ranges::lower_bound(open_, file);
  openers_.erase(openers_.begin() + (place - open_.begin()));
  open_.erase(place);
  std::erase(freed_, file);
  std::erase(written_, file);
}

void OpenFileRegistry::markFreed(CdfId file) {
  if (contains(file)) insertInto(freed_, file);
}

void OpenFileRegistry::markWritten(CdfId file) {
  if (contains(file)) insertInto(written_, file);
}

bool OpenFileRegistry::isOfThisProcess(CdfId file) const {
  const auto place = std::ranges::lower_bound(open_, file);
  return openers_[static_cast<std::size_t>(place - open_.begin())] == getpid();
}

void OpenFileRegistry::clear() {
  open_ = std::vector<CdfId>();  // {} would keep the memory
  openers_ = std::vector<pid_t>();
  freed_ = std::vector<CdfId>();
  written_ = std::vector<CdfId>();
}

OpenFileRegistry& openFileRegistry() {
  alignas(OpenFileRegistry) static std::byte place[sizeof(OpenFileRegistry)];
  static auto& registry = *new (place) OpenFileRegistry;
  return registry;
}

CdfId getCdfIdArg(const qvArray* argument) {
  if (qvGetClassID(argument) != qvUINT64_CLASS || qvGetNumberOfElements(argument) != 1) {
    raiseError(validate::argumentNotUint64Scalar("CDFID"));
  }
  const CdfId file{*static_cast<const std::uint64_t*>(qvGetReadOnlyData(argument))};
  if (!openFileRegistry().contains(file)) raiseError(cdflib::invalidFileId());
  return file;
}

qvArray* makeCdfIdScalar(CdfId file) {
  constexpr std::size_t kScalar[] = {1, 1};
  qvArray* array = qvCreateNumericArray(2, kScalar, qvUINT64_CLASS, qvREAL);
  *static_cast<std::uint64_t*>(qvGetData(array)) = static_cast<std::uint64_t>(file);
  return array;
}

}  // namespace TOLVEX::ambrix
