// Compression of a whole file and of one variable. The getters differ in the names that they
// return, the setters in the error for a bad gzip level: `invalidCompressionParameter` for a file,
// the library's own `libraryFailure` for a variable. One handler for both would change results or
// errors.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "getCompression" (identifier), 3 outputs: type name; parameter (0-by-0 double, name or gzip
/// level); percentage. Raises `unrecognizedValue` ("COMPRESSION"), `libraryFailure`
/// ("CDFgetCompression").
void getCompression(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*);

/// "setCompression" (identifier, type, [parameter]). Raises `unrecognizedValue`,
/// `invalidCompressionParameter` for a gzip level outside 1 to 9,
/// `unspecifiedGzipCompressionLevel`, `libraryFailure` ("CDFsetCompression").
void setCompression(int, qvArray*[], std::int32_t argumentCount, const qvArray* arguments[],
                    const CommandEntry*);

/// "getVarCompression" (identifier, variable), outputs as "getCompression"; warns of a parameter
/// that its type does not know and returns it as a number.
void getVarCompression(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                       const CommandEntry*);

/// "setVarCompression" (identifier, variable, type, [parameter]). The library checks the gzip
/// level.
void setVarCompression(int, qvArray*[], std::int32_t argumentCount, const qvArray* arguments[],
                       const CommandEntry*);

}  // namespace TOLVEX::ambrix
