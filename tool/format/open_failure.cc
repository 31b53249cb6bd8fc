#include "tool/format/open_failure.h"

#include <fmt/format.h>
#include <unistd.h>

#include <cerrno>
#include <cmath>
#include <filesystem>
#include <system_error>

#include "ambrix/file.h"
#include "tool/content/failure.h"
#include "tool/format/file_header.h"

namespace ambrix::tool {
namespace {

constexpr const char* kDamagedOrUnknown =
    "it is damaged, or this version of the CDF library does not support it";

namespace fs = std::filesystem;

constexpr std::size_t kLongestPath = 512;  // that the library takes
constexpr std::uint32_t kLeapSecondTable = 20170101;

std::string versionText(const std::array<std::uint32_t, 3>& version) {
  return fmt::format("{}", fmt::join(version, "."));
}

std::array<std::uint32_t, 3> libraryVersion(Module& module) {
  std::array<std::uint32_t, 3> version{};
  const std::vector<Array> parts = module.call("getLibraryVersion");
  for (std::size_t i = 0; i < version.size(); ++i)
    version[i] = static_cast<std::uint32_t>(std::lround(parts.at(i).data<double>().front()));
  return version;
}

std::string explainLeapSeconds(std::uint32_t table) {
  if (table > kLeapSecondTable) {
    return fmt::format(
        "it has times by a table of leap seconds of {}, and the table of the CDF library is "
        "outdated; name a newer one in the environment variable "
        "CDF_LEAPSECONDSTABLE",
        table);
  }
  return fmt::format(
      "its times were made with an outdated table of leap seconds, of {}, or it is "
      "damaged",
      table);
}

std::string explainCdf(Module& module, const FileHeader& header, std::uint64_t bytes) {
  const auto library = libraryVersion(module);
  if (header.version > library) {
    return fmt::format(
        "it was written by version {} of the CDF library, which is later than the "
        "version in use ({}), or it is damaged",
        versionText(header.version), versionText(library));
  }
  if (bytes < header.end) {
    return fmt::format("it is damaged: it ends after {} of {} bytes", bytes, header.end);
  }
  const std::uint32_t table = header.leapSecondTable;
  if (table != 0 && table != kLeapSecondTable) return explainLeapSeconds(table);
  return kDamagedOrUnknown;
}

std::string explainContent(Module& module, const FileHeader& header, std::uint64_t bytes) {
  using Kind = FileHeader::Kind;
  switch (header.kind) {
    case Kind::kCdf:
      return explainCdf(module, header, bytes);
    case Kind::kCompressedCdf:
      return kDamagedOrUnknown;
    case Kind::kCdfOfVersion1:
      return "it was written by version 1 of the CDF library, whose files cannot be read any more";
    case Kind::kLaterCdf:
      return "it was written by a later version of the CDF library than the one in use";
    case Kind::kNetCdf:
      return "it is not a CDF file but a netCDF file";
    case Kind::kHdf:
      return "it is not a CDF file but an HDF5 or netCDF file";
    case Kind::kGzip:
      return "it is not a CDF file but is packed by gzip; unpack it first";
    case Kind::kOther:
      break;
  }
  return "it is not a CDF file";
}

}  // namespace

void requireOpenable(const std::string& path) {
  const fs::path file = fileOnDisk(path);
  if (file.native().size() > kLongestPath) {
    throw OpenError(
        fmt::format("the path has {} bytes, and the CDF library accepts at most {}; go to "
                    "its folder first, or rename it",
                    file.native().size(), kLongestPath));
  }
  std::error_code error;
  const fs::file_status status = fs::status(file, error);
  if (fs::exists(status) && !fs::is_regular_file(status) && !fs::is_directory(status)) {
    throw OpenError("it is a device or a pipe; copy its contents to a file first");
  }
}

std::string explainRefusal(Module& module, const std::string& path) {
  const fs::path file = fileOnDisk(path);
  if (::access(file.c_str(), F_OK) != 0 && errno == ENOENT) return "there is no such file";
  if (::access(file.c_str(), R_OK) != 0) {
    return "it cannot be read: " + std::generic_category().message(errno);
  }
  std::error_code error;
  if (fs::is_directory(file, error)) return "it is a folder";
  const std::uintmax_t bytes = fs::file_size(file, error);
  if (!error && bytes == 0) return "it is empty";
  const auto header = readFileHeader(file);
  return header ? explainContent(module, *header, bytes) : "it is not a CDF file";
}

bool isOpenFailure(const Error& error) {
  return error.identifier() == "TOLVEX:ambrix:cdflib:fileOpenError";
}

}  // namespace ambrix::tool
