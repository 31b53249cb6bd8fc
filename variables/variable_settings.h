// Storage settings and record counts of variables. The reserve percentage and the cache size are
// selections of the current variable to the library, read with CONFIRM_ and set without PUT_.
#pragma once

#include <cstdint>

#include "gateway/arguments.h"
#include "gateway/families.h"
#include "variables/guards/record_limits.h"

namespace TOLVEX::ambrix {

/// A number that the library holds for a variable.
struct VariableProperty {
  long operation;
  long item;
  const char* routine;
  bool dividesByRecord;  // the library divides by the bytes of a record on the way
};

/// A command (identifier, variable) that returns a `VariableProperty` as a double scalar.
template <const VariableProperty& row>
void getVariableProperty(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                         const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const VariableOperation variable(file, variableNumber, row.routine);
  if constexpr (row.dividesByRecord) requireDivisibleRecord(variable);
  long value = 0;
  variable.call(row.operation, row.item, &value);
  outputs[0] = makeDoubleScalar(value);
}

/// A number that is set for a variable: with PUT_, or as a SELECT_ item that follows the selection
/// of the variable.
struct VariableSetting {
  long operation;
  long item;
  const char* routine;
  const char* label;
  bool dividesByRecord;
};

/// A command (identifier, variable, number) without a result.
template <const VariableSetting& row>
void setVariableSetting(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                        const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long value = libraryNumber(getLongScalarArg(arguments[2], row.label), kBadNumber);
  const VariableOperation variable(file, variableNumber, row.routine);
  if constexpr (row.dividesByRecord) requireDivisibleRecord(variable);
  long status = CDF_OK;
  if constexpr (row.operation == SELECT_) {
    status = variable.status(row.item, value);
  } else {
    status = variable.status(row.operation, row.item, value);
  }
  const bool writesRecords = row.item == zVAR_INITIALRECS_ && status > CDF_WARN;
  if (writesRecords) openFileRegistry().markWritten(file);
  variable.check(status);
}

// clang-format off
inline constexpr VariableProperty kGetVarAllocRecords     {GET_,     zVAR_NUMallocRECS_,    "CDFgetzVarAllocRecords",     false};
inline constexpr VariableProperty kGetVarBlockingFactor   {GET_,     zVAR_BLOCKINGFACTOR_,  "CDFgetzVarBlockingFactor",   false};
inline constexpr VariableProperty kGetVarMaxAllocRecNum   {GET_,     zVAR_MAXallocREC_,     "CDFgetzVarMaxAllocRecNum",   false};
inline constexpr VariableProperty kGetVarMaxWrittenRecNum {GET_,     zVAR_MAXREC_,          "CDFgetzVarMaxWrittenRecNum", false};
inline constexpr VariableProperty kGetVarNumRecsWritten   {GET_,     zVAR_NUMRECS_,         "CDFgetzVarNumRecsWritten",   false};
inline constexpr VariableProperty kGetVarReservePercent   {CONFIRM_, zVAR_RESERVEPERCENT_,  "CDFgetzVarReservePercent",   true};

inline constexpr FileProperty kGetVarsMaxWrittenRecNum    {GET_,     zVARs_MAXREC_,         "CDFgetzVarsMaxWrittenRecNum"};

inline constexpr VariableSetting kSetVarBlockingFactor {PUT_,    zVAR_BLOCKINGFACTOR_, "CDFsetzVarBlockingFactor", "BLOCKINGFACTOR", true};
inline constexpr VariableSetting kSetVarInitialRecs    {PUT_,    zVAR_INITIALRECS_,    "CDFsetzVarInitialRecs",    "NUMRECS",        true};
inline constexpr VariableSetting kSetVarReservePercent {SELECT_, zVAR_RESERVEPERCENT_, "CDFsetzVarReservePercent", "PERCENT",        true};
inline constexpr VariableSetting kSetVarSparseRecords  {PUT_,    zVAR_SPARSERECORDS_,  "CDFsetzVarSparseRecords",  "STYPE",          false};
// clang-format on

/// "getVarSparseRecords" (identifier, variable): the mode's name. Raises `unrecognizedValue`
/// (value, "SPARSE RECORDS TYPE"), `libraryFailure` ("CDFgetzVarSparseRecords").
void getVarSparseRecords(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                         const CommandEntry*);

/// "getVarCacheSize" (identifier, variable): number of buffers. Raises
/// `varCacheSizeOpInappropriate` on a single-file CDF, `libraryFailure` ("CDFgetFormat",
/// "CDFgetzVarCacheSize").
void getVarCacheSize(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

/// "setVarCacheSize" (identifier, variable, number of buffers). Raises as "getVarCacheSize"
/// ("CDFsetzVarCacheSize").
void setVarCacheSize(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

/// "setVarAllocBlockRecords" (identifier, variable, first record, last record). Raises
/// `libraryFailure` ("CDFsetzVarAllocBlockRecords").
void setVarAllocBlockRecords(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                             const CommandEntry*);

}  // namespace TOLVEX::ambrix
