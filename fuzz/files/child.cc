#include "fuzz/files/child.h"

#include <fcntl.h>
#include <fmt/format.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstring>
#include <exception>
#include <fstream>
#include <sstream>
#include <system_error>
#include <thread>

#include "fuzz/files/trace.h"

namespace ambrix::fuzz {
namespace {

constexpr int kFaultStatus = 77;
constexpr rlim_t kFileBytes = 1 << 28;
constexpr rlim_t kMemoryBytes = rlim_t{3} << 30;

void limit(int resource, rlim_t most) {
  const rlimit both = {most, most};
  ::setrlimit(static_cast<__rlimit_resource>(resource), &both);
}

void prepare(const std::filesystem::path& log) {
  const int file = ::open(log.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0644);
  ::dup2(file, STDOUT_FILENO);
  ::dup2(file, STDERR_FILENO);
  limit(RLIMIT_CORE, 0);
  limit(RLIMIT_FSIZE, kFileBytes);
#ifndef AMBRIX_SANITIZED
  limit(RLIMIT_AS, kMemoryBytes);  // sanitizers take terabytes, of addresses
#endif
  std::signal(SIGXFSZ, SIG_IGN);
  printStackOnCrash();
}

int statusOf(const std::function<Reading()>& read) try {
  return static_cast<int>(read());
} catch (const Error& error) {
  std::fprintf(stderr, "fault: %s: %s\n", error.identifier().c_str(), error.what());
  return kFaultStatus;
} catch (const std::exception& error) {
  std::fprintf(stderr, "fault: %s\n", error.what());
  return kFaultStatus;
}

/// Waits for the child to end; kills it when its time is over. Returns whether it had to.
bool waitFor(pid_t child, double seconds, int& status) {
  using Clock = std::chrono::steady_clock;
  const auto end = Clock::now() + std::chrono::duration<double>(seconds);
  auto pause = std::chrono::microseconds(50);
  while (::waitpid(child, &status, WNOHANG) == 0) {
    if (Clock::now() > end) {
      ::kill(child, SIGKILL);
      ::waitpid(child, &status, 0);
      return true;
    }
    std::this_thread::sleep_for(pause);
    pause = std::min(pause * 2, std::chrono::microseconds(2000));
  }
  return false;
}

std::string textOf(const std::filesystem::path& path) {
  std::ifstream file(path);
  std::ostringstream text;
  text << file.rdbuf();
  return text.str();
}

Result resultOfCrash(const std::string& how, const std::string& log) {
  const Blame blame = blameOf(log);
  if (blame.ours) return {Outcome::kFault, how + " in " + blame.place};
  return {Outcome::kCrashed, how + " in " + (blame.known ? blame.place : "an unknown place")};
}

Result resultOf(int status, const std::string& log) {
  if (WIFSIGNALED(status)) return resultOfCrash(::strsignal(WTERMSIG(status)), log);
  const int code = WEXITSTATUS(status);
  if (code <= static_cast<int>(Reading::kRefused)) return {static_cast<Outcome>(code), ""};
  if (code == kFaultStatus) return {Outcome::kFault, log};
  return resultOfCrash(fmt::format("exit status {}", code), log);
}

}  // namespace

Result runInChild(const std::function<Reading()>& read, double seconds,
                  const std::filesystem::path& log) {
  std::fflush(nullptr);  // or the child would print it, too
  const pid_t child = ::fork();
  if (child < 0) throw std::system_error(errno, std::generic_category(), "fork");
  if (child == 0) {
    prepare(log);
    const int status = statusOf(read);
    ::_exit(status);
  }
  int status = 0;
  if (waitFor(child, seconds, status)) return {Outcome::kHung, "nothing came back"};
  return resultOf(status, textOf(log));
}

}  // namespace ambrix::fuzz
