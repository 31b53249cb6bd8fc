// How many attributes a file has, and how many entries an attribute.
#pragma once

#include <cstdint>

#include "attributes/attribute_arguments.h"
#include "gateway/families.h"

namespace TOLVEX::ambrix {

/// A number that a routine of the library's standard interface gives for one kind of entries.
struct EntryCount {
  CDFstatus (*count)(CDFid file, int kind, long attributeNumber, long* value);
  int kind;
  const char* routine;
};

/// A command (identifier, attribute) that returns an `EntryCount` as a double scalar, negative
/// values included.
template <const EntryCount& row>
void getEntryCount(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                   const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attributeNumber = getAttributeArg(arguments[1], "ATTRNUM");
  long value = 0;
  checkLibraryStatus(row.count(libraryHandle(file, row.routine), row.kind, attributeNumber, &value),
                     row.routine);
  outputs[0] = makeDoubleScalar(value);
}

// clang-format off
inline constexpr FileProperty kGetNumgAttributes {GET_, CDF_NUMgATTRS_, "CDFgetNumgAttributes"};
inline constexpr FileProperty kGetNumvAttributes {GET_, CDF_NUMvATTRS_, "CDFgetNumvAttributes"};

inline constexpr EntryCount kGetAttrMaxgEntry   {CDFgetAttrMaxEntry,   kGlobalEntry,   "CDFgetAttrMaxgEntry"};
inline constexpr EntryCount kGetAttrMaxEntry    {CDFgetAttrMaxEntry,   kVariableEntry, "CDFgetAttrMaxzEntry"};
inline constexpr EntryCount kGetNumAttrgEntries {CDFgetNumAttrEntries, kGlobalEntry,   "CDFgetNumAttrgEntries"};
inline constexpr EntryCount kGetNumAttrEntries  {CDFgetNumAttrEntries, kVariableEntry, "CDFgetNumAttrzEntries"};
// clang-format on

}  // namespace TOLVEX::ambrix
