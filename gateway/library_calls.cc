#include "gateway/library_calls.h"

#include <bit>
#include <cstddef>

#include "gateway/errors.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

// Large enough for the longest text of any version, whatever length its header gives.
constexpr std::size_t kStatusTextLength = 200;

}  // namespace

void raiseLibraryFailure(long status, const char* routine) {
  char text[kStatusTextLength + 1] = {};
  CDFlib(SELECT_, CDF_STATUS_, status,  //
         GET_, STATUS_TEXT_, text,      //
         NULL_);
  raiseError(cdflib::libraryFailure(routine, text));
}

void* libraryHandle(CdfId file, const char* routine) {
  if (openFileRegistry().isFreed(file)) [[unlikely]]
    raiseLibraryFailure(BAD_CDF_ID, routine);
  return std::bit_cast<void*>(file);
}

CdfId cdfIdOf(void* handle) {
  return std::bit_cast<CdfId>(handle);
}

bool isRowMajor(CdfId file) {
  long majority = 0;
  callOnFile("CDFgetMajority", file, GET_, CDF_MAJORITY_, &majority);
  return majority == ROW_MAJOR;
}

}  // namespace TOLVEX::ambrix
