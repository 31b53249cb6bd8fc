// Attributes and their entries.
#include <algorithm>
#include <exception>
#include <utility>

#include "adapters/file/entry_finder.h"
#include "adapters/file/entry_reader.h"
#include "adapters/file/far_entries.h"
#include "adapters/file/names.h"
#include "adapters/file/numbers.h"
#include "ambrix/file.h"
#include "ambrix/texts.h"

namespace ambrix {
namespace {

/// How many numbers without an entry are tried one by one: each is an error, which takes longer
/// than an entry.
constexpr std::size_t kMissesAllowed = 10000;

}  // namespace

std::size_t File::attributeCount() {
  return sizeOf(number("getNumgAttributes")) + sizeOf(number("getNumvAttributes"));
}

Attribute File::attribute(std::size_t number) {
  announce(Step::Kind::kAttribute, number);
  const std::vector<Array> facts = call("inquireAttr", {static_cast<double>(number)});
  Attribute attribute;
  attribute.number = number;
  attribute.name = bytesOf(facts.at(0));
  attribute.global = bytesOf(facts.at(1)) == "GLOBAL_SCOPE";
  const Array& maxEntry = facts.at(attribute.global ? 2 : 3);
  // A damaged file may have any negative number where -1 means that there is none.
  attribute.maxEntry =
      std::max<std::int64_t>(static_cast<std::int64_t>(maxEntry.data<double>().front()), -1);
  announce(Step::Kind::kAttribute, number, attribute.name);
  return attribute;
}

std::optional<std::size_t> File::findAttribute(std::string_view name) {
  constexpr std::string_view kMissing[] = {"NO_SUCH_ATTR", "BAD_ATTR_NAME"};
  return find("getAttrNum", name, kMissing);
}

Attribute File::attribute(std::string_view name) {
  if (const auto number = findAttribute(name)) return attribute(*number);
  const auto nameOf = [this](std::size_t number) {
    return text("getAttrName", {static_cast<double>(number)});
  };
  throw FileError(path(), "noSuchAttribute",
                  missing("attribute", name, namesOf(attributeCount(), nameOf)));
}

std::vector<Attribute> File::attributes() {
  std::vector<Attribute> all;
  const std::size_t count = attributeCount();
  for (std::size_t number = 0; number < count; ++number)
    all.push_back(attribute(number));
  return all;
}

Attribute File::createAttribute(std::string_view name, bool global) {
  const Array text = Array::fromNarrow(name);
  const Array scope =
      Array::scalar(constantValue(*module_, global ? "GLOBAL_SCOPE" : "VARIABLE_SCOPE"));
  const ArrayView arguments[] = {text, scope};
  const double number = change("createAttr", arguments).at(0).data<double>().front();
  return {sizeOf(number), std::string(name), global, -1};
}

void File::renameAttribute(const Attribute& attribute, std::string_view name) {
  const Array number = Array::scalar(numberOf(attribute));
  const Array text = Array::fromNarrow(name);
  const ArrayView arguments[] = {number, text};
  change("renameAttr", arguments);
}

void File::deleteAttribute(const Attribute& attribute) {
  change("deleteAttr", {numberOf(attribute)});
}

Entry File::entry(const Attribute& attribute, std::size_t number) {
  requireOpen();
  return EntryReader(*this, attribute, options_.observer).inquire(number);
}

std::vector<Entry> File::entries(const Attribute& attribute) {
  std::vector<Entry> all;
  forEachEntry(attribute, [&](const Entry& entry) { all.push_back(entry); });
  return all;
}

/// Numbers are tried from 0 on until all entries are found. Where too many are missing, the rest
/// are found otherwise.
void File::forEachEntry(const Attribute& attribute,
                        const std::function<void(const Entry&)>& function) {
  EntryReader reader(*this, attribute, options_.observer);
  std::size_t remaining = reader.count();
  std::exception_ptr failure;
  std::size_t number = 0;
  for (std::size_t misses = 0; misses < kMissesAllowed; ++number) {
    if (remaining == 0 || static_cast<std::int64_t>(number) > attribute.maxEntry) break;
    const auto entry = reader.find(number, failure);
    if (!entry) ++misses;
    if (!entry) continue;
    function(*entry);
    --remaining;
  }
  const ScratchPlace scratch{place_, options_};
  for (const std::size_t far : farEntries(*this, attribute, number, remaining, scratch)) {
    function(reader.inquire(far));
    --remaining;
  }
  if (remaining > 0 && failure) reader.rethrow(failure);
}

Array File::value(const Attribute& attribute, std::size_t entry) {
  requireOpen();
  return EntryReader(*this, attribute, options_.observer).value(entry);
}

void File::putEntry(const Attribute& attribute, std::size_t entry, Datatype datatype,
                    ArrayView value) {
  const Array number = Array::scalar(numberOf(attribute));
  const Array entryNumber = Array::scalar(static_cast<double>(entry));
  const Array code = Array::scalar(static_cast<double>(datatype));
  const ArrayView arguments[] = {number, entryNumber, code, value};
  change("putAttrEntry", arguments);
}

void File::deleteEntry(const Attribute& attribute, std::size_t entry) {
  change(attribute.global ? "deleteAttrgEntry" : "deleteAttrEntry",
         {numberOf(attribute), static_cast<double>(entry)});
}

AttributeDescription File::describeAttribute(std::size_t number) {
  EntryFinder finder(*this, options_.observer);
  return describeAttribute(number, finder);
}

AttributeDescription File::describeAttribute(std::size_t number, EntryFinder& finder) {
  AttributeDescription description{attribute(number), {}};
  EntryReader reader(*this, description.attribute, options_.observer);
  for (const Entry& entry : finder.find(description.attribute)) {
    Array value = entry.supported ? reader.value(entry.number) : Array();
    description.entries.push_back({entry, std::move(value)});
  }
  return description;
}

FileDescription File::describe() {
  FileDescription description;
  description.facts = facts();
  const std::size_t variables = variableCount();
  for (std::size_t number = 0; number < variables; ++number)
    description.variables.push_back(describeVariable(number));
  const std::size_t attributes = attributeCount();
  EntryFinder finder(*this, options_.observer);
  for (std::size_t number = 0; number < attributes; ++number)
    description.attributes.push_back(describeAttribute(number, finder));
  return description;
}

}  // namespace ambrix
