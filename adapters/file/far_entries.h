// Entries whose numbers lie far apart.
#pragma once

#include <cstddef>
#include <vector>

#include "ambrix/file.h"

namespace ambrix {

/// What a scratch copy is made of, and how.
struct ScratchPlace {
  const std::filesystem::path& original;
  const FileOptions& options;
};

/// The numbers, from `first` on, of an attribute's entries in rising order, but not more than
/// `count`. The commands tell the highest number only. So the entries are found from the top, by
/// deleting one after the other in a scratch copy of the file: what this takes depends on how many
/// there are, not on how high their numbers are. Throws `FileError` when there can be no copy.
std::vector<std::size_t> farEntries(File& file, const Attribute& attribute, std::size_t first,
                                    std::size_t count, const ScratchPlace& place);

}  // namespace ambrix
