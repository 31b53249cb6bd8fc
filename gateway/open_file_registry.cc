#include "gateway/open_file_registry.h"

#include <cstdint>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

OpenFileRegistry registry;

}  // namespace

void OpenFileRegistry::insert(CdfId file) {
  open_.insert(file);
  freed_.erase(file);
}

void OpenFileRegistry::erase(CdfId file) {
  open_.erase(file);
  freed_.erase(file);
}

OpenFileRegistry& openFileRegistry() {
  return registry;
}

CdfId getCdfIdArg(const qvArray* argument) {
  if (qvGetClassID(argument) != qvUINT64_CLASS || qvGetNumberOfElements(argument) != 1) {
    raiseError(validate::argumentNotUint64Scalar("CDFID"));
  }
  const CdfId file{*static_cast<const std::uint64_t*>(qvGetReadOnlyData(argument))};
  if (!registry.contains(file)) raiseError(cdflib::invalidFileId());
  return file;
}

qvArray* makeCdfIdScalar(CdfId file) {
  constexpr std::size_t kScalar[] = {1, 1};
  qvArray* array = qvCreateNumericArray(2, kScalar, qvUINT64_CLASS, qvREAL);
  *static_cast<std::uint64_t*>(qvGetData(array)) = static_cast<std::uint64_t>(file);
  return array;
}

}  // namespace TOLVEX::ambrix
