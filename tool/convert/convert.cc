#include "tool/convert/convert.h"

#include <fmt/format.h>

#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <system_error>

#include "tool/content/failure.h"
#include "tool/content/open_file.h"
#include "tool/format/file_header.h"
#include "tool/format/open_failure.h"
#include "tool/output/output_file.h"
#include "tool/output/text.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

std::vector<std::string> unsupportedEntries(File& input, const Attribute& attribute) {
  std::vector<std::string> lines;
  input.forEachEntry(attribute, [&](const Entry& entry) {
    if (entry.supported) return;
    lines.push_back("entry " + std::to_string(entry.number) + " of attribute \"" +
                    printable(attribute.name) + "\" (" + datatypeName(entry.datatype) + ")");
  });
  return lines;
}

void reportUnsupported(File& input, bool skip) {
  const std::vector<std::string> lines = listUnsupported(input);
  for (const std::string& line : lines)
    std::fprintf(stderr, "ambrix: %s: %s\n", skip ? "skipped" : "not supported", line.c_str());
  if (lines.empty() || skip) return;
  throw ToolError("unsupportedContent",
                  "not everything can be copied; nothing was written"
                  " (--skip-unsupported leaves it out)");
}

/// A folder or a device is no name for a file, and neither is one with an extension behind it.
void requireFileName(const fs::path& wanted) {
  std::error_code error;
  const fs::file_status status = fs::status(wanted, error);
  if (wanted.filename().empty() || fs::is_directory(status)) {
    throw ToolError("noFileName", wanted.string() + " is a folder; name the file to write in it");
  }
  if (fs::exists(status) && !fs::is_regular_file(status)) {
    throw ToolError("noFileName", wanted.string() + " is a device or a pipe, not a file");
  }
}

std::string counted(std::size_t count, const char* thing) {
  return std::to_string(count) + ' ' + thing + (count == 1 ? "" : "s");
}

std::string describeVariables(const fs::path& input) {
  const auto header = readFileHeader(input);
  if (!header || header->rVariables == 0) return "";
  return counted(header->rVariables, "rVariable") + " became " +
         (header->rVariables == 1 ? "a zVariable" : "zVariables") +
         ", without dimensions that do not vary";
}

std::string describeTexts(const Conversion& conversion) {
  if (conversion.cutTexts == 0) return "";
  return counted(conversion.cutTexts, "text") +
         " of attributes ended at a zero byte, and the rest is now zeros";
}

/// Growth that nobody asked for: the library reserves room anew, which shows in small files.
std::string describeGrowth(const Conversion& conversion, const fs::path& input,
                           const fs::path& output) {
  if (!conversion.options.compression.empty()) return "";
  std::error_code error;
  const std::uintmax_t before = fs::file_size(input, error);
  const std::uintmax_t after = error ? 0 : fs::file_size(output, error);
  if (error || conversion.input.text("getFormat") != "SINGLE_FILE") return "";
  if (after / 3 * 2 <= before) return "";
  return fmt::format("{} bytes became {}, including space that the library reserves", before,
                     after);
}

/// Tells on one line what of the input was not carried over as it is.
void reportChanges(const Conversion& conversion, const fs::path& output) {
  const fs::path input = fileOnDisk(conversion.options.input);
  std::vector<std::string> changes = {describeVariables(input), describeTexts(conversion),
                                      describeGrowth(conversion, input, output)};
  std::erase(changes, "");
  if (changes.empty()) return;
  std::fprintf(stderr, "ambrix: changed in %s: %s\n", printable(conversion.options.output).c_str(),
               fmt::format("{}", fmt::join(changes, "; ")).c_str());
}

void writeCopy(Module& module, const ConvertOptions& options, File& input,
               const std::string& name) {
  CreatedFileObserver observer(options.output);
  File output = File::create(module, name, {.observer = &observer});
  Conversion conversion{module, options, input, output, findHiddenTexts(fileOnDisk(options.input))};
  copySettings(conversion);
  createVariables(conversion);
  copyAttributes(conversion);
  copyData(conversion);
  const Pause pause;  // compressing a large file takes its time
  output.close();
  reportChanges(conversion, name);
}

}  // namespace

fs::path chooseOutput(const std::string& wanted) {
  requireFileName(wanted);
  const fs::path path = withCdfExtension(wanted);
  if (path != wanted) {
    std::fprintf(stderr, "ambrix: the file will be %s\n", printable(path.string()).c_str());
  }
  return path;
}

std::vector<std::string> listUnsupported(File& input) {
  std::vector<std::string> lines;
  for (const Variable& variable : input.variables()) {
    if (variable.supported) continue;
    lines.push_back("variable \"" + printable(variable.name) + "\" (" +
                    datatypeName(variable.datatype) + ")");
  }
  const std::size_t attributes = input.attributeCount();
  for (std::size_t number = 0; number < attributes; ++number) {
    const auto more = unsupportedEntries(input, input.attribute(number));
    lines.insert(lines.end(), more.begin(), more.end());
  }
  return lines;
}

void runConvert(Module& module, const ConvertOptions& options, const std::string& output) {
  File input = openFile(module, options.input);
  reportUnsupported(input, options.skipUnsupported);
  writeCopy(module, options, input, output);
}

}  // namespace ambrix::tool
