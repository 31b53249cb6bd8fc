// Runs sequences of calls from a seed in child processes, and tells of any that breaks.
#include <sys/mman.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <iterator>
#include <new>
#include <random>
#include <string>
#include <thread>
#include <vector>

#include "fuzz/calls/call_log.h"
#include "fuzz/calls/checks.h"
#include "fuzz/calls/mode.h"
#include "fuzz/calls/sequence.h"
#include "fuzz/calls/transcript.h"

namespace ambrix_fuzz {
namespace {

namespace fs = std::filesystem;
using Clock = std::chrono::steady_clock;
using namespace std::chrono_literals;

constexpr std::uint64_t kSequencesPerChild = 100;
constexpr rlim_t kLargestFile = 8 << 20;
constexpr auto kPatience = 60s;  // for one sequence
constexpr std::uint64_t kCallsThatReachAll = 50000;

struct Options {
  std::uint64_t calls = 100000;
  std::uint64_t seed = 1;
  std::int64_t replay = -1;
  bool extended = false;
  std::string transcript;
};

std::vector<std::uint8_t> bytesOf(std::uint64_t seed, std::uint64_t sequence) {
  std::seed_seq both{seed, seed >> 32, sequence, sequence >> 32};
  std::mt19937_64 generator(both);
  std::vector<std::uint8_t> bytes(kSequenceBytes);
  for (std::uint8_t& byte : bytes)
    byte = static_cast<std::uint8_t>(generator() >> 56);
  return bytes;
}

CallLog& sharedLog() {
  void* memory =
      mmap(nullptr, sizeof(CallLog), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
  if (memory == MAP_FAILED) throw std::bad_alloc();
  return *new (memory) CallLog;
}

/// A folder for the files of a run, removed with everything in it.
class Folder {
 public:
  Folder() {
    std::string name = (fs::temp_directory_path() / "ambrix-fuzz-XXXXXX").string();
    if (mkdtemp(name.data()) == nullptr) throw std::runtime_error("no temporary folder");
    path_ = name;
    fs::current_path(path_);
  }
  ~Folder() {
    std::error_code ignored;
    fs::current_path("/", ignored);
    fs::remove_all(path_, ignored);
  }
  Folder(const Folder&) = delete;
  Folder& operator=(const Folder&) = delete;

 private:
  fs::path path_;
};

/// The library's settings in the environment, and files without end, are not what is tried here.
void confineProcess() {
  for (const char* name : {"CDF_VALIDATE", "CDF_CHECKSUM", "CDF_FILEBACKWARD", "CDF_TMP"})
    unsetenv(name);
  const rlimit files{kLargestFile, kLargestFile};
  setrlimit(RLIMIT_FSIZE, &files);
  std::signal(SIGXFSZ, SIG_IGN);
}

class Run {
 public:
  explicit Run(const Options& options) : options_(options), log_(sharedLog()) {
    setCallLog(log_);
    setExtended(options.extended);
    confineProcess();
  }

  int all();
  int replay();

 private:
  void runSequences();
  bool child();
  int waitFor(pid_t child);
  void tellBroken(int status) const;
  bool reachedAll() const;
  void tellSummary(double seconds) const;

  Options options_;
  Folder folder_;
  CallLog& log_;
};

/// A transcript is in parts: one of each child, because no file may be large.
void Run::runSequences() {
  if (!options_.transcript.empty()) {
    openTranscript(options_.transcript + '.' + std::to_string(log_.sequence));
  }
  const std::uint64_t end = log_.sequence + kSequencesPerChild;
  for (; log_.sequence < end && log_.calls < options_.calls; ++log_.sequence) {
    runSequence(bytesOf(options_.seed, log_.sequence));
    ++log_.finished;
  }
}

int Run::waitFor(pid_t child) {
  int status = 0;
  std::uint64_t seen = log_.calls;
  auto since = Clock::now();
  while (waitpid(child, &status, WNOHANG) == 0) {
    std::this_thread::sleep_for(5ms);
    if (seen != log_.calls) since = Clock::now();
    seen = log_.calls;
    if (Clock::now() - since > kPatience) kill(child, SIGKILL);
  }
  return status;
}

/// Whether the next sequences went well.
bool Run::child() {
  const pid_t child = fork();
  if (child < 0) throw std::runtime_error("no child process");
  if (child == 0) {
    runSequences();
    std::exit(0);
  }
  const int status = waitFor(child);
  if (status != 0) tellBroken(status);
  return status == 0;
}

void Run::tellBroken(int status) const {
  std::printf("BROKEN in sequence %llu: ", static_cast<unsigned long long>(log_.sequence));
  if (WIFSIGNALED(status)) {
    const char* hint = WTERMSIG(status) == SIGKILL ? ", perhaps after waiting in vain" : "";
    std::printf("signal %d (%s)%s\n", WTERMSIG(status), strsignal(WTERMSIG(status)), hint);
  } else {
    std::printf("exit %d\n", WEXITSTATUS(status));
  }
  for (const std::string& line : log_.lastLines())
    std::printf("  %s\n", line.c_str());
  std::printf("Again: --seed %llu --replay %llu%s\n",
              static_cast<unsigned long long>(options_.seed),
              static_cast<unsigned long long>(log_.sequence), isExtended() ? " --extended" : "");
}

/// A run that is long enough must have made every command succeed, or it shows nothing of it.
bool Run::reachedAll() const {
  if (log_.calls < kCallsThatReachAll) return true;
  bool all = true;
  std::vector<ambrix_test::Command> commands = ambrix_test::commands();
  if (isExtended())
    std::ranges::copy(ambrix_test::extendedCommands(), std::back_inserter(commands));
  for (std::size_t i = 0; i < commands.size(); ++i) {
    if (log_.succeeded[i] > 0) continue;
    std::printf("NEVER SUCCEEDED: %s\n", commands[i].name.c_str());
    all = false;
  }
  return all;
}

void Run::tellSummary(double seconds) const {
  std::uint64_t succeeded = 0;
  for (const std::uint64_t count : log_.succeeded)
    succeeded += count;
  std::size_t seen = 0;
  std::string unseen;
  for (std::size_t i = 0; i < knownErrors(); ++i) {
    seen += log_.errors[i] > 0 ? 1U : 0U;
    if (log_.errors[i] == 0) unseen += std::string(" ") + errorName(i);
  }
  std::printf("%llu calls in %llu sequences, %.0f calls/s; %llu succeeded; %zu of %zu errors seen",
              static_cast<unsigned long long>(log_.calls),
              static_cast<unsigned long long>(log_.finished),
              static_cast<double>(log_.calls) / seconds, static_cast<unsigned long long>(succeeded),
              seen, knownErrors());
  std::printf("%s%s\n", unseen.empty() ? "" : ", but not", unseen.c_str());
}

int Run::all() {
  const auto start = Clock::now();
  while (log_.calls < options_.calls) {
    if (!child()) return 1;
  }
  tellSummary(std::chrono::duration<double>(Clock::now() - start).count());
  return reachedAll() ? 0 : 1;
}

int Run::replay() {
  log_.printing = true;
  log_.sequence = static_cast<std::uint64_t>(options_.replay);
  runSequence(bytesOf(options_.seed, log_.sequence));
  std::puts("This sequence breaks nothing.");
  return 0;
}

}  // namespace
}  // namespace ambrix_fuzz

int main(int argc, char** argv) {
  ambrix_fuzz::Options options;
  CLI::App app("Calls commands in sequences made from a seed, and stops at what breaks.");
  app.add_option("--calls", options.calls, "How many calls at least")->capture_default_str();
  app.add_option("--seed", options.seed, "Where chance begins")->capture_default_str();
  app.add_option("--replay", options.replay, "Only this sequence, printing each call");
  app.add_flag("--extended", options.extended, "As a host that offers extended datatypes");
  app.add_option("--transcript", options.transcript,
                 "Write what each call answers to files\nof this name");
  CLI11_PARSE(app, argc, argv);
  ambrix_fuzz::Run run(options);
  return options.replay >= 0 ? run.replay() : run.all();
}
