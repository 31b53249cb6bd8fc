// Streams that are sound.
#include "inflate/stream.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "tests/inflate/compressed.h"
#include "tests/inflate/reading.h"

namespace ambrix_test {
namespace {

using ambrix::inflate::kStreamEnd;

void expectTheSame(const std::string& stream, const std::string& data, const Pieces& pieces) {
  const Outcome library = readByLibrary(stream, pieces);
  const Outcome own = readByStream(stream, pieces);
  EXPECT_EQ(own.status, kStreamEnd);
  EXPECT_TRUE(own.data == data);
  EXPECT_EQ(own.totalOut, data.size());
  EXPECT_EQ(own.totalIn, library.totalIn);
  EXPECT_EQ(own.pieces, library.pieces);
  EXPECT_EQ(own.checksum, library.checksum);
  EXPECT_EQ(own.message, "");
}

TEST(InflateStream, ReadsDataOfEveryKindInPiecesOfEverySize) {
  Random random(1);
  for (int round = 0; round < 60; ++round) {
    SCOPED_TRACE(round);
    const std::string data =
        dataOf(round % kKinds, upTo(round < 40 ? 2000 : 400'000, random), random);
    const std::string stream = compressed(data, {static_cast<int>(random() % 10)});
    expectTheSame(stream, data, {});
    expectTheSame(stream, data,
                  {65536, std::max<std::size_t>(1, std::min<std::size_t>(65536, data.size()))});
    expectTheSame(stream, data, {1 + upTo(3000, random), 1 + upTo(3000, random)});
  }
}

TEST(InflateStream, ReadsEveryStrategyAndWindow) {
  Random random(2);
  for (const int strategy : {0, 1, 2, 3, 4}) {
    for (const int windowBits : {9, 12, 15}) {
      const std::string data = dataOf(4, 200'000, random);
      expectTheSame(compressed(data, {6, windowBits + 16, strategy}), data, {});
    }
  }
}

TEST(InflateStream, ReadsByteByByte) {
  Random random(3);
  const std::string data = dataOf(2, 1000, random);
  expectTheSame(compressed(data), data, {1, 1});
}

TEST(InflateStream, EndsWithTheStreamWhateverFollows) {
  const std::string data(100'000, 'x');
  const std::string stream = compressed(data);
  const Outcome own = readByStream(stream + "what follows");
  EXPECT_EQ(own.status, kStreamEnd);
  EXPECT_EQ(own.totalIn, stream.size());
  EXPECT_TRUE(own.data == data);
}

TEST(InflateStream, GoesOnAfterItsEndAsZlibDoes) {
  const std::string data(1000, 'x');
  const Pieces exact{65536, data.size()};  // the call that ends it fills the room
  const Outcome own = readByStream(compressed(data), exact);
  EXPECT_EQ(own.status, kStreamEnd);
  EXPECT_EQ(own.data, data);
}

TEST(InflateStream, ObeysEveryFlush) {
  Random random(4);
  const std::string data = dataOf(4, 300'000, random);
  const std::string stream = compressed(data);
  for (const int flush : {0, 1, 2, 3, 4, 5, 6}) {
    SCOPED_TRACE(flush);
    const Outcome library = readByLibrary(stream, {}, flush);
    const Outcome own = readByStream(stream, {}, flush);
    EXPECT_EQ(own.status, library.status);
    EXPECT_TRUE(own.data == library.data);
  }
}

TEST(InflateStream, ReadsHeadersThatNameTheFile) {
  const std::string data = "data";
  std::string stream = compressed(data);
  stream[3] = 8;
  stream.insert(10, std::string("name\0", 5));
  expectTheSame(stream, data, {});
}

TEST(InflateStream, SaysWhatZlibSaysOfWrongArguments) {
  ambrix::inflate::Stream stream;
  ambrix::inflate::ZStream caller{};
  EXPECT_EQ(stream.inflate(caller, 0), ambrix::inflate::kStreamError);
  unsigned char room[1];
  caller.next_out = room;
  caller.avail_in = 1;
  EXPECT_EQ(stream.inflate(caller, 0), ambrix::inflate::kStreamError);
}

TEST(InflateStream, TellsThatItGotNothing) {
  const std::string stream = compressed("data").substr(0, 15);
  const auto* const bytes = reinterpret_cast<const unsigned char*>(stream.data());
  ambrix::inflate::Stream own;
  ambrix::inflate::ZStream caller{};
  unsigned char room[100];
  caller.next_in = bytes;
  caller.avail_in = static_cast<unsigned int>(stream.size());
  caller.next_out = room;
  caller.avail_out = sizeof room;
  EXPECT_EQ(own.inflate(caller, 0), ambrix::inflate::kOk);
  EXPECT_EQ(caller.avail_in, 0U);
  EXPECT_EQ(own.inflate(caller, 0), ambrix::inflate::kBufferError);
}

}  // namespace
}  // namespace ambrix_test
