#include "adapters/file/far_entries.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <system_error>

namespace ambrix {
namespace {

namespace fs = std::filesystem;

constexpr const char* kFarApart = "the file has entries with numbers far apart, and ";

FileError noCopy(const File& file, const std::string& folder, const std::error_code& error) {
  return {file.path(), "noScratchCopy",
          std::string(kFarApart) + "no copy can be made in " + folder +
              " to find them: " + error.message()};
}

fs::path folderFor(const File& file, const fs::path& wanted) {
  if (!wanted.empty()) return wanted;
  std::error_code error;
  fs::path folder = fs::temp_directory_path(error);
  if (error) throw noCopy(file, "the folder for temporary files", error);
  return folder;
}

/// A copy of a file that may be changed, in a folder that goes with this object.
class ScratchCopy {
 public:
  ScratchCopy(const File& file, const fs::path& original, const fs::path& parent) {
    std::error_code error;
    std::string folder = (parent / "ambrix-XXXXXX").string();
    if (::mkdtemp(folder.data()) == nullptr) {
      error.assign(errno, std::generic_category());
    } else {
      folder_ = folder;
      copy(fileOnDisk(original), error);
    }
    if (!error) return;
    discard();
    throw noCopy(file, parent.string(), error);
  }
  ScratchCopy(const ScratchCopy&) = delete;
  ScratchCopy& operator=(const ScratchCopy&) = delete;
  ~ScratchCopy() { discard(); }

  [[nodiscard]] fs::path path() const { return folder_ / "entries.cdf"; }

 private:
  void copy(const fs::path& original, std::error_code& error) const {
    fs::copy_file(original, path(), error);
    if (!error) fs::permissions(path(), fs::perms::owner_write, fs::perm_options::add, error);
  }

  void discard() const {
    std::error_code ignored;
    if (!folder_.empty()) fs::remove_all(folder_, ignored);
  }

  fs::path folder_;
};

/// Deletes entries from the highest down to `first`, and returns their numbers.
std::vector<std::size_t> deleteEntries(File& file, std::size_t attribute, std::size_t first,
                                       std::size_t count) {
  std::vector<std::size_t> numbers;
  while (numbers.size() < count) {
    const Attribute now = file.attribute(attribute);
    if (now.maxEntry < static_cast<std::int64_t>(first)) break;
    numbers.push_back(static_cast<std::size_t>(now.maxEntry));
    file.deleteEntry(now, numbers.back());
  }
  std::ranges::reverse(numbers);
  return numbers;
}

/// Closing would write the file anew; but of several files that are one, only the first is there.
void discard(File& scratch) {
  if (scratch.text("getFormat") != "SINGLE_FILE") return scratch.close();
  scratch.remove();
}

}  // namespace

std::vector<std::size_t> farEntries(File& file, const Attribute& attribute, std::size_t first,
                                    std::size_t count, const ScratchPlace& place) {
  if (count == 0 || static_cast<std::int64_t>(first) > attribute.maxEntry) return {};
  const FileOptions& options = place.options;
  if (options.access == Access::kWrite) {
    throw FileError(file.path(), "noScratchCopy",
                    std::string(kFarApart) + "to look for them it must be opened for reading");
  }
  const fs::path folder = folderFor(file, options.scratchFolder);
  const ScratchCopy copy(file, place.original, folder);
  File scratch = File::open(file.module(), copy.path(), {Access::kWrite, options.observer});
  std::vector<std::size_t> numbers = deleteEntries(scratch, attribute.number, first, count);
  discard(scratch);
  const Step back{Step::Kind::kAttribute, attribute.number, attribute.name};
  if (options.observer != nullptr) options.observer->begins(back);
  return numbers;
}

}  // namespace ambrix
