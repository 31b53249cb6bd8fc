// `ambrix info`: what a file is made of.
#pragma once

#include <string>

#include "ambrix/file.h"
#include "tool/output/standard_output.h"
#include "tool/output/text.h"

namespace ambrix::tool {

struct InfoOptions {
  std::string file;
  bool attributes = false;
  bool json = false;
};

void runInfo(Module& module, const InfoOptions& options, StandardOutput& output);

/// What there is to tell, and the module that makes texts of times.
struct Info {
  Module& module;
  const InfoOptions& options;
  FileDescription file;
};

/// As tables or as a JSON object.
std::string infoAsTables(const Info& info, const Style& style);
std::string infoAsJson(const Info& info);

}  // namespace ambrix::tool
