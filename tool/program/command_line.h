// The arguments of the tool.
#pragma once

#include <CLI/CLI.hpp>
#include <memory>
#include <string>
#include <vector>

#include "tool/call/call.h"
#include "tool/check/check.h"
#include "tool/convert/convert.h"
#include "tool/dump/dump.h"
#include "tool/info/info.h"
#include "tool/session/session.h"
#include "tool/supervision/supervision.h"

namespace ambrix::tool {

struct Arguments {
  CallOptions call;
  CheckOptions check;
  ConvertOptions convert;
  DumpOptions dump;
  InfoOptions info;
  Limits limits;
  SessionOptions session;
  bool version = false;
  bool manual = false;
};

/// The parser of the command line, which stores into `arguments`; these must outlive it.
std::unique_ptr<CLI::App> makeParser(Arguments& arguments);

}  // namespace ambrix::tool
