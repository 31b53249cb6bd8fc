// Texts of attributes that go on behind a zero byte, where the module ends them.
#pragma once

#include <compare>
#include <cstdint>
#include <optional>
#include <set>
#include <string>

namespace ambrix::tool {

/// The numbers of an entry, where rVariables are counted before zVariables.
struct EntryNumbers {
  std::uint64_t attribute = 0;
  std::uint64_t entry = 0;
  auto operator<=>(const EntryNumbers&) const = default;
};

/// The entries with anything but zeros behind a zero byte. Nothing for a file that is compressed as
/// a whole.
std::optional<std::set<EntryNumbers>> findHiddenTexts(const std::string& path);

}  // namespace ambrix::tool
