// CDFlib of the scripted library: touches all the memory that the CDF library would touch.
#include <cdf.h>

#include <algorithm>
#include <cstring>
#include <string>
#include <string_view>

#include "fuzz/calls/call_log.h"
#include "fuzz/calls/script.h"
#include "tests/support/library_call.h"

namespace {

using ambrix_fuzz::Description;
using ambrix_fuzz::requireFitting;
using ambrix_fuzz::Script;
using ambrix_test::Item;
using ambrix_test::Slots;

constexpr std::size_t kLongestName = 256;
constexpr std::size_t kLongestPath = 512;
constexpr std::size_t kLongestStatusText = 200;

/// No file has as many variables as 32 bits can number.
bool numbersNoVariable(long number) {
  return number < 0 || number == 2147483647;
}

class ScriptedCall : public ambrix_test::LibraryCall {
 public:
  /// A silent one touches none of the caller's memory, but for texts of a status.
  ScriptedCall(std::va_list list, bool silent) : LibraryCall(list), silent_(silent) {}

  [[nodiscard]] bool refused() const { return refused_; }

 private:
  [[nodiscard]] bool touchesNothing() const { return silent_ || refused_; }

  void takeNumber(const Item& item, long number) override {
    const std::string_view name = item.name;
    if (name != "CDF_STATUS_") requireFitting(number);
    if (name == "zVAR_" && numbersNoVariable(number)) refused_ = true;
  }
  void takeText(const char* text) override { ambrix_fuzz::readAll(text, std::strlen(text) + 1); }
  void takeParameters(const long* parameters) override {
    ambrix_fuzz::readAll(parameters, sizeof(long));
  }
  void takeVector(const Slots& entries) override { std::ranges::for_each(entries, requireFitting); }
  void takeData(const void* data, long values) override {
    if (!touchesNothing()) ambrix_fuzz::readAll(data, ambrix_fuzz::bytesOf(variable(), values));
  }
  void fillData(void* data, long values) override {
    if (!touchesNothing()) ambrix_fuzz::writeAll(data, ambrix_fuzz::bytesOf(variable(), values));
  }
  [[nodiscard]] Description variable() const override { return script_.variable(); }

  void fill(const Item& item, char kind, std::size_t, void* place) override {
    if (kind == 'T') return fillText(place, kLongestStatusText);
    if (touchesNothing()) return;
    switch (kind) {
      case 'N':
        *static_cast<long*>(place) = script_.number(item.name);
        break;
      case 'P':
        fillParameters(static_cast<long*>(place));
        break;
      case 'V':
        fillVector(item.name, static_cast<long*>(place));
        break;
      case 'S':
        fillText(place, item.name == std::string_view("CDF_NAME_") ? kLongestPath : kLongestName);
        break;
      case 'C':
        *static_cast<char*>(place) = ' ';
        break;
      default:
        *static_cast<CDFid*>(place) = reinterpret_cast<CDFid>(script_.handle());
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

  void fillVector(std::string_view item, long* place) {
    const Description& variable = script_.variable();
    const Slots& from = item == "zVAR_DIMVARYS_" ? variable.variances : variable.sizes;
    const bool of = item == "zVAR_DIMVARYS_" || item == "zVAR_DIMSIZES_";
    const long count = of ? std::clamp(variable.dimensions, 0L, 10L) : CDF_MAX_DIMS;
    std::copy_n(from.begin(), count, place);
  }

  Script& script_ = ambrix_fuzz::script();
  bool silent_;
  bool refused_ = false;
};

}  // namespace

extern "C" CDFstatus CDFlib(long operation, ...) {
  std::va_list arguments;
  va_start(arguments, operation);
  ScriptedCall call(arguments, ambrix_fuzz::script().stopsEarly());
  va_end(arguments);
  if (!call.read(operation)) ambrix_fuzz::violation("the library would not understand a call");
  const long status = ambrix_fuzz::script().nextStatus();
  return call.refused() ? BAD_VAR_NUM : status;
}
