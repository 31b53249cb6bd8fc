// The first bytes of a file: what it is and who has written it. The CDF library tells no reason
// when it refuses a file, and shows variables of either kind alike.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

namespace ambrix::tool {

struct FileHeader {
  enum class Kind { kCdf, kCompressedCdf, kCdfOfVersion1, kLaterCdf, kNetCdf, kHdf, kGzip, kOther };
  Kind kind = Kind::kOther;
  // Of files that are not compressed as a whole.
  std::array<std::uint32_t, 3> version{};
  std::uint64_t end = 0;              // where the file should end
  std::size_t offsetBytes = 0;        // of the numbers that say where a record is
  std::uint64_t firstAttribute = 0;   // where its record is, or 0
  std::uint32_t rVariables = 0;       // how many there are
  std::uint32_t leapSecondTable = 0;  // YYYYMMDD of the last leap second known to its writer, or 0
};

/// Nothing when the file cannot be read or is shorter than any header.
std::optional<FileHeader> readFileHeader(const std::string& path);

}  // namespace ambrix::tool
