#include "fuzz/calls/script.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <limits>
#include <vector>

#include "fuzz/calls/backend.h"
#include "fuzz/calls/call_log.h"
#include "fuzz/calls/values.h"

namespace ambrix_fuzz {
namespace {

constexpr long kOddNumbers[] = {-1,
                                0,
                                2,
                                3,
                                10,
                                11,
                                17,
                                33,
                                8,
                                100,
                                65536,
                                2147483647,
                                -2147483648,
                                2147483648,
                                4294967296,
                                4294967299,
                                1L << 40,
                                1L << 53,
                                1L << 62,
                                -(1L << 62),
                                std::numeric_limits<long>::max(),
                                std::numeric_limits<long>::min()};
constexpr long kStatuses[] = {-2013, -1007, -1001, -2002, -2055, -2077,
                              -2026, -1,    1001,  1003,  1009};

long oddNumber(Choices& choices) {
  return choices.pick(kOddNumbers);
}

}  // namespace

Script& script() {
  static Script only;
  return only;
}

void Script::begin(Choices& choices) {
  choices_ = &choices;
  describeSanely();
}

void Script::decide() {
  if (choices_->oneIn(4)) describeSanely();
  if (choices_->oneIn(8)) describeOddly();
  callsToFailure_ = choices_->oneIn(6) ? 1 + choices_->below(4) : 0;
  failure_ = callsToFailure_ > 0 ? choices_->pick(kStatuses) : 0;
}

void Script::describeSanely() {
  variable_ = Description();
  variable_.datatype = choices_->pick(kDatatypeCodes);
  variable_.elements = isText(variable_.datatype) ? 1 + static_cast<long>(choices_->below(9)) : 1;
  variable_.dimensions = static_cast<long>(choices_->below(4));
  variable_.majority = 1 + static_cast<long>(choices_->below(2));
  for (long& size : variable_.sizes)
    size = 1 + static_cast<long>(choices_->below(5));
  for (long& variance : variable_.variances)
    variance = choices_->oneIn(6) ? 0 : -1;
}

void Script::describeOddly() {
  long* const parts[] = {&variable_.datatype,       &variable_.elements,     &variable_.dimensions,
                         &variable_.sizes[0],       &variable_.sizes[1],     &variable_.sizes[9],
                         &variable_.recordVariance, &variable_.variances[0], &variable_.majority};
  *choices_->pick(parts) = oddNumber(*choices_);
}

Variable Script::hostVariable() const {
  Variable known{variable_.datatype, variable_.elements, {}};
  const auto count = static_cast<std::size_t>(std::clamp(variable_.dimensions, 0L, 10L));
  known.sizes.assign(variable_.sizes.begin(), variable_.sizes.begin() + static_cast<long>(count));
  if (variable_.majority == 1) std::ranges::reverse(known.sizes);
  return known;
}

long Script::nextStatus() {
  const bool fails = callsToFailure_ > 0 && --callsToFailure_ == 0;
  return fails ? failure_ : 0;
}

bool Script::stopsEarly() {
  return callsToFailure_ == 1 && failure_ < -2000;
}

long Script::number(const std::string& item) {
  bool known = false;
  const long described = describedNumber(item, known);
  if (known) return described;
  return choices_->oneIn(6) ? oddNumber(*choices_) : static_cast<long>(choices_->below(3));
}

long Script::describedNumber(const std::string& item, bool& known) const {
  struct Row {
    const char* item;
    long number;
  };
  const Row rows[] = {
      {"zVAR_DATATYPE_", variable_.datatype},  {"zVAR_NUMELEMS_", variable_.elements},
      {"zVAR_NUMDIMS_", variable_.dimensions}, {"zVAR_RECVARY_", variable_.recordVariance},
      {"CDF_MAJORITY_", variable_.majority},
  };
  const auto* found =
      std::ranges::find_if(rows, [&item](const Row& row) { return item == row.item; });
  known = found != std::end(rows);
  return known ? found->number : 0;
}

std::string Script::text(std::size_t most) {
  std::string text(choices_->oneIn(8) ? most : choices_->below(20), 'n');
  if (!text.empty()) text[0] = static_cast<char>(choices_->byte() | 1);
  return text;
}

long Script::handle() {
  return 0x1000 + 8 * static_cast<long>(choices_->below(12));
}

double Script::epoch() {
  return choices_->oneIn(6) ? -1.0 : static_cast<double>(choices_->byte());
}

std::size_t bytesOf(const Description& variable, long values) {
  const auto bytes = ambrix_test::bytesOf(variable, values);
  if (!bytes) violation("the library would be asked for more than it can count");
  return *bytes;
}

void readAll(const void* memory, std::size_t bytes) {
  static std::vector<char> sink(1 << 16);
  const auto* place = static_cast<const char*>(memory);
  if (place == nullptr && bytes > 0) violation("the library would read from a null pointer");
  for (std::size_t done = 0; done < bytes; done += sink.size())
    std::memcpy(sink.data(), place + done, std::min(sink.size(), bytes - done));
}

void writeAll(void* memory, std::size_t bytes) {
  if (bytes == 0) return;
  if (memory == nullptr) violation("the library would write to a null pointer");
  std::memset(memory, 0xA5, bytes);
}

void requireFitting(long number) {
  const bool fits = number >= std::numeric_limits<std::int32_t>::min() &&
                    number <= std::numeric_limits<std::int32_t>::max();
  if (!fits) violation("the library would cut the number " + std::to_string(number));
}

// --- What stands behind the module in this program.

void beginSequence(Choices& choices) {
  script().begin(choices);
}
void endSequence() {
  script().end();
}
void beforeCall(Choices&) {
  script().decide();
}
std::optional<Variable> scriptedVariable() {
  return script().hostVariable();
}
void confine(const char*, std::vector<ambrix::Array>&) {}

}  // namespace ambrix_fuzz
