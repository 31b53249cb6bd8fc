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
constexpr char kDefaultLevel[] = "6";

struct CompressionChoice {
  const char* type = nullptr;
  std::optional<double> level;  // of gzip
};

/// "gzip:6", "GZIP", "rle", ...
CompressionChoice parseCompression(const std::string& text) {
  const std::size_t colon = std::min(text.find(':'), text.size());
  const std::string name = CLI::detail::to_lower(text.substr(0, colon));
  const auto known = std::ranges::find(kCompressions, name, &NamedConstant::name);
  if (known == kCompressions.end()) {
    throw UsageError("--compression: expected none, rle, huff, ahuff or gzip:LEVEL");
  }
  if (name != "gzip" && colon == text.size()) return {known->constant, std::nullopt};
  const std::string level = colon == text.size() ? kDefaultLevel : text.substr(colon + 1);
  if (name != "gzip" || level.size() != 1 || level < "1" || level > "9") {
    throw UsageError("--compression: only gzip has a level, from 1 to 9");
  }
  return {known->constant, level.front() - '0'};
}

void setCompression(Conversion& conversion, const CompressionChoice& choice) {
  const double type = constantValue(conversion.module, choice.type);
  if (choice.level) {
    conversion.output.call("setCompression", {type, *choice.level});
  } else {
    conversion.output.call("setCompression", {type});
  }
}

void copyCompression(Conversion& conversion) {
  if (!conversion.options.compression.empty()) {
    return setCompression(conversion, parseCompression(conversion.options.compression));
  }
  const std::vector<Array> facts = conversion.input.call("getCompression");
  const std::string type = bytesOf(facts.at(0));
  if (type == "NO_COMPRESSION") return;
  const bool gzip = type == "GZIP_COMPRESSION";
  setCompression(conversion, {type.c_str(), gzip ? std::optional(facts.at(1).data<double>().front())
                                                 : std::nullopt});
}

std::string wantedMajority(const ConvertOptions& options, const std::string& given) {
  if (options.majority.empty()) return given;
  return options.majority == "row" ? "ROW_MAJOR" : "COLUMN_MAJOR";
}

std::string wantedChecksum(const ConvertOptions& options, const std::string& given) {
  if (options.checksum.empty()) return given;
  return options.checksum == "md5" ? "MD5_CHECKSUM" : "NO_CHECKSUM";
}

Array rowOfSizes(const std::vector<std::size_t>& sizes) {
  const std::vector<double> numbers(sizes.begin(), sizes.end());
  return Array::row(std::span<const double>(numbers));
}

Array rowOfLogicals(const std::vector<bool>& values) {
  Array row = Array::zeros(ClassId::kLogical, {1, values.size()});
  std::ranges::copy(values, row.mutableData<bool>().begin());
  return row;
}

double createVariable(Conversion& conversion, const Variable& variable) {
  const Array name = Array::fromNarrow(variable.name);
  const Array datatype = Array::scalar(datatypeCode(conversion.module, variable.datatype));
  const Array elements = Array::scalar(static_cast<double>(variable.elements));
  const Array sizes = rowOfSizes(variable.sizes);
  const Array recordVaries = Array::scalar(variable.recordVaries);
  const Array varies = rowOfLogicals(variable.varies);
  const ArrayView arguments[] = {name, datatype, elements, sizes, recordVaries, varies};
  return conversion.output.call("createVar", arguments).at(0).data<double>().front();
}

void copyPadValue(Conversion& conversion, const Copied& variable, bool sparse) {
  const Array wanted =
      std::move(conversion.input.call("getVarPadValue", {variable.source.number}).at(0));
  const Array given =
      std::move(conversion.output.call("getVarPadValue", {variable.target.number}).at(0));
  // A default stays one, but for records that are read as the pad value.
  if (!sparse && std::ranges::equal(wanted.bytes(), given.bytes())) return;
  const Array number = Array::scalar(variable.target.number);
  const ArrayView arguments[] = {number, wanted};
  conversion.output.call("setVarPadValue", arguments);
}

void copyVariableCompression(Conversion& conversion, const Copied& variable) {
  const std::vector<Array> facts =
      conversion.input.call("getVarCompression", {variable.source.number});
  const std::string type = bytesOf(facts.at(0));
  if (type == "NO_COMPRESSION") return;
  const bool level = facts.at(1).classId() == ClassId::kDouble;
  const double parameter = level ? facts.at(1).data<double>().front() : 0;
  conversion.output.call("setVarCompression", {variable.target.number,
                                               constantValue(conversion.module, type), parameter});
}

void copyVariableSettings(Conversion& conversion, const Copied& variable) {
  const double from = variable.source.number;
  const double to = variable.target.number;
  const std::string sparse = conversion.input.text("getVarSparseRecords", {from});
  const bool isSparse = sparse != "NO_SPARSERECORDS";
  copyPadValue(conversion, variable, isSparse);
  copyVariableCompression(conversion, variable);
  if (isSparse) {
    conversion.output.call("setVarSparseRecords", {to, constantValue(conversion.module, sparse)});
  }
  const double blocking = conversion.input.number("getVarBlockingFactor", {from});
  if (blocking > 0) conversion.output.call("setVarBlockingFactor", {to, blocking});
}

}  // namespace

double datatypeCode(Module& module, std::string name) {
  for (char& c : name)
    c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
  return constantValue(module, name);
}

void checkOptions(const ConvertOptions& options) {
  if (!options.compression.empty()) parseCompression(options.compression);
}

void copySettings(Conversion& conversion) {
  const std::string given = conversion.input.text("getMajority");
  const std::string majority = wantedMajority(conversion.options, given);
  const std::string checksum =
      wantedChecksum(conversion.options, conversion.input.text("getChecksum"));
  conversion.transposes = majority != given;
  Module& module = conversion.module;
  conversion.output.call("setFormat", {constantValue(module, "SINGLE_FILE")});
  conversion.output.call("setMajority", {constantValue(module, majority)});
  conversion.output.call("setChecksum", {constantValue(module, checksum)});
  copyCompression(conversion);
}

void createVariables(Conversion& conversion) {
  const double count = countVariables(conversion.input);
  for (double number = 0; number < count; ++number) {
    Copied variable;
    variable.source = inquireVariable(conversion.input, number);
    if (!variable.source.supported) continue;
    variable.target = variable.source;
    if (conversion.transposes) {
      std::ranges::reverse(variable.target.sizes);
      std::reverse(variable.target.varies.begin(), variable.target.varies.end());
    }
    variable.target.number = createVariable(conversion, variable.target);
    copyVariableSettings(conversion, variable);
    conversion.variables.push_back(std::move(variable));
  }
}

}  // namespace ambrix::tool
