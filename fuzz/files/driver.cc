// Reads damaged files, each in a process of its own, and counts what comes of it. Fails when the
// module is at fault with one of them, or when a file that is not damaged cannot be read.
#include <fmt/format.h>

#include <CLI/CLI.hpp>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <optional>

#include "ambrix/embedded.h"
#include "fuzz/files/child.h"
#include "fuzz/files/damage.h"
#include "fuzz/files/seed_files.h"

namespace ambrix::fuzz {
namespace {

namespace fs = std::filesystem;

constexpr std::size_t kArrayBytes = 1 << 25;

struct Options {
  std::uint64_t files = 1000;
  std::uint64_t seed = 1;
  std::optional<std::uint64_t> only;
  std::string keep;
  double seconds = 20;
  bool verbose = false;
};

/// A folder that goes with this object.
class WorkFolder {
 public:
  WorkFolder() : path_(fs::temp_directory_path() / fmt::format("ambrix-fuzz-{}", ::getpid())) {
    fs::create_directories(path_ / "file");
    ::setenv("CDF_TMP", path_.c_str(), 1);  // what the library leaves behind when it crashes
  }
  WorkFolder(const WorkFolder&) = delete;
  WorkFolder& operator=(const WorkFolder&) = delete;
  ~WorkFolder() {
    std::error_code ignored;
    fs::remove_all(path_, ignored);
  }
  [[nodiscard]] fs::path files() const { return path_ / "file"; }
  [[nodiscard]] fs::path log() const { return path_ / "log"; }

 private:
  fs::path path_;
};

void writeFile(const SeedFile& file, const fs::path& folder) {
  for (const auto& entry : fs::directory_iterator(folder))
    fs::remove_all(entry.path());
  for (const SeedFile::Part& part : file.parts) {
    std::ofstream stream(folder / ("seed" + part.extension), std::ios::binary);
    stream.write(part.bytes.data(), static_cast<std::streamsize>(part.bytes.size()));
  }
}

class Driver {
 public:
  explicit Driver(const Options& options) : options_(options) {
    setByteLimit(kArrayBytes);
    seeds_ = makeSeedFiles(module_, work_.files());
  }

  /// Returns whether nothing is at fault.
  bool run() {
    for (const SeedFile& seed : seeds_)
      requireSound(seed);
    const std::uint64_t first = options_.only.value_or(0);
    const std::uint64_t end = options_.only ? first + 1 : options_.files;
    for (std::uint64_t number = first; number < end; ++number)
      tryFile(number);
    return faults_ == 0;
  }
  void printTable() const;

 private:
  static constexpr std::size_t kOutcomes = static_cast<std::size_t>(Outcome::kFault) + 1;

  Result read(const SeedFile& file, bool validated);
  void requireSound(const SeedFile& seed);
  void tryFile(std::uint64_t number);
  void report(std::uint64_t number, const DamagedFile& file, bool validated, const Result& result);

  Options options_;
  WorkFolder work_;
  Module module_;
  std::vector<SeedFile> seeds_;
  std::array<std::array<std::uint64_t, kOutcomes>, 2> counts_{};  // with and without validation
  std::uint64_t faults_ = 0;
};

Result Driver::read(const SeedFile& file, bool validated) {
  writeFile(file, work_.files());
  const std::string path = (work_.files() / "seed.cdf").string();
  return runInChild([&] { return readWhole(module_, path, validated); }, options_.seconds,
                    work_.log());
}

void Driver::requireSound(const SeedFile& seed) {
  for (const bool validated : {true, false}) {
    const Result result = read(seed, validated);
    if (result.outcome == Outcome::kWhole) continue;
    ++faults_;
    std::printf("FAULT: %s cannot be read as it is: %d %s\n", seed.make.c_str(),
                static_cast<int>(result.outcome), result.details.c_str());
  }
}

void Driver::tryFile(std::uint64_t number) {
  const DamagedFile damaged = damagedFile(seeds_, options_.seed, number);
  for (const bool validated : {true, false}) {
    const Result result = read(damaged.file, validated);
    ++counts_.at(validated ? 0 : 1).at(static_cast<std::size_t>(result.outcome));
    if (result.outcome == Outcome::kFault) ++faults_;
    if (result.outcome >= Outcome::kCrashed) report(number, damaged, validated, result);
  }
}

void Driver::report(std::uint64_t number, const DamagedFile& file, bool validated,
                    const Result& result) {
  const bool fault = result.outcome == Outcome::kFault;
  if (!fault && !options_.verbose && !options_.only) return;
  std::printf("%s: --seed %lu --only %lu, validation %s, %s: %s\n",
              fault                                 ? "FAULT"
              : result.outcome == Outcome::kCrashed ? "crash"
                                                    : "hang",
              options_.seed, number, validated ? "on" : "off", file.description.c_str(),
              result.details.c_str());
  if (options_.keep.empty()) return;
  const fs::path folder = fs::path(options_.keep) /
                          fmt::format("{}-{}-{}", options_.seed, number, validated ? "on" : "off");
  fs::create_directories(folder);
  writeFile(file.file, folder);
}

void Driver::printTable() const {
  std::printf("%-14s %8s %8s %8s %8s %8s %8s\n", "Validation", "whole", "errors", "refused",
              "crashes", "hangs", "faults");
  for (std::size_t row = 0; row < counts_.size(); ++row) {
    std::printf("%-14s", row == 0 ? "on" : "off");
    for (const std::uint64_t count : counts_.at(row))
      std::printf(" %8lu", count);
    std::printf("\n");
  }
}

int run(int count, char** words) {
  Options options;
  CLI::App app("Reads damaged files and counts what comes of it");
  app.add_option("--files", options.files,
                 "How many (1000); each is read with validation and without");
  app.add_option("--seed", options.seed, "Other files of the same kinds (1)");
  app.add_option("--only", options.only, "Only the file of this number");
  app.add_option("--keep", options.keep, "Keep files that crash or hang the library here");
  app.add_option("--seconds", options.seconds, "The most that one may take (20)");
  app.add_flag("--verbose", options.verbose, "Tell of each crash and hang");
  CLI11_PARSE(app, count, words);
  Driver driver(options);
  const bool sound = driver.run();
  driver.printTable();
  return sound ? EXIT_SUCCESS : EXIT_FAILURE;
}

}  // namespace
}  // namespace ambrix::fuzz

int main(int count, char** words) {
  try {
    return ambrix::fuzz::run(count, words);
  } catch (const std::exception& error) {
    std::fprintf(stderr, "fuzz_files: %s\n", error.what());
    return EXIT_FAILURE;
  }
}
