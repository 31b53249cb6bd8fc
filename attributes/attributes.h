// The commands that define attributes and ask about their definition. An attribute is global, with
// gEntries, or of variables, with zEntries.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "createAttr" (identifier, name, scope): the new attribute's number. The library judges the
/// scope. Raises `libraryFailure` ("CDFcreateAttr").
void createAttr(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*);

/// "deleteAttr" (identifier, attribute). Raises `libraryFailure` ("CDFdeleteAttr").
void deleteAttr(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "renameAttr" (identifier, attribute, name). Raises `libraryFailure` ("CDFrenameAttr").
void renameAttr(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "getAttrName" (identifier, attribute): its name. Raises `libraryFailure` ("CDFgetAttrName").
void getAttrName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*);

/// "getAttrNum" (identifier, name): its number. Raises `libraryFailure` ("CDFgetAttrNum").
void getAttrNum(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*);

/// "getAttrScope" (identifier, attribute): "GLOBAL_SCOPE" or "VARIABLE_SCOPE". Raises
/// `unrecognizedValue` ("SCOPE"), `libraryFailure` ("CDFgetAttrScope").
void getAttrScope(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*);

/// "inquireAttr" (identifier, attribute), 4 outputs: name, scope name, maximum gEntry number,
/// maximum zEntry number (-1 for none). Raises `unrecognizedValue` ("SCOPE"), `libraryFailure`
/// ("CDFinquireCDF").
void inquireAttr(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*);

}  // namespace TOLVEX::ambrix
