// Entries whose numbers lie far apart.
#pragma once

#include <vector>

#include "tool/content/attributes.h"

namespace ambrix::tool {

/// The numbers, from `first` on, of an attribute's entries in rising order, but not more than
/// `count`. The commands tell the highest number only. So the entries are found from the top, by
/// deleting one after the other in a scratch copy of the file: what this takes depends on how many
/// there are, not on how high their numbers are. Throws `ToolError` when there is no room for a
/// copy.
std::vector<double> entryNumbersFrom(CdfFile& file, const Attribute& attribute, double first,
                                     double count);

}  // namespace ambrix::tool
