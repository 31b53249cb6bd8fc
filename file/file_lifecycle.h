// The commands that begin and end a file's life, and the closing of what is left open at unload.
#pragma once

#include <cstdint>

#include "gateway/cdf_id.h"
#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "create" (file name): a new CDF with the library's defaults (`CDFcreateCDF`). Output: its
/// identifier, 1-by-1 uint64. Raises `fileCreateError`, also for a path too long for the library,
/// and `invalidCharError`.
void createFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*);

/// "open" (file name): an existing CDF, shown in zVariable mode 2. Output: its identifier, 1-by-1
/// uint64. Raises `fileOpenError`, `invalidCharError`, `libraryFailure` ("CDFsetzMode").
void openFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
              const CommandEntry*);

/// "close" (identifier). Raises `libraryFailure` ("CDFcloseCDF"); the identifier then stays
/// registered, but every command on it fails until the library hands it out anew.
void closeFile(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "delete" (identifier): removes the file from disk. Raises `libraryFailure` ("CDFdelete"); the
/// identifier then stays registered, usable if the library refused to begin.
void deleteFile(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// For a host that opens files for itself: closes one, ignoring failures, and unregisters it even
/// where "close" has failed before.
void abandonFile(CdfId file);

/// The unload handler: one warning if any file is open, then closes every one, ignoring failures. A
/// process that ends without calling it has its files closed without the warning.
void closeAllOnUnload();

}  // namespace TOLVEX::ambrix
