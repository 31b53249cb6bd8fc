// What an attribute of a file is.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "ambrix/datatype.h"

namespace ambrix {

struct Attribute {
  std::size_t number = 0;
  std::string name;            // its bytes in the file
  bool global = true;          // else its entries belong to variables
  std::int64_t maxEntry = -1;  // the highest number of an entry
};

/// One entry of an attribute: that of the variable of the number, or one of a global attribute.
struct Entry {
  std::size_t number = 0;
  Datatype datatype = Datatype::kChar;
  bool supported = true;     // else its value cannot be read, and nothing below is known
  std::size_t elements = 0;  // values; of a text, characters
};

}  // namespace ambrix
