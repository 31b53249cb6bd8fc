// The settings of one file. Read-only mode and cache sizes are selections of the current file to
// the library, so they are read with CONFIRM_ and set without PUT_; the others are stored in the
// file.
#pragma once

#include <cstdint>

#include "constants/value_names.h"
#include "gateway/arguments.h"
#include "gateway/families.h"
#include "gateway/library_calls.h"
#include "gateway/open_file_registry.h"

namespace TOLVEX::ambrix {

/// A setting that is returned as its name.
struct NamedSetting {
  long operation;
  long item;
  const char* routine;
  const ValueNameTable* names;
  const char* kindName;
};

/// A command (identifier) that returns the name of a setting. Raises `unrecognizedValue` for a
/// value without a name.
template <const NamedSetting& row>
void getNamedSetting(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  long value = 0;
  callOnFile(row.routine, file, row.operation, row.item, &value);
  outputs[0] = qvCreateString(lookupValueName(*row.names, value, row.kindName).c_str());
}

/// A number that is set for a file: with PUT_, or as a SELECT_ item that follows the selection of
/// the file.
struct FileSetting {
  long operation;  // PUT_ or SELECT_
  long item;
  const char* routine;
  const char* label;
};

/// A command (identifier, number) without a result.
template <const FileSetting& row>
void setFileSetting(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long value = libraryNumber(getLongScalarArg(arguments[1], row.label), kBadNumber);
  if constexpr (row.operation == SELECT_) {
    callOnFile(row.routine, file, row.item, value);
  } else {
    callOnFile(row.routine, file, row.operation, row.item, value);
  }
}

// clang-format off
inline constexpr NamedSetting kGetFormat       {GET_,     CDF_FORMAT_,        "CDFgetFormat",       &FormatNames,       "FORMAT"};
inline constexpr NamedSetting kGetChecksum     {GET_,     CDF_CHECKSUM_,      "CDFgetChecksum",     &ChecksumNames,     "CHECKSUM"};
inline constexpr NamedSetting kGetMajority     {GET_,     CDF_MAJORITY_,      "CDFgetMajority",     &MajorityNames,     "MAJORITY"};
inline constexpr NamedSetting kGetReadOnlyMode {CONFIRM_, CDF_READONLY_MODE_, "CDFgetReadOnlyMode", &ReadOnlyModeNames, "READONLY MODE"};

inline constexpr FileProperty kGetCacheSize            {CONFIRM_, CDF_CACHESIZE_,      "CDFgetCacheSize"};
inline constexpr FileProperty kGetStageCacheSize       {CONFIRM_, STAGE_CACHESIZE_,    "CDFgetStageCacheSize"};
inline constexpr FileProperty kGetCompressionCacheSize {CONFIRM_, COMPRESS_CACHESIZE_, "CDFgetCompressionCacheSize"};

// The label of "setFormat" is that of the cache sizes. It is a value of the argument's error: changed,
// it would change the messages.
inline constexpr FileSetting kSetFormat               {PUT_,    CDF_FORMAT_,         "CDFsetFormat",               "NUMBUFFERS"};
inline constexpr FileSetting kSetChecksum             {PUT_,    CDF_CHECKSUM_,       "CDFsetChecksum",             "MODE"};
inline constexpr FileSetting kSetMajority             {PUT_,    CDF_MAJORITY_,       "CDFsetMajority",             "MAJORITY"};
inline constexpr FileSetting kSetCacheSize            {SELECT_, CDF_CACHESIZE_,      "CDFsetCacheSize",            "NUMBUFFERS"};
inline constexpr FileSetting kSetVarsCacheSize        {SELECT_, zVARs_CACHESIZE_,    "CDFsetzVarsCacheSize",       "NUMBUFFERS"};
inline constexpr FileSetting kSetStageCacheSize       {SELECT_, STAGE_CACHESIZE_,    "CDFsetStageCacheSize",       "NUMBUFFERS"};
inline constexpr FileSetting kSetCompressionCacheSize {SELECT_, COMPRESS_CACHESIZE_, "CDFsetCompressionCacheSize", "NUMBUFFERS"};
// clang-format on

}  // namespace TOLVEX::ambrix
