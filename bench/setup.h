// What every program of the benchmark does the same amount of, and how it is told.
#pragma once

#include <chrono>
#include <cstddef>
#include <span>
#include <string>
#include <string_view>

namespace ambrix_bench {

/// Where the files are and how much is done: everything, or a fraction for a quick look.
struct Setup {
  std::string folder;
  std::size_t divisor = 1;

  [[nodiscard]] std::size_t records() const { return 6400 / divisor; }  // of 8000 bytes
  [[nodiscard]] std::size_t variables() const { return 500 / divisor; }
  [[nodiscard]] std::size_t singles() const { return 100'000 / divisor; }
  [[nodiscard]] std::size_t texts() const { return 100'000 / divisor; }
  [[nodiscard]] std::size_t images() const { return 2000 / divisor; }
  [[nodiscard]] std::size_t smallFiles() const { return 1000 / divisor; }
  [[nodiscard]] std::size_t times() const { return 1'000'000 / divisor; }
  [[nodiscard]] std::size_t calls() const { return 20'000 / divisor; }

  [[nodiscard]] std::string file(std::string_view name) const {
    return folder + '/' + std::string(name);
  }
};

inline constexpr long kRecordSizes[] = {100, 10};  // doubles
inline constexpr std::size_t kRecordValues = 1000;
inline constexpr std::size_t kAttributes = 20;
inline constexpr std::size_t kTextLength = 32;
inline constexpr long kImageSizes[] = {64, 64};  // 16-bit integers, every second of each is read
inline constexpr std::size_t kImageValuesRead = 1024;

class Stopwatch {
 public:
  [[nodiscard]] double seconds() const {
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start_).count();
  }

 private:
  std::chrono::steady_clock::time_point start_ = std::chrono::steady_clock::now();
};

/// One round of a workload: the seconds that the timed part took.
struct Workload {
  std::string_view name;
  double (*round)(const Setup& setup);
};

/// The whole of a program: PROGRAM FOLDER DIVISOR. Says "ready", then reads the name of a workload
/// from each line of its input and answers with the seconds of one round. With a workload's name
/// behind, it runs that one instead, once.
int serve(int argumentCount, char** arguments, std::span<const Workload> workloads);

}  // namespace ambrix_bench
