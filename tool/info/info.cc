#include "tool/info/info.h"

#include <utility>

#include "tool/content/open_file.h"

namespace ambrix::tool {
namespace {

FileDescription describe(File& file, bool withAttributes) {
  if (withAttributes) return file.describe();
  FileDescription description;
  description.facts = file.facts();
  const std::size_t variables = file.variableCount();
  for (std::size_t number = 0; number < variables; ++number)
    description.variables.push_back(file.describeVariable(number));
  return description;
}

}  // namespace

void runInfo(Module& module, const InfoOptions& options, StandardOutput& output) {
  File file = openFile(module, options.file);
  const Info info{module, options, describe(file, options.attributes)};
  file.close();
  output.write(options.json ? infoAsJson(info) : infoAsTables(info, Style(output.isTerminal())));
}

}  // namespace ambrix::tool
