// Which entries the attributes of a file have.
#pragma once

#include <cstddef>
#include <map>
#include <vector>

#include "ambrix/file.h"

namespace ambrix {

/// Finds the entries of one attribute after the other. The commands tell how many there are, and of
/// each number whether there is one; that there is none is an error, which takes ten times as long.
/// So the numbers are tried first that an earlier attribute had with as many entries: many
/// attributes belong to the same variables, and when all are found no others are tried.
class EntryFinder {
 public:
  EntryFinder(File& file, FileObserver* observer) : file_(file), observer_(observer) {}

  /// In the order of their numbers. Throws `Error` when one cannot be inquired.
  std::vector<Entry> find(const Attribute& attribute);

 private:
  class Search;
  using Numbers = std::vector<std::size_t>;

  File& file_;
  FileObserver* observer_;
  std::map<std::size_t, std::vector<Numbers>> seen_;  // by how many there are
};

}  // namespace ambrix
