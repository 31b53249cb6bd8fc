#include "adapters/file/names.h"

#include <algorithm>

namespace ambrix {
namespace {

constexpr std::size_t kNamesListed = 20;

std::string inQuotes(std::string_view name) {
  return '"' + std::string(name) + '"';
}

}  // namespace

std::vector<std::string> namesOf(std::size_t count,
                                 const std::function<std::string(std::size_t)>& nameOf) {
  std::vector<std::string> names;
  for (std::size_t number = 0; number < std::min(count, kNamesListed); ++number)
    names.push_back(nameOf(number));
  if (count > kNamesListed) names.emplace_back();
  return names;
}

std::string missing(const char* kind, std::string_view name,
                    const std::vector<std::string>& names) {
  std::string text = std::string("there is no ") + kind + ' ' + inQuotes(name) + "; the file has ";
  if (names.empty()) return text + "none";
  for (const std::string& other : names) {
    if (&other != &names.front()) text += other.empty() ? " and others" : ", ";
    if (!other.empty()) text += inQuotes(other);
  }
  return text;
}

}  // namespace ambrix
