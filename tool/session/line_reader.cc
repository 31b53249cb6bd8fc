#include "tool/session/line_reader.h"

#include <array>

namespace ambrix::tool {

bool readLine(std::istream& input, std::size_t limit, Line& line) {
  std::array<char, 1 << 16> part;
  line.text.clear();
  line.whole = true;
  bool any = false;
  bool ended = false;
  while (!ended && input.getline(part.data(), part.size()).gcount() > 0) {
    any = true;
    ended = !input.fail() && !input.eof();  // gcount() has the end of the line, too
    const auto bytes = static_cast<std::size_t>(input.gcount()) - (ended ? 1 : 0);
    line.whole = line.whole && bytes <= limit - line.text.size();
    if (line.whole) line.text.append(part.data(), bytes);
    if (!ended && !input.eof()) input.clear();  // the part was full
  }
  return any;
}

}  // namespace ambrix::tool
