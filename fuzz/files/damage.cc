#include "fuzz/files/damage.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <random>

namespace ambrix::fuzz {
namespace {

/// Random numbers that are the same with every standard library.
class Choice {
 public:
  explicit Choice(std::uint64_t seed) : engine_(seed) {}
  /// A number below the limit, which is not 0.
  std::size_t below(std::size_t limit) { return static_cast<std::size_t>(engine_()) % limit; }

 private:
  std::mt19937_64 engine_;
};

std::string truncate(std::string& bytes, Choice& choice) {
  const std::size_t length = choice.below(bytes.size());
  bytes.resize(length);
  return fmt::format("cut to {} bytes", length);
}

std::string flipBits(std::string& bytes, Choice& choice) {
  const std::size_t flips = 1 + choice.below(8);
  std::string places;
  for (std::size_t i = 0; i < flips; ++i) {
    const std::size_t place = choice.below(bytes.size());
    bytes[place] = static_cast<char>(bytes[place] ^ 1 << choice.below(8));
    places += fmt::format(" {}", place);
  }
  return "bits flipped at" + places;
}

/// Most fields of a file are big-endian words.
std::string overwriteWord(std::string& bytes, Choice& choice) {
  const std::array<std::size_t, 12> words = {
      0,          1,          2,          0x7FFFFFFF, 0x80000000,   0xFFFFFFFF,
      0xFFFFFFFE, 0x10000000, 0x00010000, 1000,       bytes.size(), choice.below(1U << 31)};
  const std::size_t word = words[choice.below(words.size())];
  const std::size_t place = choice.below(std::max<std::size_t>(bytes.size(), 5) - 4);
  for (std::size_t i = 0; i < 4 && place + i < bytes.size(); ++i)
    bytes[place + i] = static_cast<char>(word >> (24 - 8 * i));
  return fmt::format("word {:#x} at {}", word, place);
}

std::string zeroBlock(std::string& bytes, Choice& choice) {
  const std::size_t place = choice.below(bytes.size());
  const std::size_t length = std::min<std::size_t>(1 + choice.below(512), bytes.size() - place);
  std::fill_n(bytes.begin() + static_cast<std::ptrdiff_t>(place), length, '\0');
  return fmt::format("{} zeros at {}", length, place);
}

constexpr std::string (*kDamages[])(std::string&, Choice&) = {truncate, flipBits, overwriteWord,
                                                              zeroBlock};

}  // namespace

DamagedFile damagedFile(const std::vector<SeedFile>& seeds, std::uint64_t seed,
                        std::uint64_t number) {
  Choice choice(seed << 32 ^ number);
  DamagedFile damaged{seeds[choice.below(seeds.size())], {}};
  SeedFile& file = damaged.file;
  SeedFile::Part& part = file.parts[choice.below(file.parts.size())];
  damaged.description = file.make + part.extension + ": ";
  damaged.description += kDamages[choice.below(std::size(kDamages))](part.bytes, choice);
  return damaged;
}

}  // namespace ambrix::fuzz
