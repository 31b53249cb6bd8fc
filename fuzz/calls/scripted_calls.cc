// CDFlib of the scripted library: takes an argument list apart as the CDF library does, and touches
// all the memory that it would touch.
#include <cdf.h>

#include <algorithm>
#include <array>
#include <cstdarg>
#include <cstring>
#include <string>

#include "fuzz/calls/call_log.h"
#include "fuzz/calls/script.h"
#include "tests/support/fake_cdflib_items.h"

namespace {

using ambrix_fuzz::Description;
using ambrix_fuzz::requireFitting;
using ambrix_fuzz::Script;
using ambrix_fuzz::Slots;
using ambrix_test::Item;

constexpr std::size_t kLongestName = 256;
constexpr std::size_t kLongestPath = 512;
constexpr std::size_t kLongestStatusText = 200;

/// No file has as many variables as 32 bits can number.
bool numbersNoVariable(long number) {
  return number < 0 || number == 2147483647;
}

/// The hyperslab that a list has selected.
struct Selection {
  long recordCount = 1;
  long recordInterval = 1;
  Slots start{};
  Slots count{};
  Slots interval{};
};

/// The values of the selection; 0 if the library refuses it.
long valuesOf(const Selection& slab, const Description& variable) {
  long values = std::max(slab.recordCount, 0L);
  for (std::size_t i = 0; i < static_cast<std::size_t>(variable.dimensions); ++i) {
    const bool sound = slab.count[i] >= 1 && slab.interval[i] >= 1 && slab.start[i] >= 0;
    const long last = slab.start[i] + (slab.count[i] - 1) * slab.interval[i];
    if (!sound || last >= variable.sizes[i]) return 0;
    if (__builtin_mul_overflow(values, slab.count[i], &values)) return 0;
  }
  return values;
}

/// What the library reads of it: of a variable whose records do not vary it reads whole records
/// with all those between them.
long valuesReadOf(const Selection& slab, const Description& variable) {
  const long values = valuesOf(slab, variable);
  bool whole = variable.recordVariance == NOVARY;
  for (std::size_t i = 0; i < static_cast<std::size_t>(variable.dimensions); ++i)
    whole = whole && slab.count[i] == (variable.variances[i] == NOVARY ? 1 : variable.sizes[i]);
  if (!whole || values == 0) return values;
  return values / slab.recordCount * (slab.recordInterval * (slab.recordCount - 1) + 1);
}

class ArgumentList {
 public:
  ArgumentList(std::va_list list, bool silent) : silent_(silent) { va_copy(list_, list); }
  ~ArgumentList() { va_end(list_); }
  ArgumentList(const ArgumentList&) = delete;
  ArgumentList& operator=(const ArgumentList&) = delete;

  void read(long operation) {
    while (operation != NULL_) {
      operation_ = operation;
      for (next_ = va_arg(list_, long); next_ < NULL_; next_ = va_arg(list_, long))
        readItem();
      operation = next_;
    }
  }

  [[nodiscard]] bool refused() const { return refused_; }

 private:
  void readItem() {
    const Item* item = ambrix_test::findItem(operation_, next_);
    if (item == nullptr) ambrix_fuzz::violation("the library would not understand an item");
    for (const char* kind = item->arguments; *kind != '\0'; ++kind)
      readArgument(*item, *kind);
  }

  void readArgument(const Item& item, char kind) {
    if (kind == 'n') return takeNumber(item.name);
    void* const place = va_arg(list_, void*);
    if (kind >= 'a') return take(item.name, kind, place);
    if (!(silent_ || refused_) || kind == 'T') fill(item.name, kind, place);
  }

  void takeNumber(const std::string& item) {
    const long number = va_arg(list_, long);
    if (item != "CDF_STATUS_") requireFitting(number);
    lastNumber_ = number;
    if (item == "zVAR_" && numbersNoVariable(number)) refused_ = true;
    if (item == "zVAR_RECCOUNT_") slab_.recordCount = number;
    if (item == "zVAR_RECINTERVAL_") slab_.recordInterval = number;
  }

  void take(const std::string& item, char kind, void* place) {
    switch (kind) {
      case 's':
        return ambrix_fuzz::readAll(place, std::strlen(static_cast<char*>(place)) + 1);
      case 'p':
        return ambrix_fuzz::readAll(place, sizeof(long));
      case 'v':
        return takeVector(item, static_cast<const long*>(place));
      case 'd':
        return silent_ || refused_ ? void() : ambrix_fuzz::readAll(place, bytesOfData(item));
      default:
        break;  // a handle, which is not followed
    }
  }

  void takeVector(const std::string& item, const long* numbers) {
    if (operation_ == CREATE_) {  // as many as the variable will have dimensions
      const long count = lastNumber_ <= CDF_MAX_DIMS ? std::max(lastNumber_, 0L) : 0;
      std::for_each(numbers, numbers + count, requireFitting);
      return;
    }
    Slots entries{};
    std::copy_n(numbers, entries.size(), entries.begin());
    std::ranges::for_each(entries, requireFitting);
    if (item == "zVAR_DIMINDICES_") slab_.start = entries;
    if (item == "zVAR_DIMCOUNTS_") slab_.count = entries;
    if (item == "zVAR_DIMINTERVALS_") slab_.interval = entries;
  }

  [[nodiscard]] std::size_t bytesOfData(const std::string& item) const {
    const Description& variable = script_.variable();
    const bool hyper = item == "zVAR_HYPERDATA_";
    const auto values = operation_ == GET_ ? valuesReadOf : valuesOf;
    return ambrix_fuzz::bytesOf(variable, hyper ? values(slab_, variable) : 1);
  }

  void fill(const std::string& item, char kind, void* place) {
    switch (kind) {
      case 'N':
        *static_cast<long*>(place) = script_.number(item);
        break;
      case 'P':
        fillParameters(static_cast<long*>(place));
        break;
      case 'V':
        fillVector(item, static_cast<long*>(place));
        break;
      case 'S':
        fillText(place, item == "CDF_NAME_" ? kLongestPath : kLongestName);
        break;
      case 'T':
        fillText(place, kLongestStatusText);
        break;
      case 'C':
        *static_cast<char*>(place) = ' ';
        break;
      case 'H':
        *static_cast<CDFid*>(place) = reinterpret_cast<CDFid>(script_.handle());
        break;
      default:
        ambrix_fuzz::writeAll(place, bytesOfData(item));
    }
  }

  void fillText(void* place, std::size_t most) {
    const std::string text = script_.text(most);
    std::memcpy(place, text.c_str(), text.size() + 1);
  }

  void fillParameters(long* parameters) {
    const long parameter = script_.number("a parameter");
    std::fill_n(parameters, script_.choices().oneIn(2) ? CDF_MAX_PARMS : 1, parameter);
  }

  void fillVector(const std::string& item, long* place) {
    const Description& variable = script_.variable();
    const Slots& from = item == "zVAR_DIMVARYS_" ? variable.variances : variable.sizes;
    const bool of = item == "zVAR_DIMVARYS_" || item == "zVAR_DIMSIZES_";
    const long count = of ? std::clamp(variable.dimensions, 0L, 10L) : CDF_MAX_DIMS;
    std::copy_n(from.begin(), count, place);
  }

  Script& script_ = ambrix_fuzz::script();
  std::va_list list_;
  bool silent_;
  long operation_ = 0;
  long next_ = 0;
  long lastNumber_ = 0;
  bool refused_ = false;
  Selection slab_;
};

}  // namespace

extern "C" CDFstatus CDFlib(long operation, ...) {
  std::va_list arguments;
  va_start(arguments, operation);
  ArgumentList list(arguments, ambrix_fuzz::script().stopsEarly());
  va_end(arguments);
  list.read(operation);
  const long status = ambrix_fuzz::script().nextStatus();
  return list.refused() ? BAD_VAR_NUM : status;
}
