#include "variables/guards/waiting_records.h"

#include <cdf.h>

#include <algorithm>

#include "gateway/open_file_registry.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

// More than that is not filled in for a read: the waiting records are written instead.
constexpr std::size_t kMostFilled = std::size_t{1} << 20;

constexpr long kNoRecord = -1;

// When the library fails to tell, there is nothing to guard: it will fail to read, too.

bool isSparse(const VariableOperation& variable) {
  long sparseness = NO_SPARSERECORDS;
  const long status = variable.status(GET_, zVAR_SPARSERECORDS_, &sparseness);
  return status >= CDF_OK && sparseness != NO_SPARSERECORDS;
}

bool isCompressed(const VariableOperation& variable) {
  long type = NO_COMPRESSION;
  long parameters[CDF_MAX_PARMS] = {};
  long percent = 0;
  const long status = variable.status(GET_, zVAR_COMPRESSION_, &type, parameters, &percent);
  return status >= CDF_OK && type != NO_COMPRESSION;
}

bool mayHaveWaitingRecords(const VariableOperation& variable,
                           const VariableDescription& description, const RecordRange& records) {
  const bool acceptable = records.first >= 0 && records.count > 0 && records.interval > 0;
  return description.recordVariance != NOVARY && openFileRegistry().isWritten(variable.file()) &&
         isSparse(variable) && isCompressed(variable) && acceptable;
}

/// The last record that is stored or waits.
long lastRecord(const VariableOperation& variable) {
  long last = kNoRecord;
  return variable.status(GET_, zVAR_MAXREC_, &last) >= CDF_OK ? last : kNoRecord;
}

/// Reads one value of a record of several: that the library does without filling in others.
bool isMissing(const VariableOperation& variable, const VariableDescription& description,
               long record) {
  const DimensionVector origin{};
  const ScratchBuffer value(
      saturatedProduct({description.elements, datatypeSize(description.datatype)}));
  const long status = variable.status(zVAR_RECNUMBER_, record, zVAR_DIMINDICES_, origin.data(),  //
                                      GET_, zVAR_DATA_, value.data());
  return status == VIRTUAL_RECORD_DATA;
}

void writeAllThatWait(const VariableOperation& variable) {
  // To delete records that no variable can have changes nothing, but begins with writing.
  constexpr long kNone = kNoSuchNumber - 1;
  variable.call(DELETE_, zVAR_RECORDS_, kNone, kNone);
}

}  // namespace

std::size_t roomForWaitingRecords(const VariableOperation& variable,
                                  const VariableDescription& description,
                                  const RecordRange& records) {
  if (!mayHaveWaitingRecords(variable, description, records)) return 0;
  const long last = lastRecord(variable);
  const bool oneByOne = records.interval > 1 && records.count > 1;
  if (records.first >= last || (!oneByOne && records.last() >= last)) return 0;
  const long filled = std::max(records.count, last - records.first);
  const long fillings = oneByOne ? records.count : 1;
  const std::size_t room = saturatedProduct({filled, description.storedBytesPerRecord()});
  if (saturatedProduct({fillings, static_cast<long>(room)}) <= kMostFilled) return room;
  writeAllThatWait(variable);
  return 0;
}

void writeWaitingRecords(const VariableOperation& variable, const VariableDescription& description,
                         const RecordRange& records) {
  if (!mayHaveWaitingRecords(variable, description, records)) return;
  const long last = lastRecord(variable);
  long record = records.first;
  for (long i = 0; i < records.count && record < last; ++i, record += records.interval) {
    // A value that is a whole record cannot be tried.
    const bool filledIn =
        description.storesOneValue() ||
        (isMissing(variable, description, record) && isMissing(variable, description, record + 1));
    if (filledIn) return writeAllThatWait(variable);
  }
}

}  // namespace TOLVEX::ambrix
