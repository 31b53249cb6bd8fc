// One gzip stream that is being inflated: by ISA-L as long as all is well, otherwise by the zlib of
// the CDF library, which is given the whole stream again and so says what it always would.
#pragma once

#include <isa-l/igzip_lib.h>

#include "inflate/consumed_input.h"
#include "inflate/zlib_abi.h"

namespace ambrix::inflate {

class Stream {
 public:
  Stream();
  ~Stream();
  Stream(const Stream&) = delete;
  Stream& operator=(const Stream&) = delete;

  /// The stream that was made for a caller, or null when zlib itself was.
  static Stream* of(const ZStream& caller);

  /// As inflate() of zlib, but for input that may be consumed sooner.
  int inflate(ZStream& caller, int flush);

 private:
  enum class Stage { kHeader, kIsal, kLibrary, kEnded, kFailed };

  int inflateAtStage(ZStream& caller, int flush);
  int inflateByIsal(ZStream& caller);
  int handOver(ZStream& caller, int flush);
  int skipDelivered();
  int inflateKept(ZStream& caller, int flush);
  int inflateByLibrary(ZStream& caller, int flush);
  int stepByLibrary(Bytes& input, ZStream& caller, int flush);

  const void* mark_;  // first, where zlib has the address of the caller
  Stage stage_ = Stage::kHeader;
  unsigned long delivered_ = 0;
  unsigned int piece_ = 0;  // how much input was given together
  unsigned int left_ = 0;   // what is left of it
  ConsumedInput input_;
  ZStream library_{};
  inflate_state isal_{};  // zeroed: it looks up codes that a damaged stream has not defined
};

}  // namespace ambrix::inflate
