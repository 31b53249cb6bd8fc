// The values of variables, attributes and pads as texts.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "ambrix/datatype.h"
#include "ambrix/module.h"

namespace ambrix::tool {

/// One value: a number, or a text as its bytes.
struct ValueText {
  std::string text;
  bool isText = false;
};

/// The values in an array that the module has read. Times become ISO 8601; numbers are written
/// with as many digits as tell them apart. `elements` is the number of characters in a text.
std::vector<ValueText> formatValues(Module& module, ArrayView array, Datatype datatype,
                                    std::size_t elements);

/// Values on one line.
std::string joinValues(const std::vector<ValueText>& values);

}  // namespace ambrix::tool
