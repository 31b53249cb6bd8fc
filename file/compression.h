// Compression of a whole file and of one variable. The two getters and the two setters differ in
// what they check and in one spelling; users know each as it is, so they stay apart.
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

/// "setVarCompression" (identifier, variable, type, [parameter]). A gzip level is not checked.
void setVarCompression(int, qvArray*[], std::int32_t argumentCount, const qvArray* arguments[],
                       const CommandEntry*);

}  // namespace TOLVEX::ambrix
