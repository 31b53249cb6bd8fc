#include "tests/support/fake_cdflib.h"

#include <gtest/gtest.h>

#include <cstring>

namespace ambrix_test {

FakeCdflib& fakeCdflib() {
  static FakeCdflib fake;
  return fake;
}

void FakeCdflib::failCall(std::size_t n, long status) {
  failAt_ = n;
  failStatus_ = status;
}

void FakeCdflib::forgetCalls() {
  calls_.clear();
  statusCalls_.clear();
}

long FakeCdflib::finish(const std::string& call, long status) {
  if (call.find("STATUS_TEXT_") != std::string::npos) {
    statusCalls_.push_back(call);
    return 0;
  }
  calls_.push_back(call);
  if (failAt_ > 0 && --failAt_ == 0) return failStatus_;
  for (const auto& [part, set] : statuses_) {
    if (call.find(part) != std::string::npos) return set;
  }
  return status;
}

long FakeCdflib::number(const std::string& item, std::size_t index) const {
  const Numbers& all = numbers(item);
  return index < all.size() ? all[index] : 0;
}

const Numbers& FakeCdflib::numbers(const std::string& item) const {
  static const Numbers kNone;
  const auto found = numbers_.find(item);
  return found == numbers_.end() ? kNone : found->second;
}

const std::string& FakeCdflib::text(const std::string& item) const {
  static const std::string kNone;
  const auto found = texts_.find(item);
  return found == texts_.end() ? kNone : found->second;
}

void FakeCdflib::give(void* buffer, std::size_t bytes) {
  if (fill_ && bytes == 0) return;  // a refused count: it does not look at the buffer
  if (buffer == nullptr) {
    ADD_FAILURE() << "the library would write to a null pointer";
  } else if (fill_) {
    bytesMoved_ = bytes;
    std::memset(buffer, *fill_, bytes);
  } else if (!data_.empty()) {
    std::memcpy(buffer, data_.data(), data_.size());
  }
}

void FakeCdflib::take(const void* buffer, std::size_t bytes) {
  if (buffer == nullptr) {
    sawNullData_ = true;
    ADD_FAILURE() << "the library would read from a null pointer";
    return;
  }
  if (fill_) bytesToRead_ = bytesMoved_ = bytes;
  const auto* data = static_cast<const unsigned char*>(buffer);
  bytesRead_.assign(data, data + bytesToRead_);
}

double FakeCdflib::nextEpoch() {
  if (epochs_.empty()) return 0;
  const double epoch = epochs_.front();
  if (epochs_.size() > 1) epochs_.erase(epochs_.begin());
  return epoch;
}

}  // namespace ambrix_test
