#include "tool/attributes.h"

#include <fmt/format.h>

#include <exception>
#include <optional>
#include <utility>

#include "ambrix/error.h"
#include "tool/facts.h"
#include "tool/steps.h"
#include "tool/text.h"
#include "tool/variable.h"

namespace ambrix::tool {

double countAttributes(CdfFile& file) {
  return file.number("getNumgAttributes") + file.number("getNumvAttributes");
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
  for (double entry = 0; remaining > 0 && entry <= attribute.maxEntry; ++entry) {
    std::optional<EntryHeader> header;
    try {
      header = inquireEntry(file, attribute, entry);
    } catch (const Error&) {
      failure = std::current_exception();  // no entry of that number, as a rule
    }
    if (!header) continue;
    function(*header);
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
