#include "fuzz/calls/call_log.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

namespace ambrix_fuzz {
namespace {

CallLog ownLog;
CallLog* log = &ownLog;

}  // namespace

void CallLog::note(const std::string& line) {
  std::array<char, kLineLength>& place = lines_[noted_++ % kLines];
  place[line.copy(place.data(), kLineLength - 1)] = '\0';
  if (printing) std::fprintf(stderr, "  %s\n", line.c_str());
}

std::vector<std::string> CallLog::lastLines() const {
  std::vector<std::string> lines;
  const std::uint64_t count = std::min<std::uint64_t>(noted_, kLines);
  for (std::uint64_t i = noted_ - count; i < noted_; ++i)
    lines.emplace_back(lines_[i % kLines].data());
  return lines;
}

CallLog& callLog() {
  return *log;
}

void setCallLog(CallLog& other) {
  log = &other;
}

void violation(const std::string& text) {
  callLog().note("WRONG: " + text);
  std::fprintf(stderr, "WRONG: %s\n", text.c_str());
  std::abort();
}

}  // namespace ambrix_fuzz
