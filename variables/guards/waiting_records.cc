#include "variables/sparse_records.h"

#include <cdf.h>

#include "gateway/library.h"
#include "gateway/open_file_registry.h"

namespace TOLVEX::ambrix {
namespace {

bool isSparse(CdfId file, long variable, const char* routine) {
  long sparseness = NO_SPARSERECORDS;
  callOnVariable(routine, file, variable, GET_, zVAR_SPARSERECORDS_, &sparseness);
  return sparseness != NO_SPARSERECORDS;
}

bool isCompressed(CdfId file, long variable, const char* routine) {
  long type = NO_COMPRESSION;
  long parameters[CDF_MAX_PARMS] = {};
  long percent = 0;
  callOnVariable(routine, file, variable, GET_, zVAR_COMPRESSION_, &type, parameters, &percent);
  return type != NO_COMPRESSION;
}

/// Nothing waits for a file that the library does not write: it has refused whatever was put.
bool refusesAllWriting(long status) {
  return status == READ_ONLY_MODE || status == NO_WRITE_ACCESS;
}

}  // namespace

void writeWaitingRecords(CdfId file, long variable, const char* routine) {
  if (!openFileRegistry().isWritten(file)) return;
  if (!isSparse(file, variable, routine) || !isCompressed(file, variable, routine)) return;
  // To delete records that no variable can have changes nothing, but begins with writing.
  constexpr long kNone = kNoSuchNumber - 1;
  const long status = CDFlib(SELECT_, CDF_, libraryHandle(file, routine),  //
                             zVAR_, variableOrAttributeNumber(variable),   //
                             DELETE_, zVAR_RECORDS_, kNone, kNone, NULL_);
  if (!refusesAllWriting(status)) checkLibraryStatus(status, routine);
}

}  // namespace TOLVEX::ambrix
