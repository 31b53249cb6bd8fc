#include "adapters/file/entry_finder.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "adapters/file/entry_reader.h"

namespace ambrix {
namespace {

/// Numbers below this one are tried one by one.
constexpr std::int64_t kNumbersTried = 10000;

}  // namespace

/// The search for the entries of one attribute.
class EntryFinder::Search {
 public:
  Search(File& file, const Attribute& attribute, FileObserver* observer)
      : reader_(file, attribute, observer),
        remaining_(reader_.count()),
        tried_(static_cast<std::size_t>(attribute.maxEntry + 1)) {}

  [[nodiscard]] std::size_t remaining() const { return remaining_; }

  /// Tries these numbers until one has no entry.
  void tryFirst(const Numbers& numbers) {
    for (const std::size_t number : numbers)
      if (remaining_ == 0 || !isFound(number)) return;
  }

  void tryOthers() {
    for (std::size_t number = 0; number < tried_.size() && remaining_ > 0; ++number)
      isFound(number);
    if (remaining_ > 0 && failure_) reader_.rethrow(failure_);
  }

  std::vector<Entry> takeEntries() {
    std::ranges::sort(entries_, {}, &Entry::number);
    return std::move(entries_);
  }

 private:
  bool isFound(std::size_t number) {
    if (number >= tried_.size()) return false;
    if (tried_[number]) return true;  // known already, either way
    tried_[number] = true;
    const auto entry = reader_.find(number, failure_);
    if (!entry) return false;
    entries_.push_back(*entry);
    --remaining_;
    return true;
  }

  EntryReader reader_;
  std::size_t remaining_;
  std::vector<bool> tried_;
  std::vector<Entry> entries_;
  std::exception_ptr failure_;
};

std::vector<Entry> EntryFinder::find(const Attribute& attribute) {
  if (attribute.maxEntry >= kNumbersTried) return file_.entries(attribute);
  Search search(file_, attribute, observer_);
  std::vector<Numbers>& alike = seen_[search.remaining()];
  for (const Numbers& numbers : alike)
    search.tryFirst(numbers);
  search.tryOthers();
  std::vector<Entry> entries = search.takeEntries();
  Numbers numbers;
  std::ranges::transform(entries, std::back_inserter(numbers), &Entry::number);
  if (std::ranges::find(alike, numbers) == alike.end()) alike.push_back(std::move(numbers));
  return entries;
}

}  // namespace ambrix
