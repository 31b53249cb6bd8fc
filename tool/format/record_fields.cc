#include "tool/format/record_fields.h"

namespace ambrix::tool {

std::uint64_t RecordFields::next(std::size_t width) {
  std::uint64_t number = 0;
  for (; width > 0; --width, ++place_) {
    const auto byte = place_ < bytes_.size() ? static_cast<unsigned char>(bytes_[place_]) : 0U;
    number = number << 8U | byte;
  }
  return number;
}

std::string readBytes(std::istream& file, std::uint64_t offset, std::size_t count) {
  std::string bytes(count, '\0');
  file.clear();
  file.seekg(static_cast<std::streamoff>(offset));
  file.read(bytes.data(), static_cast<std::streamsize>(bytes.size()));
  bytes.resize(static_cast<std::size_t>(file.gcount()));
  return bytes;
}

}  // namespace ambrix::tool
