#include "tests/support/library_call.h"

#include <cdf.h>

#include <algorithm>
#include <cctype>
#include <string_view>

namespace ambrix_test {

bool LibraryCall::read(long operation) {
  for (operation_ = operation; operation_ != NULL_; operation_ = next_) {
    const char* name = operationName(operation_);
    if (name == nullptr) return false;
    beginOperation(name);
    if (!readItems()) return false;
  }
  return true;
}

bool LibraryCall::readItems() {
  bool first = true;
  for (next_ = va_arg(list_, long); next_ < NULL_; next_ = va_arg(list_, long), first = false) {
    const Item* item = findItem(operation_, next_);
    if (item == nullptr) return false;
    beginItem(*item, first);
    readArguments(*item);
  }
  return !first;
}

void LibraryCall::readArguments(const Item& item) {
  std::size_t filled = 0;
  for (const char* kind = item.arguments; *kind != '\0'; ++kind) {
    if (*kind == 'D') {
      fillData(va_arg(list_, void*), valuesOf(item));
    } else if (*kind >= 'a') {
      readInput(item, *kind);
    } else {
      fill(item, *kind, filled++, va_arg(list_, void*));
    }
  }
}

void LibraryCall::readInput(const Item& item, char kind) {
  switch (kind) {
    case 'n':
      return readNumber(item);
    case 'h':
      return takeHandle(va_arg(list_, void*));
    case 's':
      return takeText(va_arg(list_, const char*));
    case 'p':
      return takeParameters(va_arg(list_, const long*));
    case 'v':
      return readVector(item);
    default:
      return takeData(va_arg(list_, const void*), valuesOf(item));
  }
}

void LibraryCall::readNumber(const Item& item) {
  lastNumber_ = va_arg(list_, long);
  const std::string_view name = item.name;
  if (name == "zVAR_RECCOUNT_") selection_.recordCount = lastNumber_;
  if (name == "zVAR_RECINTERVAL_") selection_.recordInterval = lastNumber_;
  takeNumber(item, lastNumber_);
}

/// Whatever number of dimensions the variable has, that many entries must be readable.
void LibraryCall::readVector(const Item& item) {
  Slots entries{};
  std::copy_n(va_arg(list_, const long*), entries.size(), entries.begin());
  if (createdDimensions_ < 0 && operation_ == CREATE_) createdDimensions_ = lastNumber_;
  const std::string_view name = item.name;
  if (name == "zVAR_DIMINDICES_") selection_.start = entries;
  if (name == "zVAR_DIMCOUNTS_") selection_.count = entries;
  if (name == "zVAR_DIMINTERVALS_") selection_.interval = entries;
  takeVector(entries);
}

long LibraryCall::valuesOf(const Item& item) const {
  if (item.name != std::string_view("zVAR_HYPERDATA_")) return 1;
  const auto values = operation_ == GET_ ? valuesRead : valuesWritten;
  return values(selection_, variable());
}

}  // namespace ambrix_test
