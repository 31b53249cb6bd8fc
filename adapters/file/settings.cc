// Settings and facts of files and variables.
#include <charconv>
#include <cstdint>
#include <string>
#include <variant>

#include "adapters/file/extended_calls.h"
#include "adapters/file/numbers.h"
#include "ambrix/file.h"
#include "ambrix/texts.h"

namespace ambrix {
namespace {

std::string readVersion(File& file) {
  std::string version;
  for (const Array& part : file.call("getVersion")) {
    if (!version.empty()) version += '.';
    version += shortest(part.data<double>().front());
  }
  return version;
}

Compression compressionOf(const std::vector<Array>& results) {
  Compression compression;
  compression.type = bytesOf(results.at(0));
  const Array& parameter = results.at(1);
  if (parameter.classId() == ClassId::kChar) {
    compression.parameter = bytesOf(parameter);
  } else if (parameter.elementCount() > 0) {
    compression.parameter = shortest(parameter.data<double>().front());
  }
  compression.percentage = results.at(2).data<double>().front();
  return compression;
}

[[noreturn]] void throwBadSetting(const File& file, std::string_view given, const char* wanted) {
  throw FileError(file.path(), "badSetting", '"' + std::string(given) + "\" is no " + wanted);
}

/// The value of a constant of that kind, which is how its name ends ("_CHECKSUM").
double settingValue(const File& file, std::string_view name, std::string_view ending,
                    const char* kind) {
  const double value = constantValue(file.module(), name);
  if (!name.ends_with(ending)) throwBadSetting(file, name, kind);
  return value;
}

double typeOf(const File& file, const Compression& compression) {
  return settingValue(file, compression.type, "_COMPRESSION", "type of compression");
}

/// The parameter as commands take it: only GZIP has one to be chosen.
std::optional<double> levelOf(const File& file, const Compression& compression) {
  const std::string& text = compression.parameter;
  double level = 0;
  if (compression.type != "GZIP_COMPRESSION" || text.empty()) return std::nullopt;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), level);
  const bool isNumber = error == std::errc() && end == text.data() + text.size();
  if (!isNumber) throwBadSetting(file, text, "level of compression");
  return level;
}

}  // namespace

/// The encoding's name; files of later libraries may have one that the module cannot name.
std::string File::readEncoding() try {
  return bytesOf(attempt("inquire").at(0));
} catch (const Error& error) {
  if (isLibraryFailure(error)) fail(error);
  return "unknown (" + std::to_string(std::get<std::int64_t>(error.values().at(0))) + ")";
}

FileFacts File::facts() {
  FileFacts facts;
  facts.version = readVersion(*this);
  facts.format = text("getFormat");
  facts.encoding = readEncoding();
  facts.majority = text("getMajority");
  facts.checksum = text("getChecksum");
  facts.compression = compressionOf(call("getCompression"));
  facts.records = static_cast<std::int64_t>(number("getVarsMaxWrittenRecNum")) + 1;
  facts.globalAttributes = sizeOf(number("getNumgAttributes"));
  facts.variableAttributes = sizeOf(number("getNumvAttributes"));
  return facts;
}

void File::setFormat(std::string_view format) {
  change("setFormat", {settingValue(*this, format, "_FILE", "format of files")});
}

void File::setMajority(std::string_view majority) {
  change("setMajority", {settingValue(*this, majority, "_MAJOR", "majority")});
}

void File::setChecksum(std::string_view checksum) {
  change("setChecksum", {settingValue(*this, checksum, "_CHECKSUM", "checksum")});
}

void File::setCompression(const Compression& compression) {
  const double type = typeOf(*this, compression);
  if (const auto level = levelOf(*this, compression)) {
    change("setCompression", {type, *level});
  } else {
    change("setCompression", {type});
  }
}

Compression File::compression(const Variable& variable) {
  return compressionOf(call("getVarCompression", {numberOf(variable)}));
}

void File::setCompression(const Variable& variable, const Compression& compression) {
  const double type = typeOf(*this, compression);
  if (const auto level = levelOf(*this, compression)) {
    change("setVarCompression", {numberOf(variable), type, *level});
  } else {
    change("setVarCompression", {numberOf(variable), type});
  }
}

std::string File::sparseRecords(const Variable& variable) {
  return text("getVarSparseRecords", {numberOf(variable)});
}

void File::setSparseRecords(const Variable& variable, std::string_view mode) {
  change("setVarSparseRecords", {numberOf(variable), settingValue(*this, mode, "_SPARSERECORDS",
                                                                  "mode of sparse records")});
}

Array File::padValue(const Variable& variable) {
  const ExtendedCalls extended(*module_);
  return std::move(call("getVarPadValue", {numberOf(variable)}).at(0));
}

void File::setPadValue(const Variable& variable, ArrayView value) {
  const Array number = Array::scalar(numberOf(variable));
  const ArrayView arguments[] = {number, value};
  change("setVarPadValue", arguments);
}

std::size_t File::blockingFactor(const Variable& variable) {
  return sizeOf(number("getVarBlockingFactor", {numberOf(variable)}));
}

void File::setBlockingFactor(const Variable& variable, std::size_t records) {
  change("setVarBlockingFactor", {numberOf(variable), static_cast<double>(records)});
}

std::int64_t File::recordCount(const Variable& variable) {
  return static_cast<std::int64_t>(number("getVarMaxWrittenRecNum", {numberOf(variable)})) + 1;
}

std::int64_t File::recordsWritten(const Variable& variable) {
  return static_cast<std::int64_t>(number("getVarNumRecsWritten", {numberOf(variable)}));
}

}  // namespace ambrix
