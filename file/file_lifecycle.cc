#include "file/file_lifecycle.h"

#include <cdf.h>

#include <cstdint>
#include <string>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library_calls.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

// The library cuts a longer path, creates or opens the file of the shorter one and then reports a
// failure, which would leave a file open that nobody can close.
bool fitsPath(const std::string& name) {
  return name.size() <= CDF_PATHNAME_LEN;
}

/// Takes all memory that registering a file needs: once the library has opened one, nothing may
/// keep its identifier from the user.
qvArray* prepareIdentifier() {
  openFileRegistry().reserve();
  return makeCdfIdScalar(CdfId{});
}

void registerAndReturn(void* handle, qvArray* identifier, qvArray* outputs[]) {
  const CdfId file = cdfIdOf(handle);
  openFileRegistry().insert(file);
  *static_cast<std::uint64_t*>(qvGetData(identifier)) = static_cast<std::uint64_t>(file);
  outputs[0] = identifier;
}

// The library removes what it can and then frees the file, unless it refuses to begin. A warning,
// which is a failure to users, comes from a deletion that was carried out.
bool freesFile(long deleteStatus) {
  const bool warning = deleteStatus < CDF_OK && deleteStatus > CDF_WARN;
  return warning || deleteStatus == CDF_DELETE_ERROR || deleteStatus == VAR_DELETE_ERROR ||
         deleteStatus == SCRATCH_DELETE_ERROR;
}

/// For an end of the module at which nobody can be told of failures.
void closeSilently(CdfId file) {
  OpenFileRegistry& registry = openFileRegistry();
  if (registry.isFreed(file)) return;
  CDFlib(SELECT_, CDF_, libraryHandle(file, "CDFcloseCDF"), CLOSE_, CDF_, NULL_);
  registry.markFreed(file);  // it stays registered, should the host call again
}

/// At its end all files are closed, however that comes.
struct ClosingAll {
  ClosingAll() = default;
  ClosingAll(const ClosingAll&) = delete;
  ClosingAll& operator=(const ClosingAll&) = delete;
  ~ClosingAll() {
    for (const CdfId file : openFileRegistry().files())
      closeSilently(file);
  }
};

/// For a process that ends without unloading the module: what was written and not closed would be
/// lost. Files that a parent has opened are left to it.
struct ClosingAtExit {
  ClosingAtExit() = default;
  ClosingAtExit(const ClosingAtExit&) = delete;
  ClosingAtExit& operator=(const ClosingAtExit&) = delete;
  ~ClosingAtExit() {
    OpenFileRegistry& registry = openFileRegistry();
    for (const CdfId file : registry.files())
      if (registry.isOfThisProcess(file)) closeSilently(file);
    registry.clear();
  }
};
const ClosingAtExit closingAtExit;

}  // namespace

void createFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  std::string name = getFilenameArg(arguments[0]);
  if (!fitsPath(name)) raiseError(cdflib::fileCreateError());
  qvArray* identifier = prepareIdentifier();
  CDFid handle = nullptr;
  if (CDFcreateCDF(name.data(), &handle) < 0) raiseError(cdflib::fileCreateError());
  registerAndReturn(handle, identifier, outputs);
}

void openFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
              const CommandEntry*) {
  const std::string name = getFilenameArg(arguments[0]);
  if (!fitsPath(name)) raiseError(cdflib::fileOpenError());
  qvArray* identifier = prepareIdentifier();
  CDFid handle = nullptr;
  if (CDFlib(OPEN_, CDF_, name.c_str(), &handle, NULL_) < 0) raiseError(cdflib::fileOpenError());
  callLibrary("CDFsetzMode", SELECT_, CDF_, handle, CDF_zMODE_, zMODEon2);
  registerAndReturn(handle, identifier, outputs);
}

void closeFile(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const char* routine = "CDFcloseCDF";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long status = CDFlib(SELECT_, CDF_, libraryHandle(file, routine),  //
                             CLOSE_, CDF_,                                 //
                             NULL_);
  if (status < 0) openFileRegistry().markFreed(file);  // the library frees it whatever goes wrong
  checkLibraryStatus(status, routine);
  openFileRegistry().erase(file);
}

void deleteFile(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const char* routine = "CDFdelete";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long status = CDFlib(SELECT_, CDF_, libraryHandle(file, routine),  //
                             DELETE_, CDF_,                                //
                             NULL_);
  if (freesFile(status)) openFileRegistry().markFreed(file);
  checkLibraryStatus(status, routine);
  openFileRegistry().erase(file);
}

void abandonFile(CdfId file) {
  OpenFileRegistry& registry = openFileRegistry();
  if (registry.contains(file)) closeSilently(file);
  registry.erase(file);
}

void closeAllOnUnload() {
  if (openFileRegistry().size() == 0) return;
  const ClosingAll closing;  // even if the host makes an error of the warning
  qvWarningMsgId(cdflib::closingFileHandle());
}

}  // namespace TOLVEX::ambrix
