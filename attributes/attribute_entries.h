// The commands on single entries, addressed by attribute and entry number. The "g" commands address
// gEntries of global attributes, the others zEntries, whose number is the variable's; only the put
// commands go by the attribute's scope instead.
#pragma once

#include <cstdint>

#include "attributes/attribute_arguments.h"
#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// One kind of entries and what its commands are called in messages.
struct EntryKind {
  int kind;
  const char* inquireRoutine;
  const char* getRoutine;
  const char* putRoutine;
  const char* deleteRoutine;
  const char* deleteLabel;
};

// "deleteAttrEntry" names its argument "ATTNUM", not "ATTRNUM". The label is a value of the
// argument's error: changed, it would change the messages.
// clang-format off
inline constexpr EntryKind kGEntry{kGlobalEntry,  "CDFinquireAttrgEntry", "CDFgetAttrgEntry", "CDFputAttrgEntry", "CDFdeleteAttrgEntry", "ATTRNUM"};
inline constexpr EntryKind kZEntry{kVariableEntry, "CDFinquireAttrzEntry", "CDFgetAttrzEntry", "CDFputAttrzEntry", "CDFdeleteAttrzEntry", "ATTNUM"};
// clang-format on

// What the commands below do for either kind.
void getEntry(const EntryKind& kind, qvArray* outputs[], const qvArray* arguments[]);
void inquireEntry(const EntryKind& kind, qvArray* outputs[], const qvArray* arguments[]);
void deleteEntry(const EntryKind& kind, const qvArray* arguments[]);

/// "getAttrgEntry", "getAttrEntry" (identifier, attribute, entry): a text, or 1-by-n of the
/// datatype's class; 2-by-n doubles for epoch16. Raises `unrecognizedValue` ("DATATYPE"),
/// `libraryFailure` (inquire and get routine of the kind).
template <const EntryKind& kind>
void getAttrEntry(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*) {
  getEntry(kind, outputs, arguments);
}

/// "inquireAttrgEntry", "inquireAttrEntry" (identifier, attribute, entry): lower-case datatype
/// name, number of elements. Raises `unrecognizedValue` ("DATATYPE"), `libraryFailure`.
template <const EntryKind& kind>
void inquireAttrEntry(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  inquireEntry(kind, outputs, arguments);
}

/// "deleteAttrgEntry", "deleteAttrEntry" (identifier, attribute, entry). Raises `libraryFailure`.
template <const EntryKind& kind>
void deleteAttrEntry(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  deleteEntry(kind, arguments);
}

/// "putAttrgEntry" and "putAttrEntry" alike (identifier, attribute, entry, datatype, value): the
/// attribute's scope decides the kind of entry. Raises `unrecognizedValue` ("DATATYPE", "SCOPE"),
/// `badPutAttrEntryDatatype`, `libraryFailure` ("CDFgetAttrScope", put routine of the kind).
void putAttrEntry(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

}  // namespace TOLVEX::ambrix
