// What the module must have open, and roughly what the files hold, so that most calls make sense.
#pragma once

#include <cstdint>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace ambrix_fuzz {

struct Variable {
  long datatype = 22;
  long elements = 1;
  std::vector<long> sizes;  // in the host's order

  friend bool operator==(const Variable&, const Variable&) = default;
};

struct Contents {
  std::vector<Variable> variables;
  std::size_t attributes = 0;
};

struct OpenFile {
  std::uint64_t id = 0;
  std::string name;
  Contents contents;
};

/// Exact as to identifiers; an estimate as to contents, which a second identifier of the same file
/// or a failed command can change unseen.
class World {
 public:
  void opened(std::uint64_t id, const std::string& name);
  void closed(std::uint64_t id);
  void deleted(std::uint64_t id);

  [[nodiscard]] std::vector<OpenFile>& files() { return files_; }
  /// Null for an identifier that is not open.
  OpenFile* find(std::uint64_t id);
  [[nodiscard]] std::set<std::uint64_t> openIds() const;
  [[nodiscard]] const std::vector<std::uint64_t>& closedIds() const { return closedIds_; }

 private:
  void forget(std::uint64_t id);

  std::vector<OpenFile> files_;
  std::vector<std::uint64_t> closedIds_;
  std::map<std::string, Contents> left_;  // in files that were closed, by name
};

}  // namespace ambrix_fuzz
