// Settings of the file and definitions of its variables.
#include <CLI/StringTools.hpp>
#include <algorithm>
#include <array>
#include <cctype>
#include <optional>

#include "tool/content/failure.h"
#include "tool/convert/convert.h"

namespace ambrix::tool {
namespace {

struct NamedConstant {
  std::string_view name;
  const char* constant;
};

constexpr std::array<NamedConstant, 5> kCompressions = {{{"none", "NO_COMPRESSION"},
                                                         {"rle", "RLE_COMPRESSION"},
                                                         {"huff", "HUFF_COMPRESSION"},
                                                         {"ahuff", "AHUFF_COMPRESSION"},
                                                         {"gzip", "GZIP_COMPRESSION"}}};
constexpr char kNoCompression[] = "NO_COMPRESSION";
constexpr char kDefaultLevel[] = "6";

/// "gzip:6", "GZIP", "rle", ...
Compression parseCompression(const std::string& text) {
  const std::size_t colon = std::min(text.find(':'), text.size());
  const std::string name = CLI::detail::to_lower(text.substr(0, colon));
  const auto known = std::ranges::find(kCompressions, name, &NamedConstant::name);
  if (known == kCompressions.end()) {
    throw UsageError("--compression: expected none, rle, huff, ahuff or gzip:LEVEL");
  }
  if (name != "gzip" && colon == text.size()) return {known->constant};
  const std::string level = colon == text.size() ? kDefaultLevel : text.substr(colon + 1);
  if (name != "gzip" || level.size() != 1 || level < "1" || level > "9") {
    throw UsageError("--compression: only gzip has a level, from 1 to 9");
  }
  return {known->constant, level};
}

void copyCompression(Conversion& conversion, const Compression& given) {
  const std::string& wanted = conversion.options.compression;
  const Compression compression = wanted.empty() ? given : parseCompression(wanted);
  if (wanted.empty() && given.type == kNoCompression) return;
  conversion.output.setCompression(compression);
}

std::string wantedMajority(const ConvertOptions& options, const std::string& given) {
  if (options.majority.empty()) return given;
  return options.majority == "row" ? "ROW_MAJOR" : "COLUMN_MAJOR";
}

std::string wantedChecksum(const ConvertOptions& options, const std::string& given) {
  if (options.checksum.empty()) return given;
  return options.checksum == "md5" ? "MD5_CHECKSUM" : "NO_CHECKSUM";
}

void copyPadValue(Conversion& conversion, const Copied& variable, bool sparse) {
  const Array wanted = conversion.input.padValue(variable.source);
  const Array given = conversion.output.padValue(variable.target);
  // A default stays one, but for records that are read as the pad value.
  if (!sparse && std::ranges::equal(wanted.bytes(), given.bytes())) return;
  conversion.output.setPadValue(variable.target, wanted);
}

void copyVariableSettings(Conversion& conversion, const Copied& variable) {
  File& input = conversion.input;
  File& output = conversion.output;
  const std::string sparse = input.sparseRecords(variable.source);
  const bool isSparse = sparse != "NO_SPARSERECORDS";
  copyPadValue(conversion, variable, isSparse);
  const Compression compression = input.compression(variable.source);
  if (compression.type != kNoCompression) output.setCompression(variable.target, compression);
  if (isSparse) output.setSparseRecords(variable.target, sparse);
  const std::size_t blocking = input.blockingFactor(variable.source);
  if (blocking > 0) output.setBlockingFactor(variable.target, blocking);
}

}  // namespace

void checkOptions(const ConvertOptions& options) {
  if (!options.compression.empty()) parseCompression(options.compression);
}

void copySettings(Conversion& conversion) {
  const FileFacts given = conversion.input.facts();
  const std::string majority = wantedMajority(conversion.options, given.majority);
  conversion.transposes = majority != given.majority;
  conversion.output.setFormat("SINGLE_FILE");
  conversion.output.setMajority(majority);
  conversion.output.setChecksum(wantedChecksum(conversion.options, given.checksum));
  copyCompression(conversion, given.compression);
}

void createVariables(Conversion& conversion) {
  const std::size_t count = conversion.input.variableCount();
  for (std::size_t number = 0; number < count; ++number) {
    const Variable source = conversion.input.variable(number);
    if (!source.supported) continue;
    Copied variable{source, source};
    if (conversion.transposes) {
      std::ranges::reverse(variable.target.sizes);
      std::reverse(variable.target.varies.begin(), variable.target.varies.end());
    }
    variable.target = conversion.output.createVariable(variable.target);
    copyVariableSettings(conversion, variable);
    conversion.variables.push_back(std::move(variable));
  }
}

}  // namespace ambrix::tool
