// CDFlib of the stand-in: reads an argument list as the library does.
#include <cdf.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdarg>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>

#include "tests/support/fake_cdflib.h"
#include "tests/support/fake_cdflib_items.h"
#include "tests/support/fake_cdflib_sizes.h"

namespace {

using ambrix_test::FakeCdflib;
using ambrix_test::Item;
using ambrix_test::Numbers;

constexpr std::size_t kMaxDims = 10;  // whatever the variable has, so many must be readable

class ArgumentList {
 public:
  explicit ArgumentList(std::va_list list) { va_copy(list_, list); }
  ~ArgumentList() { va_end(list_); }
  ArgumentList(const ArgumentList&) = delete;
  ArgumentList& operator=(const ArgumentList&) = delete;

  /// Reads from the first operation up to NULL_; false for a list that makes no sense.
  bool read(long operation) {
    while (operation != NULL_) {
      const char* name = ambrix_test::operationName(operation);
      if (name == nullptr) return false;
      separate();
      text_ += name;
      text_ += ' ';
      if (!readItems(operation)) return false;
      operation = next_;
    }
    return true;
  }

  [[nodiscard]] const std::string& text() const { return text_; }

 private:
  bool readItems(long operation) {
    operation_ = operation;
    bool first = true;
    for (next_ = number(); next_ < NULL_; next_ = number(), first = false) {
      const Item* item = ambrix_test::findItem(operation, next_);
      if (item == nullptr) return false;
      if (!first) separate();
      text_ += item->name;
      readArguments(*item);
    }
    return !first;
  }

  void readArguments(const Item& item) {
    given_ = 0;
    for (const char* kind = item.arguments; *kind != '\0'; ++kind)
      readArgument(item, *kind);
  }

  void readArgument(const Item& item, char kind) {
    if (kind >= 'a') {
      readInput(item, kind);
    } else {
      fill(item.name, kind);
    }
  }

  void readInput(const Item& item, char kind) {
    switch (kind) {
      case 'n':
        lastNumber_ = number();
        if (item.name == std::string_view("zVAR_RECCOUNT_")) records_ = lastNumber_;
        return show(std::to_string(lastNumber_));
      case 'h':
        return show(std::to_string(reinterpret_cast<std::uintptr_t>(pointer<void>())));
      case 's':
        return show('\'' + std::string(pointer<const char>()) + '\'');
      case 'v':
        if (createdDimensions_ < 0 && operation_ == CREATE_) createdDimensions_ = lastNumber_;
        return readVector(item.name);
      case 'p':
        return show('[' + std::to_string(*pointer<const long>()) + ']');
      default:
        fake_.take(pointer<const void>(), bytesOfData(item.name));
    }
  }

  void readVector(std::string_view item) {
    const auto* entries = pointer<const long>();
    if (item == "zVAR_DIMCOUNTS_") counts_ = {entries, dimensions()};
    showVector(entries);
  }

  /// What the library would move for this item of data.
  [[nodiscard]] std::size_t bytesOfData(std::string_view item) const {
    if (item == "zVAR_HYPERDATA_") return ambrix_test::bytesOfHyperslab(records_, counts_);
    return ambrix_test::bytesOfValue();
  }

  /// Of the variable that the stand-in was told of.
  [[nodiscard]] std::size_t dimensions() const {
    return std::min(fake_.numbers("zVAR_DIMSIZES_").size(), kMaxDims);
  }

  void fill(const std::string& item, char kind) {
    switch (kind) {
      case 'N':
        *pointer<long>() = fake_.number(item, given_++);
        break;
      case 'P':  // untouched unless set, as the library does for a type without a parameter
        fillParameter(item, pointer<long>());
        break;
      case 'V':
        std::ranges::copy(fake_.numbers(item), pointer<long>());
        break;
      case 'S':
        copyText(fake_.text(item), pointer<char>());
        break;
      case 'T':
        copyText("text of status " + std::to_string(lastNumber_), pointer<char>());
        break;
      case 'C':
        *pointer<char>() = ' ';
        break;
      case 'H':
        *pointer<CDFid>() = reinterpret_cast<CDFid>(fake_.number("handle"));
        break;
      default:
        fake_.give(pointer<void>(), bytesOfData(item));
    }
  }

  void fillParameter(const std::string& item, long* parameter) {
    if (given_ < fake_.numbers(item).size()) *parameter = fake_.number(item, given_);
    ++given_;
  }

  static void copyText(const std::string& text, char* place) {
    place[text.copy(place, text.size())] = '\0';
  }

  void showVector(const long* entries) {
    const long dimensions =
        createdDimensions_ < 0 ? fake_.number("zVAR_NUMDIMS_") : createdDimensions_;
    std::size_t shown = std::min(static_cast<std::size_t>(dimensions), kMaxDims);
    for (std::size_t i = 0; i < kMaxDims; ++i) {
      if (entries[i] != 0) shown = std::max(shown, i + 1);
    }
    std::string text = "[";
    for (std::size_t i = 0; i < shown; ++i)
      text += (i == 0 ? "" : " ") + std::to_string(entries[i]);
    show(text + ']');
  }

  void show(const std::string& argument) { text_ += ' ' + argument; }

  void separate() {
    if (!text_.empty()) text_ += " | ";
  }

  long number() { return va_arg(list_, long); }

  template <typename T>
  T* pointer() {
    return va_arg(list_, T*);
  }

  FakeCdflib& fake_ = ambrix_test::fakeCdflib();
  std::va_list list_;
  std::string text_;
  long next_ = 0;
  long lastNumber_ = 0;  // the status, when its text is asked for
  long operation_ = 0;
  long createdDimensions_ = -1;  // of the variable that the list creates
  long records_ = 0;             // of the hyperslab
  std::span<const long> counts_;
  std::size_t given_ = 0;
};

}  // namespace

extern "C" CDFstatus CDFlib(long operation, ...) {
  std::va_list arguments;
  va_start(arguments, operation);
  ArgumentList list(arguments);
  va_end(arguments);
  const bool sound = list.read(operation);
  if (!sound) ADD_FAILURE() << "the library would not understand: " << list.text() << " ...";
  return sound ? ambrix_test::fakeCdflib().finish(list.text()) : BAD_FNC_OR_ITEM;
}
