#include "fuzz/calls/world.h"

#include <algorithm>

namespace ambrix_fuzz {

void World::opened(std::uint64_t id, const std::string& name) {
  std::erase_if(files_, [id](const OpenFile& file) { return file.id == id; });
  files_.push_back({id, name, left_[name]});
}

void World::closed(std::uint64_t id) {
  if (const OpenFile* file = find(id)) left_[file->name] = file->contents;
  forget(id);
}

void World::deleted(std::uint64_t id) {
  if (const OpenFile* file = find(id)) left_.erase(file->name);
  forget(id);
}

OpenFile* World::find(std::uint64_t id) {
  const auto found =
      std::ranges::find_if(files_, [id](const OpenFile& file) { return file.id == id; });
  return found == files_.end() ? nullptr : &*found;
}

std::set<std::uint64_t> World::openIds() const {
  std::set<std::uint64_t> ids;
  for (const OpenFile& file : files_)
    ids.insert(file.id);
  return ids;
}

void World::forget(std::uint64_t id) {
  std::erase_if(files_, [id](const OpenFile& file) { return file.id == id; });
  closedIds_.push_back(id);
}

}  // namespace ambrix_fuzz
