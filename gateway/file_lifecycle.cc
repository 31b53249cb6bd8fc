#include "gateway/file_lifecycle.h"

#include <cdf.h>

#include <string>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

void registerAndReturn(void* handle, qvArray* outputs[]) {
  const CdfId file = cdfIdOf(handle);
  openFileRegistry().insert(file);
  outputs[0] = makeCdfIdScalar(file);
}

// The library removes what it can and then frees the file, unless it refuses to begin. A warning,
// which is a failure to users, comes from a deletion that was carried out.
bool freesFile(long deleteStatus) {
  const bool warning = deleteStatus < CDF_OK && deleteStatus > CDF_WARN;
  return warning || deleteStatus == CDF_DELETE_ERROR || deleteStatus == VAR_DELETE_ERROR ||
         deleteStatus == SCRATCH_DELETE_ERROR;
}

}  // namespace

void createFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  std::string name = getFilenameArg(arguments[0]);
  CDFid handle = nullptr;
  if (CDFcreateCDF(name.data(), &handle) < 0) raiseError(cdflib::fileCreateError());
  registerAndReturn(handle, outputs);
}

void openFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
              const CommandEntry*) {
  const std::string name = getFilenameArg(arguments[0]);
  CDFid handle = nullptr;
  if (CDFlib(OPEN_, CDF_, name.c_str(), &handle, NULL_) < 0) raiseError(cdflib::fileOpenError());
  callLibrary("CDFsetzMode", SELECT_, CDF_, handle, CDF_zMODE_, zMODEon2);
  registerAndReturn(handle, outputs);
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

void closeAllOnUnload() {
  OpenFileRegistry& registry = openFileRegistry();
  if (registry.size() == 0) return;
  qvWarningMsgId(cdflib::closingFileHandle());
  for (const CdfId file : registry.files()) {
    if (registry.isFreed(file)) continue;
    CDFlib(SELECT_, CDF_, libraryHandle(file, "CDFcloseCDF"), CLOSE_, CDF_, NULL_);
    registry.markFreed(file);  // it stays registered, should the host call again
  }
}

}  // namespace TOLVEX::ambrix
