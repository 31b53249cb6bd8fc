#include "tool/content/attributes.h"

#include <fmt/format.h>

#include <exception>
#include <optional>
#include <utility>

#include "ambrix/error.h"
#include "tool/content/entry_numbers.h"
#include "tool/content/facts.h"
#include "tool/content/variable.h"
#include "tool/output/text.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

/// How many numbers without an entry are tried one by one, which takes some 10 us each.
constexpr std::size_t kMissesAllowed = 10000;

/// The entry of that number; if there is none, why.
std::optional<EntryHeader> findEntry(CdfFile& file, const Attribute& attribute, double number,
                                     std::exception_ptr& failure) try {
  return inquireEntry(file, attribute, number);
} catch (const Error&) {
  failure = std::current_exception();
  return std::nullopt;
}

/// How many numbers the library may list in its tables.
constexpr double kNumbersListed = 1 << 20;

}  // namespace

double countAttributes(CdfFile& file) {
  return file.number("getNumgAttributes") + file.number("getNumvAttributes");
}

void setReadOnly(CdfFile& file) {
  const double attributes = countAttributes(file);
  double numbers = 0;
  for (double number = 0; number < attributes && numbers <= kNumbersListed; ++number)
    numbers += inquireAttribute(file, number).maxEntry + 1;
  if (numbers > kNumbersListed) return;
  file.call("setReadOnlyMode", {constantValue(file.module(), "READONLYON")});
}

Attribute inquireAttribute(CdfFile& file, double number) {
  beginStep(fmt::format("reading attribute {}", number));
  const std::vector<Array> facts = file.call("inquireAttr", {number});
  Attribute attribute;
  attribute.number = number;
  attribute.name = bytesOf(facts.at(0));
  attribute.global = bytesOf(facts.at(1)) == "GLOBAL_SCOPE";
  attribute.maxEntry = facts.at(attribute.global ? 2 : 3).data<double>().front();
  beginStep("reading attribute \"" + printable(attribute.name) + '"');
  return attribute;
}

EntryHeader inquireEntry(CdfFile& file, const Attribute& attribute, double entry) try {
  const char* const command = attribute.global ? "inquireAttrgEntry" : "inquireAttrEntry";
  const std::vector<Array> facts = file.call(command, {attribute.number, entry});
  return {entry, bytesOf(facts.at(0)), true, facts.at(1).data<double>().front()};
} catch (const Error& error) {
  const auto code = unsupportedDatatype(error);
  if (!code) throw;
  return {entry, unsupportedName(*code), false, 0};
}

Array readEntry(CdfFile& file, const Attribute& attribute, double entry) {
  const char* const command = attribute.global ? "getAttrgEntry" : "getAttrEntry";
  return std::move(file.call(command, {attribute.number, entry}).at(0));
}

void forEachEntry(CdfFile& file, const Attribute& attribute,
                  const std::function<void(const EntryHeader&)>& function) {
  const char* const command = attribute.global ? "getNumAttrgEntries" : "getNumAttrEntries";
  double remaining = file.number(command, {attribute.number});
  std::exception_ptr failure;
  double number = 0;
  for (std::size_t misses = 0; misses < kMissesAllowed; ++number) {
    if (remaining <= 0 || number > attribute.maxEntry) break;
    const auto header = findEntry(file, attribute, number, failure);
    if (!header) ++misses;
    if (!header) continue;
    function(*header);
    --remaining;
  }
  for (const double entry : entryNumbersFrom(file, attribute, number, remaining)) {
    function(inquireEntry(file, attribute, entry));
    --remaining;
  }
  if (remaining > 0 && failure) std::rethrow_exception(failure);
}

AttributeFacts readAttributeFacts(Module& module, CdfFile& file, double number) {
  const Attribute attribute = inquireAttribute(file, number);
  AttributeFacts facts{attribute.name, attribute.global, {}};
  forEachEntry(file, attribute, [&](const EntryHeader& header) {
    EntryFacts entry{header.number, header.datatype, header.supported, header.elements, {}};
    if (header.supported) {
      const Array value = readEntry(file, attribute, header.number);
      entry.values = formatValues(module, value, header.datatype, value.elementCount());
    }
    facts.entries.push_back(std::move(entry));
  });
  return facts;
}

}  // namespace ambrix::tool
