#include "tool/convert.h"

#include <cstdio>
#include <filesystem>

#include "tool/attributes.h"
#include "tool/failure.h"
#include "tool/output_file.h"
#include "tool/steps.h"
#include "tool/text.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

std::vector<std::string> unsupportedEntries(CdfFile& input, const Attribute& attribute) {
  std::vector<std::string> lines;
  forEachEntry(input, attribute, [&](const EntryHeader& entry) {
    if (entry.supported) return;
    lines.push_back("entry " + std::to_string(static_cast<long>(entry.number)) +
                    " of attribute \"" + printable(attribute.name) + "\" (" + entry.datatype + ")");
  });
  return lines;
}

void reportUnsupported(CdfFile& input, bool skip) {
  const std::vector<std::string> lines = listUnsupported(input);
  for (const std::string& line : lines)
    std::fprintf(stderr, "ambrix: %s: %s\n", skip ? "skipped" : "not supported", line.c_str());
  if (lines.empty() || skip) return;
  throw ToolError("unsupportedContent",
                  "not everything can be carried over; nothing was written"
                  " (--skip-unsupported leaves it out)");
}

void writeCopy(Module& module, const ConvertOptions& options, CdfFile& input,
               const std::string& name) {
  CdfFile output = CdfFile::create(module, name);
  Conversion conversion{module, options, input, output, false, {}};
  copySettings(conversion);
  createVariables(conversion);
  copyAttributes(conversion);
  copyData(conversion);
  const Pause pause;  // compressing a large file takes its time
  output.close();
}

}  // namespace

fs::path chooseOutput(const std::string& wanted) {
  const fs::path path = withCdfExtension(wanted);
  if (path != wanted) {
    std::fprintf(stderr, "ambrix: the file will be %s\n", printable(path.string()).c_str());
  }
  return path;
}

std::vector<std::string> listUnsupported(CdfFile& input) {
  std::vector<std::string> lines;
  const double variables = countVariables(input);
  for (double number = 0; number < variables; ++number) {
    const Variable variable = inquireVariable(input, number);
    if (variable.supported) continue;
    lines.push_back("variable \"" + printable(variable.name) + "\" (" + variable.datatype + ")");
  }
  const double attributes = countAttributes(input);
  for (double number = 0; number < attributes; ++number) {
    const auto more = unsupportedEntries(input, inquireAttribute(input, number));
    lines.insert(lines.end(), more.begin(), more.end());
  }
  return lines;
}

void runConvert(Module& module, const ConvertOptions& options, const std::string& output) {
  CdfFile input = CdfFile::open(module, options.input);
  input.setReadOnly();
  reportUnsupported(input, options.skipUnsupported);
  writeCopy(module, options, input, output);
}

}  // namespace ambrix::tool
