// What a file is made of, and which library and format version it and the running library carry.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "inquire" (identifier), 5 outputs: encoding name, majority name, maximum record number, number
/// of variables, number of attributes. Raises `unrecognizedValue` ("ENCODING", "MAJORITY") and
/// `libraryFailure` ("CDFinquireCDF").
void inquireFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*);

/// "getVersion" (identifier): version, release and increment of the library that wrote the file.
void getVersion(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*);

/// "getLibraryVersion" (): version, release and increment of the running library.
void getLibraryVersion(int, qvArray* outputs[], std::int32_t, const qvArray*[],
                       const CommandEntry*);

/// "getName" (identifier): the name under which the file was opened or created.
void getName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
             const CommandEntry*);

/// "getCopyright" (identifier): the file's copyright text, line breaks included.
void getCopyright(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*);

/// "getLibraryCopyright" (): the library's copyright text.
void getLibraryCopyright(int, qvArray* outputs[], std::int32_t, const qvArray*[],
                         const CommandEntry*);

}  // namespace TOLVEX::ambrix
