// The functions of zlib that the CDF library calls to inflate. The dynamic linker finds these first
// where this library is listed before the CDF library.
#include <new>

#include "inflate/isal.h"
#include "inflate/library_zlib.h"
#include "inflate/stream.h"

using ambrix::inflate::isal;
using ambrix::inflate::kGzip;
using ambrix::inflate::kOk;
using ambrix::inflate::kStreamError;
using ambrix::inflate::libraryCalls;
using ambrix::inflate::libraryZlib;
using ambrix::inflate::Stream;
using ambrix::inflate::ZStream;

namespace {

/// Whether a stream is one that ISA-L can inflate just as the library's zlib would.
bool isServed(const ZStream& caller, int windowBits, const char* version, int size) {
  return windowBits == kGzip && version != nullptr && *version == '1' && size == sizeof caller &&
         caller.zalloc == nullptr && caller.zfree == nullptr && isal().usable();
}

}  // namespace

extern "C" [[gnu::visibility("default")]] int z_inflateInit2_(ZStream* caller, int windowBits,
                                                              const char* version, int size) {
  if (!libraryZlib().complete()) return kStreamError;
  if (caller != nullptr && isServed(*caller, windowBits, version, size)) {
    caller->state = new (std::nothrow) Stream;
    caller->msg = nullptr;
    caller->total_in = caller->total_out = caller->adler = 0;
    if (caller->state != nullptr) return kOk;
  }
  return libraryZlib().init(caller, windowBits, version, size);
}

extern "C" [[gnu::visibility("default")]] int z_inflate(ZStream* caller, int flush) {
  if (!libraryZlib().complete()) return kStreamError;
  Stream* const stream = caller == nullptr ? nullptr : Stream::of(*caller);
  return stream == nullptr ? libraryZlib().inflate(caller, flush) : stream->inflate(*caller, flush);
}

extern "C" [[gnu::visibility("default")]] int z_inflateEnd(ZStream* caller) {
  if (!libraryZlib().complete()) return kStreamError;
  Stream* const stream = caller == nullptr ? nullptr : Stream::of(*caller);
  if (stream == nullptr) return libraryZlib().end(caller);
  delete stream;
  caller->state = nullptr;
  return kOk;
}

/// Which inflater serves the CDF library of this process.
extern "C" [[gnu::visibility("default")]] const char* ambrixInflater() {
  const bool serves = isal().usable() && libraryZlib().complete() && libraryCalls(z_inflate);
  return serves ? "ISA-L" : "CDF library";
}
