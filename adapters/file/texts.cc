#include "ambrix/texts.h"

#include <algorithm>
#include <stdexcept>

namespace ambrix {
namespace {

char16_t widened(char byte) {
  return static_cast<unsigned char>(byte);
}

}  // namespace

std::string bytesOf(ArrayView characters) {
  const std::u16string_view units = characters.chars();
  std::string bytes(units.size(), '\0');
  std::ranges::transform(units, bytes.begin(),
                         [](char16_t unit) { return static_cast<char>(unit); });
  return bytes;
}

std::vector<std::string> textsOf(ArrayView characters, std::size_t length) {
  if (length == 0) return {""};
  const std::string bytes = bytesOf(characters);
  std::vector<std::string> texts;
  texts.reserve(bytes.size() / length);
  for (std::size_t start = 0; start < bytes.size(); start += length)
    texts.push_back(bytes.substr(start, length));
  return texts;
}

Array arrayOfTexts(std::span<const std::string> texts, std::size_t length) {
  Array array = Array::uninitialized(ClassId::kChar, {length, texts.size()});
  const std::span<char16_t> units = array.mutableData<char16_t>();
  std::ranges::fill(units, u' ');
  for (std::size_t i = 0; i < texts.size(); ++i) {
    if (texts[i].size() > length) {
      throw std::invalid_argument("\"" + texts[i] + "\" has more than " + std::to_string(length) +
                                  " characters");
    }
    std::ranges::transform(texts[i], units.subspan(i * length).begin(), widened);
  }
  return array;
}

}  // namespace ambrix
