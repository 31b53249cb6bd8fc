// `ambrix convert`: a copy of a file with other settings.
#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "ambrix/file.h"
#include "tool/format/hidden_texts.h"

namespace ambrix::tool {

struct ConvertOptions {
  std::string input;
  std::string output;
  std::string compression;  // empty: as the input has it
  std::string majority;
  std::string checksum;
  bool skipUnsupported = false;
};

/// The file to write: the one that was asked for, with its extension, which may be told.
std::filesystem::path chooseOutput(const std::string& wanted);

/// Writes to `output`, which gets its name from the caller.
void runConvert(Module& module, const ConvertOptions& options, const std::string& output);

/// A variable on its way from one file to another.
struct Copied {
  Variable source;
  Variable target;
};

/// The two files of a conversion.
struct Conversion {
  Module& module;
  const ConvertOptions& options;
  File& input;
  File& output;
  std::optional<std::set<EntryNumbers>> hiddenTexts;  // of the input, if they can be known
  bool transposes = false;                            // the files differ in majority
  std::vector<Copied> variables = {};                 // those that are copied
  std::size_t cutTexts = 0;  // texts of attributes that have lost what was behind a zero byte
};

/// What the module cannot carry over, one line each.
std::vector<std::string> listUnsupported(File& input);

/// Throws `UsageError` when the settings asked for are none that there are.
void checkOptions(const ConvertOptions& options);

void copySettings(Conversion& conversion);
void createVariables(Conversion& conversion);
void copyAttributes(Conversion& conversion);
void copyData(Conversion& conversion);

}  // namespace ambrix::tool
