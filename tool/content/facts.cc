#include "tool/content/facts.h"

#include <fmt/format.h>

#include "tool/content/attributes.h"

namespace ambrix::tool {
namespace {

std::string readVersion(CdfFile& file) {
  std::string version;
  for (const Array& part : file.call("getVersion"))
    version += fmt::format("{}{}", version.empty() ? "" : ".", part.data<double>().front());
  return version;
}

/// The encoding's name; files of later libraries may have one that the module cannot name.
std::string readEncoding(CdfFile& file) try {
  return bytesOf(file.call("inquire").at(0));
} catch (const Error& error) {
  if (isLibraryFailure(error)) throw;
  return fmt::format("unknown ({})", std::get<std::int64_t>(error.values().at(0)));
}

}  // namespace

Compression readCompression(const std::vector<Array>& results) {
  Compression compression;
  compression.type = bytesOf(results.at(0));
  const Array& parameter = results.at(1);
  if (parameter.classId() == ClassId::kChar) {
    compression.parameter = bytesOf(parameter);
  } else if (parameter.elementCount() > 0) {
    compression.parameter = fmt::format("{}", parameter.data<double>().front());
  }
  compression.percentage = results.at(2).data<double>().front();
  return compression;
}

FileFacts readFileFacts(CdfFile& file) {
  FileFacts facts;
  facts.version = readVersion(file);
  facts.format = file.text("getFormat");
  facts.encoding = readEncoding(file);
  facts.majority = file.text("getMajority");
  facts.checksum = file.text("getChecksum");
  facts.compression = readCompression(file.call("getCompression"));
  facts.records = file.number("getVarsMaxWrittenRecNum") + 1;
  facts.globalAttributes = file.number("getNumgAttributes");
  facts.variableAttributes = file.number("getNumvAttributes");
  return facts;
}

VariableFacts readVariableFacts(Module& module, CdfFile& file, double number) {
  VariableFacts facts;
  facts.definition = inquireVariable(file, number);
  facts.records = file.number("getVarMaxWrittenRecNum", {number}) + 1;
  facts.written = file.number("getVarNumRecsWritten", {number});
  facts.compression = readCompression(file.call("getVarCompression", {number}));
  facts.sparseRecords = file.text("getVarSparseRecords", {number});
  const Variable& variable = facts.definition;
  if (!variable.supported) return facts;
  const std::vector<Array> pad = file.call("getVarPadValue", {number});
  facts.padValue = formatValues(module, pad.at(0), variable.datatype, variable.elements);
  return facts;
}

FileFacts readFacts(Module& module, CdfFile& file, bool withAttributes) {
  FileFacts facts = readFileFacts(file);
  const double variables = countVariables(file);
  for (double number = 0; number < variables; ++number)
    facts.variables.push_back(readVariableFacts(module, file, number));
  const double attributes = withAttributes ? countAttributes(file) : 0;
  for (double number = 0; number < attributes; ++number)
    facts.attributes.push_back(readAttributeFacts(module, file, number));
  return facts;
}

}  // namespace ambrix::tool
