#include "tool/info/info.h"

#include "tool/content/attributes.h"

namespace ambrix::tool {

void runInfo(Module& module, const InfoOptions& options, StandardOutput& output) {
  CdfFile file = CdfFile::open(module, options.file);
  setReadOnly(file);
  const FileFacts facts = readFacts(module, file, options.attributes);
  file.close();
  output.write(options.json ? factsAsJson(facts, options)
                            : factsAsTables(facts, options, Style(output.isTerminal())));
}

}  // namespace ambrix::tool
