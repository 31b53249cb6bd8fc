// Records of a CDF file as bytes, for what the CDF library does not tell.
#pragma once

#include <cstddef>
#include <cstdint>
#include <istream>
#include <string>
#include <utility>

namespace ambrix::tool {

/// Numbers of a record, one after the other; beyond its end they are 0.
class RecordFields {
 public:
  explicit RecordFields(std::string bytes) : bytes_(std::move(bytes)) {}

  std::uint64_t next(std::size_t width);
  std::uint32_t word() { return static_cast<std::uint32_t>(next(4)); }
  void skip(std::size_t bytes) { place_ += bytes; }

 private:
  std::string bytes_;
  std::size_t place_ = 0;
};

/// Fewer bytes where the file ends.
std::string readBytes(std::istream& file, std::uint64_t offset, std::size_t count);

}  // namespace ambrix::tool
