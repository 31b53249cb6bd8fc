#include "fuzz/files/trace.h"

#include <dlfcn.h>
#include <execinfo.h>
#include <fmt/format.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <string_view>
#include <vector>

namespace ambrix::fuzz {
namespace {

#ifdef AMBRIX_SANITIZED
constexpr bool kSanitized = true;
#else
constexpr bool kSanitized = false;
#endif

/// A line of the stack that `printStackOnCrash` prints: this, a file and an offset in it.
constexpr std::string_view kFrame = "crash-frame ";

/// Not signal-safe, all of it; but the process is lost anyway, and a second crash ends it.
void printStack(int signal) {
  std::array<void*, 64> frames{};
  const int count = ::backtrace(frames.data(), static_cast<int>(frames.size()));
  for (int i = 2; i < count; ++i) {  // this function, and what the kernel returns to
    Dl_info info{};
    void* const frame = frames.at(static_cast<std::size_t>(i));
    if (::dladdr(frame, &info) == 0) continue;
    const auto offset = static_cast<char*>(frame) - static_cast<char*>(info.dli_fbase);
    std::fprintf(stderr, "%.*s%s %#tx\n", static_cast<int>(kFrame.size()), kFrame.data(),
                 info.dli_fname, offset);
  }
  std::raise(signal);
}

struct Frame {
  std::string function;
  std::string file;  // source or binary
};

bool contains(std::string_view text, std::string_view part) {
  return text.find(part) != std::string_view::npos;
}

/// Of others it is enough to know that they are the system's.
bool isBinaryOfInterest(std::string_view file) {
  return contains(file, "/libcdf.") || contains(file, "ambrix_module");
}

std::string firstLineOf(const std::string& command) {
  std::FILE* const pipe = ::popen(command.c_str(), "r");
  if (pipe == nullptr) return "";
  std::array<char, 512> line{};
  const bool any = std::fgets(line.data(), line.size(), pipe) != nullptr;
  ::pclose(pipe);
  std::string text = any ? line.data() : "";
  while (!text.empty() && text.back() == '\n')
    text.pop_back();
  return text;
}

/// "crash-frame FILE OFFSET"; the function comes from the symbols of the file.
Frame frameOfCrash(const std::string& line) {
  Frame frame;
  std::string offset;
  std::istringstream words(line.substr(kFrame.size()));
  words >> frame.file >> offset;
  if (!isBinaryOfInterest(frame.file)) return frame;
  frame.function =
      firstLineOf(fmt::format("addr2line -f -e '{}' {} 2>/dev/null", frame.file, offset));
  return frame;
}

/// "#0 0x7f in FUNCTION FILE:LINE", of a sanitizer; the file may be relative to the build.
Frame frameOfSanitizer(const std::string& line) {
  const std::size_t in = line.find(" in ");
  if (in == std::string::npos) return {"?", line};
  const std::string rest = line.substr(in + 4);
  const std::size_t blank = std::min(rest.rfind(' '), rest.size());
  return {rest.substr(0, blank), rest.substr(std::min(blank + 1, rest.size()))};
}

/// Whether a source is one of the module, of its host or of this program.
bool isOurSource(std::string_view file) {
  if (file.starts_with("/usr/")) return false;
  constexpr const char* kFolders[] = {"adapters/", "attributes/", "constants/", "epoch/",
                                      "file/",     "fuzz/",       "gateway/",   "variables/"};
  return std::ranges::any_of(kFolders, [&](const char* folder) {
    return contains(file, std::string("/") + folder) && contains(file, ":");
  });
}

enum class Owner { kLibrary, kOurs, kSystem };

/// Sources tell the owner, or the binary: the library's own one or the module, which may contain
/// the library. Names of C++ are ours there.
Owner ownerOf(const Frame& frame) {
  if (contains(frame.file, "/cdf-3.") || contains(frame.file, "/libcdf.")) return Owner::kLibrary;
  if (isOurSource(frame.file)) return Owner::kOurs;
  if (contains(frame.file, "ambrix_module")) {
    return frame.function.starts_with("_Z") ? Owner::kOurs : Owner::kLibrary;
  }
  if (contains(frame.file, "ambrix_embedded") || contains(frame.file, "fuzz_")) return Owner::kOurs;
  return Owner::kSystem;
}

/// A stack, innermost frame first, to its first frame that is not the system's.
Blame blameOfStack(const std::vector<Frame>& stack) {
  for (const Frame& frame : stack) {
    const Owner owner = ownerOf(frame);
    if (owner == Owner::kSystem) continue;
    return {owner == Owner::kOurs, true, frame.function + " " + frame.file};
  }
  return {};
}

/// The stacks in a log: lines of frames that follow each other.
std::vector<std::vector<Frame>> stacksIn(const std::string& log, std::string& titles) {
  std::vector<std::vector<Frame>> stacks(1);
  std::istringstream lines(log);
  for (std::string line; std::getline(lines, line);) {
    const std::size_t start = line.find_first_not_of(' ');
    const std::string_view text =
        start == std::string::npos ? "" : std::string_view(line).substr(start);
    if (text.starts_with(kFrame)) {
      stacks.back().push_back(frameOfCrash(line));
    } else if (text.starts_with('#')) {
      stacks.back().push_back(frameOfSanitizer(line));
    } else {
      if (contains(text, "allocated by")) titles += "allocated";
      if (!stacks.back().empty()) stacks.emplace_back();
    }
  }
  return stacks;
}

}  // namespace

void printStackOnCrash() {
  if (kSanitized) return;
  std::array<void*, 1> loaded{};
  ::backtrace(loaded.data(), 1);  // what it needs is loaded now, not in the handler
  static std::array<std::byte, 1 << 16> stack;
  const stack_t alternative = {stack.data(), 0, stack.size()};
  ::sigaltstack(&alternative, nullptr);
  struct sigaction action = {};
  action.sa_handler = printStack;
  action.sa_flags = static_cast<int>(SA_ONSTACK | SA_RESETHAND | SA_NODEFER);
  for (const int signal : {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT})
    ::sigaction(signal, &action, nullptr);
}

Blame blameOf(const std::string& log) {
  std::string titles;
  const auto stacks = stacksIn(log, titles);
  Blame blame = blameOfStack(stacks.front());
  // The library overruns a buffer that the module was to make large enough: that is our fault.
  if (!blame.ours && !titles.empty() && stacks.size() > 1) {
    const Blame allocation = blameOfStack(stacks.at(1));
    if (allocation.ours) return {true, true, blame.place + ", in memory of " + allocation.place};
  }
  return blame;
}

}  // namespace ambrix::fuzz
