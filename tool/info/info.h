// `ambrix info`: what a file is made of.
#pragma once

#include <string>

#include "tool/content/facts.h"
#include "tool/output/standard_output.h"
#include "tool/output/text.h"

namespace ambrix::tool {

struct InfoOptions {
  std::string file;
  bool attributes = false;
  bool json = false;
};

void runInfo(Module& module, const InfoOptions& options, StandardOutput& output);

/// The facts as tables or as a JSON object.
std::string factsAsTables(const FileFacts& facts, const InfoOptions& options, const Style& style);
std::string factsAsJson(const FileFacts& facts, const InfoOptions& options);

}  // namespace ambrix::tool
