#include "tool/format/file_header.h"

#include <cstddef>
#include <fstream>
#include <string_view>

#include "tool/format/record_fields.h"

namespace ambrix::tool {
namespace {

using Kind = FileHeader::Kind;

constexpr std::size_t kMagicBytes = 8;
constexpr std::size_t kHeaderBytes = 128;

Kind kindOf(std::string_view bytes) {
  RecordFields fields{std::string(bytes)};
  const std::uint32_t first = fields.word();
  const std::uint32_t second = fields.word();
  constexpr std::uint32_t kCompressed = 0xCCCC0001;
  if (first == 0xCDF30001 || first == 0xCDF26002) {
    return second == kCompressed ? Kind::kCompressedCdf : Kind::kCdf;
  }
  if (first == 0x0000FFFF) return Kind::kCdf;  // before version 2.6
  if (first == 0x0F000000) return Kind::kCdfOfVersion1;
  if (first >> 20U == 0xCDF) return Kind::kLaterCdf;
  if (bytes.starts_with("CDF\001") || bytes.starts_with("CDF\002")) return Kind::kNetCdf;
  if (bytes.starts_with("\x89HDF")) return Kind::kHdf;
  if (bytes.starts_with("\x1f\x8b")) return Kind::kGzip;
  return Kind::kOther;
}

/// The record that a file begins with, and the one that it leads to. Offsets and sizes have eight
/// bytes from version 3 on, and four before.
void readRecords(std::istream& file, const std::string& begin, FileHeader& header) {
  const std::size_t wide = RecordFields(begin).word() == 0xCDF30001 ? 8 : 4;
  RecordFields first(begin);
  first.skip(kMagicBytes + wide + 4);  // the magic numbers, then the record's size and type
  const std::uint64_t second = first.next(wide);
  header.offsetBytes = wide;
  header.version[0] = first.word();
  header.version[1] = first.word();
  first.skip(16);
  header.version[2] = first.word();
  RecordFields global(readBytes(file, second, kHeaderBytes));
  global.skip(wide + 4 + 2 * wide);
  header.firstAttribute = global.next(wide);
  header.end = global.next(wide);
  header.rVariables = global.word();
  global.skip(16 + wide + 4);
  header.leapSecondTable = wide == 8 ? global.word() : 0;
}

}  // namespace

std::optional<FileHeader> readFileHeader(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  const std::string begin = readBytes(file, 0, kHeaderBytes);
  if (begin.size() < kMagicBytes) return std::nullopt;
  FileHeader header;
  header.kind = kindOf(begin);
  if (header.kind == Kind::kCdf) readRecords(file, begin, header);
  return header;
}

}  // namespace ambrix::tool
