// Everything that `ambrix info` tells about a file.
#pragma once

#include <string>
#include <vector>

#include "tool/content/cdf_file.h"
#include "tool/content/values.h"
#include "tool/content/variable.h"

namespace ambrix::tool {

struct Compression {
  std::string type;       // "GZIP_COMPRESSION"
  std::string parameter;  // "6", "RLE_OF_ZEROS" or nothing
  double percentage = 0;
};

struct VariableFacts {
  Variable definition;
  double records = 0;  // the highest record written and 1
  double written = 0;  // the records really stored
  Compression compression;
  std::string sparseRecords;
  std::vector<ValueText> padValue;
};

/// An entry of an attribute: of a variable, or one by number of a global attribute.
struct EntryFacts {
  double number = 0;
  std::string datatype;
  bool supported = true;
  double elements = 0;
  std::vector<ValueText> values;
};

struct AttributeFacts {
  std::string name;
  bool global = true;
  std::vector<EntryFacts> entries;
};

struct FileFacts {
  std::string version;
  std::string format;
  std::string encoding;
  std::string majority;
  std::string checksum;
  Compression compression;
  double records = 0;
  double globalAttributes = 0;
  double variableAttributes = 0;
  std::vector<VariableFacts> variables;
  std::vector<AttributeFacts> attributes;
};

/// What the file says of itself, without variables and attributes.
FileFacts readFileFacts(CdfFile& file);
VariableFacts readVariableFacts(Module& module, CdfFile& file, double number);
AttributeFacts readAttributeFacts(Module& module, CdfFile& file, double number);
FileFacts readFacts(Module& module, CdfFile& file, bool withAttributes);

Compression readCompression(const std::vector<Array>& results);

}  // namespace ambrix::tool
