// CDFlib of the stand-in: writes each argument list down.
#include <cdf.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <string>

#include "tests/support/fake_cdflib.h"
#include "tests/support/fake_cdflib_sizes.h"
#include "tests/support/library_call.h"

namespace {

using ambrix_test::FakeCdflib;
using ambrix_test::Item;
using ambrix_test::Slots;

class WrittenCall : public ambrix_test::LibraryCall {
 public:
  using LibraryCall::LibraryCall;
  [[nodiscard]] const std::string& text() const { return text_; }

 private:
  void beginOperation(const char* name) override {
    separate();
    text_ += name;
    text_ += ' ';
  }

  void beginItem(const Item& item, bool first) override {
    if (!first) separate();
    text_ += item.name;
  }

  void takeHandle(void* handle) override {
    show(std::to_string(reinterpret_cast<std::uintptr_t>(handle)));
  }
  void takeNumber(const Item&, long number) override { show(std::to_string(number)); }
  void takeText(const char* text) override { show('\'' + std::string(text) + '\''); }
  void takeParameters(const long* parameters) override {
    show('[' + std::to_string(*parameters) + ']');
  }
  void takeData(const void* data, long values) override {
    fake_.take(data, ambrix_test::bytesOfValues(values));
  }

  /// One entry per dimension, and those beyond that are not 0.
  void takeVector(const Slots& entries) override {
    const long dimensions =
        createdDimensions() < 0 ? fake_.number("zVAR_NUMDIMS_") : createdDimensions();
    std::size_t shown = std::min(static_cast<std::size_t>(dimensions), entries.size());
    for (std::size_t i = 0; i < entries.size(); ++i) {
      if (entries[i] != 0) shown = std::max(shown, i + 1);
    }
    std::string text = "[";
    for (std::size_t i = 0; i < shown; ++i)
      text += (i == 0 ? "" : " ") + std::to_string(entries[i]);
    show(text + ']');
  }

  void fill(const Item& item, char kind, std::size_t index, void* place) override {
    switch (kind) {
      case 'N':
        *static_cast<long*>(place) = fake_.number(item.name, index);
        break;
      case 'P':  // untouched unless set, as the library does for a type without a parameter
        if (index < fake_.numbers(item.name).size())
          *static_cast<long*>(place) = fake_.number(item.name, index);
        break;
      case 'V':
        std::ranges::copy(fake_.numbers(item.name), static_cast<long*>(place));
        break;
      case 'S':
        copyText(fake_.text(item.name), place);
        break;
      case 'T':  // the last number is the status
        copyText("text of status " + std::to_string(lastNumber()), place);
        break;
      case 'C':
        *static_cast<char*>(place) = ' ';
        break;
      default:
        *static_cast<CDFid*>(place) = reinterpret_cast<CDFid>(fake_.number("handle"));
    }
  }

  void fillData(void* data, long values) override {
    fake_.give(data, ambrix_test::bytesOfValues(values));
  }

  [[nodiscard]] ambrix_test::LibraryVariable variable() const override {
    return ambrix_test::describedVariable();
  }

  static void copyText(const std::string& text, void* place) {
    static_cast<char*>(place)[text.copy(static_cast<char*>(place), text.size())] = '\0';
  }

  void show(const std::string& argument) { text_ += ' ' + argument; }

  void separate() {
    if (!text_.empty()) text_ += " | ";
  }

  FakeCdflib& fake_ = ambrix_test::fakeCdflib();
  std::string text_;
};

}  // namespace

extern "C" CDFstatus CDFlib(long operation, ...) {
  std::va_list arguments;
  va_start(arguments, operation);
  WrittenCall call(arguments);
  va_end(arguments);
  const bool sound = call.read(operation);
  if (!sound) ADD_FAILURE() << "the library would not understand: " << call.text() << " ...";
  return sound ? ambrix_test::fakeCdflib().finish(call.text()) : BAD_FNC_OR_ITEM;
}
