#include "tests/inflate/reading.h"

#include <algorithm>
#include <cstring>

#include "inflate/stream.h"
#include "tests/inflate/guarded_bytes.h"
#include "tests/inflate/zlib_of_cdf.h"

namespace ambrix_test {
namespace {

using ambrix::inflate::ZStream;

constexpr int kNeedsDictionary = 2;
constexpr int kBufferError = -5;

bool isFailure(int status) {
  return status == kNeedsDictionary || (status < 0 && status != kBufferError);
}

/// Takes what there is in one piece of the input, and adds it to the outcome.
template <typename Inflate>
void readPiece(ZStream& stream, const GuardedBytes& room, std::size_t size, Outcome& outcome,
               Inflate inflate) {
  do {
    stream.next_out = room.last(size);
    stream.avail_out = static_cast<unsigned int>(size);
    outcome.status = inflate(stream);
    outcome.data.append(reinterpret_cast<const char*>(room.last(size)), size - stream.avail_out);
  } while (stream.avail_out == 0 && !isFailure(outcome.status));
}

template <typename Inflate>
Outcome read(ZStream& stream, const std::string& given, const Pieces& pieces, Inflate inflate) {
  const GuardedBytes input(pieces.input);
  const GuardedBytes output(pieces.output);
  Outcome outcome;
  std::size_t at = 0;
  while (at < given.size() && outcome.status != ambrix::inflate::kStreamEnd &&
         !isFailure(outcome.status)) {
    const std::size_t size = std::min(pieces.input, given.size() - at);
    stream.next_in = input.last(size);
    stream.avail_in = static_cast<unsigned int>(size);
    std::memcpy(input.last(size), given.data() + at, size);
    at += size;
    ++outcome.pieces;
    readPiece(stream, output, pieces.output, outcome, inflate);
  }
  outcome.message = stream.msg == nullptr ? "" : stream.msg;
  outcome.totalIn = stream.total_in;
  outcome.totalOut = stream.total_out;
  outcome.checksum = stream.adler;
  return outcome;
}

}  // namespace

Outcome readByLibrary(const std::string& stream, const Pieces& pieces, int flush) {
  ZStream own{};
  z_inflateInit2_(&own, ambrix::inflate::kGzip, "1", sizeof own);
  Outcome outcome =
      read(own, stream, pieces, [&](ZStream& caller) { return z_inflate(&caller, flush); });
  z_inflateEnd(&own);
  return outcome;
}

Outcome readByStream(const std::string& stream, const Pieces& pieces, int flush) {
  ambrix::inflate::Stream standIn;
  ZStream caller{};
  return read(caller, stream, pieces,
              [&](ZStream& given) { return standIn.inflate(given, flush); });
}

}  // namespace ambrix_test
