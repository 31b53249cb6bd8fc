// Everything that a file tells of itself, without the values of its variables.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/attribute.h"
#include "ambrix/variable.h"

namespace ambrix {

/// Settings and counts of a file, in the words of the commands.
struct FileFacts {
  std::string version;   // "3.9.1", of the library that wrote it
  std::string format;    // "SINGLE_FILE"
  std::string encoding;  // "IBMPC_ENCODING"; "unknown (N)" where the commands have no name
  std::string majority;  // "ROW_MAJOR"
  std::string checksum;  // "NO_CHECKSUM"
  Compression compression;
  std::int64_t records = 0;  // the most that a variable has
  std::size_t globalAttributes = 0;
  std::size_t variableAttributes = 0;
};

struct VariableDescription {
  Variable definition;
  std::int64_t records = 0;  // the highest record written and 1
  std::int64_t written = 0;  // the records really stored
  Compression compression;
  std::string sparseRecords;  // "NO_SPARSERECORDS"
  Array padValue;             // none where the datatype is not supported
};

struct EntryDescription {
  Entry entry;
  Array value;  // none where the datatype is not supported
};

struct AttributeDescription {
  Attribute attribute;
  std::vector<EntryDescription> entries;  // in the order of their numbers
};

struct FileDescription {
  FileFacts facts;
  std::vector<VariableDescription> variables;
  std::vector<AttributeDescription> attributes;
};

}  // namespace ambrix
