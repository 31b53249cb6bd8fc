#include "inflate/stream.h"

#include <algorithm>
#include <array>

#include "inflate/isal.h"
#include "inflate/library_zlib.h"

namespace ambrix::inflate {
namespace {

constexpr char kMark = 0;

/// The header that the CDF library writes: no name, no comment, nothing else that is optional. The
/// time, the flags of the compressor and its system follow.
constexpr std::array<unsigned char, 4> kHeaderStart{0x1f, 0x8b, 8, 0};
constexpr std::size_t kHeaderSize = 10;

/// The CDF library reads its file in pieces of this size; a smaller one is the last.
constexpr unsigned int kPiece = 65536;

bool beginsPlainly(Bytes input) {
  return input.size() >= kHeaderSize &&
         std::ranges::equal(input.first(kHeaderStart.size()), kHeaderStart);
}

/// Whether all there is to be told is how much was consumed and delivered.
bool isPlain(int flush) {
  return flush == kNoFlush || flush == kSyncFlush;
}

Bytes inputOf(const ZStream& caller) {
  return {caller.next_in, caller.avail_in};
}

void consume(ZStream& caller, std::size_t count) {
  caller.next_in += count;
  caller.avail_in -= static_cast<unsigned int>(count);
  caller.total_in += count;
}

void deliver(ZStream& caller, std::size_t count) {
  caller.next_out += count;
  caller.avail_out -= static_cast<unsigned int>(count);
  caller.total_out += count;
}

}  // namespace

Stream::Stream() : mark_(&kMark) {
  isal().init(&isal_);
  isal_.crc_flag = ISAL_GZIP_NO_HDR_VER;
}

Stream::~Stream() {
  if (library_.state != nullptr) libraryZlib().end(&library_);
}

Stream* Stream::of(const ZStream& caller) {
  if (caller.state == nullptr) return nullptr;
  const bool ours = *static_cast<const void* const*>(caller.state) == &kMark;
  return ours ? static_cast<Stream*>(caller.state) : nullptr;
}

int Stream::inflate(ZStream& caller, int flush) {
  if (caller.next_out == nullptr) return kStreamError;
  if (caller.next_in == nullptr && caller.avail_in != 0) return kStreamError;
  if (caller.avail_in > left_) piece_ = caller.avail_in;
  const int status = inflateAtStage(caller, flush);
  left_ = caller.avail_in;
  return status;
}

int Stream::inflateAtStage(ZStream& caller, int flush) {
  switch (stage_) {
    case Stage::kHeader:
      if (!isPlain(flush) || !beginsPlainly(inputOf(caller))) return handOver(caller, flush);
      input_.append(inputOf(caller).first(kHeaderSize));
      consume(caller, kHeaderSize);
      stage_ = Stage::kIsal;
      [[fallthrough]];
    case Stage::kIsal:
      return isPlain(flush) ? inflateByIsal(caller) : handOver(caller, flush);
    case Stage::kLibrary:
      return inflateKept(caller, flush);
    case Stage::kEnded:
      return kStreamEnd;
    case Stage::kFailed:
      break;
  }
  return kDataError;
}

int Stream::inflateByIsal(ZStream& caller) {
  isal_.next_in = const_cast<unsigned char*>(caller.next_in);  // which it leaves as it is
  isal_.avail_in = caller.avail_in;
  isal_.next_out = caller.next_out;
  isal_.avail_out = caller.avail_out;
  const int status = isal().inflate(&isal_);
  const bool ended = isal_.block_state == ISAL_BLOCK_FINISH;
  const bool starved = isal_.avail_in == 0 && isal_.avail_out > 0;
  // At the end of a stream that breaks off, zlib delivers every last byte, and ISA-L does not.
  if (status != ISAL_DECOMP_OK || (!ended && starved && piece_ < kPiece)) {
    return handOver(caller, kNoFlush);
  }
  const std::size_t consumed = caller.avail_in - isal_.avail_in;
  const std::size_t produced = caller.avail_out - isal_.avail_out;
  input_.append(inputOf(caller).first(consumed));
  delivered_ += produced;
  consume(caller, consumed);
  deliver(caller, produced);
  caller.adler = isal_.crc;
  if (ended) {
    stage_ = Stage::kEnded;
    return kStreamEnd;
  }
  return consumed + produced == 0 ? kBufferError : kOk;
}

/// What ISA-L did in this call is not in `caller` yet, so that it is done again.
int Stream::handOver(ZStream& caller, int flush) {
  stage_ = Stage::kFailed;
  if (!input_.complete()) {
    caller.msg = "invalid compressed data";
    return kDataError;
  }
  int status = libraryZlib().init(&library_, kGzip, "1", sizeof library_);
  if (status == kOk) status = skipDelivered();
  if (status != kOk) {
    caller.msg = library_.msg;
    return status;
  }
  stage_ = Stage::kLibrary;
  return inflateKept(caller, flush);
}

/// Has the library inflate what the caller has had already.
int Stream::skipDelivered() {
  std::array<unsigned char, 4096> room;
  while (library_.total_out < delivered_) {
    ZStream unwanted{};
    unwanted.next_out = room.data();
    unwanted.avail_out =
        static_cast<unsigned int>(std::min(delivered_ - library_.total_out, room.size()));
    Bytes input = input_.rest();
    const int status = stepByLibrary(input, unwanted, kNoFlush);
    input_.take(input_.rest().size() - input.size());
    if (status != kOk) return status == kDataError ? status : kDataError;
  }
  return kOk;
}

/// First from what ISA-L had consumed ahead of what it delivered, then from the caller's input.
int Stream::inflateKept(ZStream& caller, int flush) {
  const bool some = !input_.rest().empty();
  while (!input_.rest().empty()) {
    Bytes input = input_.rest();
    const int status = stepByLibrary(input, caller, kNoFlush);
    input_.take(input_.rest().size() - input.size());
    if (status != kOk || caller.avail_out == 0) return status;
  }
  const int status = inflateByLibrary(caller, flush);
  return status == kBufferError && some ? kOk : status;
}

int Stream::inflateByLibrary(ZStream& caller, int flush) {
  Bytes input = inputOf(caller);
  const int status = stepByLibrary(input, caller, flush);
  consume(caller, caller.avail_in - input.size());
  return status;
}

/// One call of the library: `input` becomes what it has left over.
int Stream::stepByLibrary(Bytes& input, ZStream& caller, int flush) {
  library_.next_in = input.data();
  library_.avail_in = static_cast<unsigned int>(input.size());
  library_.next_out = caller.next_out;
  library_.avail_out = caller.avail_out;
  const int status = libraryZlib().inflate(&library_, flush);
  input = input.last(library_.avail_in);
  deliver(caller, caller.avail_out - library_.avail_out);
  caller.msg = library_.msg;
  caller.adler = library_.adler;
  return status;
}

}  // namespace ambrix::inflate
