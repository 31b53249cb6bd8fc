#include "tool/output/progress.h"

#include <algorithm>
#include <cstdio>
#include <utility>

namespace ambrix::tool {
namespace {

constexpr auto kPatience = std::chrono::milliseconds(500);
constexpr auto kInterval = std::chrono::milliseconds(100);
constexpr std::size_t kWidth = 40;

}  // namespace

Progress::Progress(std::string label, std::size_t total, bool watched)
    : label_(std::move(label)),
      total_(total),
      watched_(watched),
      nextDraw_(Clock::now() + kPatience) {}

Progress::~Progress() {
  if (drawn_) std::fputs("\r\033[K", stderr);
}

void Progress::advance(std::size_t amount) {
  done_ = std::min(done_ + amount, total_);
  if (!watched_ || Clock::now() < nextDraw_) return;
  draw();
  nextDraw_ = Clock::now() + kInterval;
}

void Progress::draw() {
  const double part = total_ == 0 ? 1 : static_cast<double>(done_) / static_cast<double>(total_);
  const auto filled = static_cast<std::size_t>(part * kWidth);
  const std::string bar = std::string(filled, '#') + std::string(kWidth - filled, '-');
  std::fprintf(stderr, "\r%s [%s] %3.0f %%\033[K", label_.c_str(), bar.c_str(), part * 100);
  drawn_ = true;
}

}  // namespace ambrix::tool
