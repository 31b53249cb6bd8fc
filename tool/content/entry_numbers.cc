#include "tool/content/entry_numbers.h"

#include <algorithm>
#include <filesystem>
#include <system_error>

#include "tool/content/failure.h"
#include "tool/format/open_failure.h"
#include "tool/output/text.h"
#include "tool/supervision/scratch_folder.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

/// A copy of a file that may be changed, and goes with this object.
class ScratchCopy {
 public:
  explicit ScratchCopy(const fs::path& original) : path_(scratchFolder() / "entries.cdf") {
    std::error_code error;
    fs::copy_file(original, path_, fs::copy_options::overwrite_existing, error);
    if (!error) fs::permissions(path_, fs::perms::owner_write, fs::perm_options::add, error);
    if (!error) return;
    throw ToolError("noScratchCopy",
                    "the file has entries with numbers far apart, and there can be no copy in " +
                        printable(path_.parent_path().string()) +
                        " to look for them: " + error.message());
  }
  ScratchCopy(const ScratchCopy&) = delete;
  ScratchCopy& operator=(const ScratchCopy&) = delete;
  ~ScratchCopy() {
    std::error_code ignored;
    fs::remove(path_, ignored);
  }

  [[nodiscard]] std::string path() const { return path_.string(); }

 private:
  fs::path path_;
};

/// Deletes entries from the highest down to `first`, and returns their numbers.
std::vector<double> deleteEntries(CdfFile& file, double attribute, double first, double count) {
  std::vector<double> numbers;
  while (static_cast<double>(numbers.size()) < count) {
    const Attribute now = inquireAttribute(file, attribute);
    if (now.maxEntry < first) break;
    file.call(now.global ? "deleteAttrgEntry" : "deleteAttrEntry", {attribute, now.maxEntry});
    numbers.push_back(now.maxEntry);
  }
  std::ranges::reverse(numbers);
  return numbers;
}

/// Closing would write the file anew; but of several files that are one, only the first is there.
void discard(CdfFile& scratch) {
  if (scratch.text("getFormat") != "SINGLE_FILE") return scratch.close();
  scratch.call("delete");
  scratch.forget();
}

}  // namespace

std::vector<double> entryNumbersFrom(CdfFile& file, const Attribute& attribute, double first,
                                     double count) {
  if (count <= 0 || first > attribute.maxEntry) return {};
  const ScratchCopy copy(fileOf(file.path()));
  CdfFile scratch = CdfFile::open(file.module(), copy.path());
  std::vector<double> numbers = deleteEntries(scratch, attribute.number, first, count);
  discard(scratch);
  beginStep("reading attribute \"" + printable(attribute.name) + '"');
  return numbers;
}

}  // namespace ambrix::tool
