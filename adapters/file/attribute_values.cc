// Attributes by name.
#include "adapters/file/entry_reader.h"
#include "adapters/file/numbers.h"
#include "ambrix/file.h"

namespace ambrix {

std::optional<Array> File::attributeValue(const Variable& variable, std::string_view name) {
  const auto number = findAttribute(name);
  if (!number) return std::nullopt;
  const Attribute found = attribute(*number);
  if (found.global) return std::nullopt;
  std::exception_ptr failure;
  const auto entry = EntryReader(*this, found, options_.observer).find(variable.number, failure);
  if (!entry) return std::nullopt;
  return value(found, entry->number);
}

/// The attribute of that name, made where there is none.
Attribute File::attributeFor(std::string_view name, bool global) {
  const auto number = findAttribute(name);
  if (!number) return createAttribute(name, global);
  const Attribute found = attribute(*number);
  if (found.global == global) return found;
  throw FileError(path_, "wrongScope",
                  "attribute \"" + std::string(name) + "\" is " +
                      (global ? "one of variables; name the variable" : "a global one") +
                      ", or choose another name");
}

void File::setAttribute(const Variable& variable, std::string_view name, Datatype datatype,
                        ArrayView value) {
  putEntry(attributeFor(name, false), variable.number, datatype, value);
}

void File::setAttribute(std::string_view name, Datatype datatype, ArrayView value,
                        std::size_t entry) {
  putEntry(attributeFor(name, true), entry, datatype, value);
}

void File::setAttribute(const Variable& variable, std::string_view name, std::string_view text) {
  setAttribute(variable, name, Datatype::kChar, Array::fromNarrow(text));
}

void File::setAttribute(std::string_view name, std::string_view text, std::size_t entry) {
  setAttribute(name, Datatype::kChar, Array::fromNarrow(text), entry);
}

}  // namespace ambrix
