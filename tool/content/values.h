// The values of variables, attributes and pads as texts.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "ambrix/datatype.h"
#include "ambrix/module.h"

namespace ambrix::tool {

/// One value: a number, or a text as its bytes.
struct ValueText {
  std::string text;
  bool isText = false;
};

/// The same for as long as it is looked at.
struct ValueView {
  std::string_view text;
  bool isText = false;
};

/// Times as ISO 8601, where they are some, or as the numbers that the file has.
enum class TimeForm { kCalendar, kNumbers };

/// Gives the values in an array that the module has read to `sink`, one after the other. Numbers
/// are written with as many digits as tell them apart. `elements` is the number of characters in a
/// text.
void eachValue(Module& module, ArrayView array, Datatype datatype, std::size_t elements,
               TimeForm form, const std::function<void(const ValueView&)>& sink);
/// All of them, times as calendar times.
std::vector<ValueText> formatValues(Module& module, ArrayView array, Datatype datatype,
                                    std::size_t elements);

/// Values on one line.
std::string joinValues(const std::vector<ValueText>& values);

}  // namespace ambrix::tool
