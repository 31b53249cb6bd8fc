#include "variables/sparse_records.h"

#include "gateway/library.h"
#include "gateway/open_file_registry.h"

namespace TOLVEX::ambrix {

void writeWaitingRecords(CdfId file, long variable, const char* routine) {
  if (!openFileRegistry().isWritten(file)) return;
  long sparseness = NO_SPARSERECORDS;
  callOnVariable(routine, file, variable, GET_, zVAR_SPARSERECORDS_, &sparseness);
  if (sparseness == NO_SPARSERECORDS) return;
  // To delete records that no variable can have changes nothing, but begins with writing.
  constexpr long kNone = kNoSuchNumber - 1;
  callOnVariable(routine, file, variable, DELETE_, zVAR_RECORDS_, kNone, kNone);
}

}  // namespace TOLVEX::ambrix
