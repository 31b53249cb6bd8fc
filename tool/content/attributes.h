// Walks over the attributes of a file.
#pragma once

#include <functional>
#include <string>

#include "tool/content/cdf_file.h"

namespace ambrix::tool {

struct Attribute {
  double number = 0;
  std::string name;  // as bytes
  bool global = true;
  double maxEntry = -1;
};

struct EntryHeader {
  double number = 0;
  std::string datatype;
  bool supported = true;
  double elements = 0;  // unknown where the datatype is not supported
};

double countAttributes(CdfFile& file);

/// Asks the library not to keep the file ready for changes, which makes it much quicker. It then
/// has a table of all numbers that entries could have: not where that would fill the memory.
void setReadOnly(CdfFile& file);

Attribute inquireAttribute(CdfFile& file, double number);

EntryHeader inquireEntry(CdfFile& file, const Attribute& attribute, double entry);
Array readEntry(CdfFile& file, const Attribute& attribute, double entry);

/// Calls the function with each entry that there is. Throws `Error` when one cannot be inquired.
void forEachEntry(CdfFile& file, const Attribute& attribute,
                  const std::function<void(const EntryHeader&)>& function);

}  // namespace ambrix::tool
