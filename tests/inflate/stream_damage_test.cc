// Streams that are damaged: the CDF library must be told what its own zlib would tell it.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <string>

#include "inflate/consumed_input.h"
#include "tests/inflate/compressed.h"
#include "tests/inflate/reading.h"

namespace ambrix_test {
namespace {

using ambrix::inflate::kDataError;
using ambrix::inflate::kStreamEnd;

/// So many streams are tried; more where there is time.
int rounds() {
  return std::getenv("AMBRIX_LONG_TESTS") == nullptr ? 3000 : 300'000;
}

void flipBits(std::string& stream, Random& random) {
  for (std::size_t count = 1 + upTo(3, random); count > 0; --count)
    stream[random() % stream.size()] ^= static_cast<char>(1U << random() % 8);
}

void overwrite(std::string& stream, Random& random, char byte) {
  const std::size_t at = random() % stream.size();
  for (std::size_t i = at; i < std::min(stream.size(), at + 1 + random() % 8); ++i)
    stream[i] = byte;
}

std::string damaged(std::string stream, Random& random) {
  switch (random() % 6) {
    case 0:
      stream.resize(random() % stream.size());
      break;
    case 1:
      overwrite(stream, random, '\0');
      break;
    case 2:
      overwrite(stream, random, '\xff');
      break;
    case 3:  // where the checksum and the size are
      stream[stream.size() - 1 - random() % 8] ^= static_cast<char>(1 + random() % 255);
      break;
    case 4:  // where the header and the codes are
      stream[random() % std::min<std::size_t>(stream.size(), 100)] = static_cast<char>(random());
      break;
    default:
      flipBits(stream, random);
  }
  return stream;
}

/// Codes that zlib refuses because some of them have no meaning may serve for a while; or to the
/// end, where the stream does without those: one in 100,000 damaged streams. All is right then, as
/// the checksum tells.
void expectTheSame(const std::string& stream, const Pieces& pieces, const std::string& data = "") {
  const Outcome library = readByLibrary(stream, pieces);
  const Outcome own = readByStream(stream, pieces);
  if (library.message.ends_with("set") && own.status == kStreamEnd) {
    EXPECT_TRUE(own.data == data);
    return;
  }
  EXPECT_EQ(own.status, library.status);
  EXPECT_EQ(own.message, library.message);
  EXPECT_TRUE(own.data.starts_with(library.data));
  EXPECT_GE(own.pieces, library.pieces);
  if (library.status == kDataError) return;
  EXPECT_EQ(own.data.size(), library.data.size());
  EXPECT_EQ(own.pieces, library.pieces);
}

TEST(DamagedStream, IsReportedAsZlibReportsIt) {
  Random random(11);
  for (int round = 0; round < rounds() && !testing::Test::HasFailure(); ++round) {
    SCOPED_TRACE(round);
    const std::size_t most = round % 10 == 0 ? 300'000 : 3000;
    const std::string data =
        dataOf(static_cast<int>(random() % kKinds), upTo(most, random), random);
    const Compression how{static_cast<int>(random() % 10), 31, static_cast<int>(random() % 5)};
    const std::string stream = damaged(compressed(data, how), random);
    expectTheSame(stream, {}, data);
    expectTheSame(stream, {1 + upTo(2000, random), 1 + upTo(2000, random)}, data);
  }
}

TEST(DamagedStream, NeedNoStream) {
  Random random(12);
  for (int round = 0; round < rounds() && !testing::Test::HasFailure(); ++round) {
    SCOPED_TRACE(round);
    const std::string header = compressed("").substr(0, 10);
    expectTheSame(header + dataOf(0, upTo(3000, random), random), {});
  }
}

TEST(DamagedStream, IsFoundBeyondWhatIsKept) {
  Random random(13);
  std::string stream =
      compressed(dataOf(0, ambrix::inflate::ConsumedInput::kMost * 3 / 2, random), {0});
  stream[stream.size() - 6] ^= 1;
  const Outcome own = readByStream(stream);
  EXPECT_EQ(own.status, kDataError);
  EXPECT_EQ(own.totalOut, own.data.size());
  EXPECT_NE(own.message, "");
}

}  // namespace
}  // namespace ambrix_test
