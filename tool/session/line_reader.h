// Lines of which no more is held in memory than may be.
#pragma once

#include <cstddef>
#include <istream>
#include <string>

namespace ambrix::tool {

struct Line {
  std::string text;
  bool whole = true;  // else it was too long, and the text is a part of it
};

/// Reads the next line; of one that is longer than `limit` bytes the rest is passed over. Returns
/// whether there was one. The last line may lack its end.
bool readLine(std::istream& input, std::size_t limit, Line& line);

}  // namespace ambrix::tool
