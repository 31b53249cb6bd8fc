// Attributes by name.
#include <exception>

#include "adapters/file/entry_reader.h"
#include "ambrix/file.h"

namespace ambrix {
namespace {

bool isMissingEntry(const std::exception_ptr& failure) {
  try {
    std::rethrow_exception(failure);
  } catch (const Error& error) {
    return isLibraryFailure(error, "NO_SUCH_ENTRY");
  }
}

}  // namespace

std::optional<Array> File::attributeValue(const Variable& variable, std::string_view name) {
  const auto number = findAttribute(name);
  if (!number) return std::nullopt;
  const Attribute found = attribute(*number);
  if (found.global) return std::nullopt;
  std::exception_ptr failure;
  EntryReader reader(*this, found, options_.observer);
  if (reader.find(variable.number, failure)) return reader.value(variable.number);
  if (!isMissingEntry(failure)) reader.rethrow(failure);
  return std::nullopt;
}

/// The attribute of that name, made where there is none.
Attribute File::attributeFor(std::string_view name, bool global) {
  const auto number = findAttribute(name);
  if (!number) return createAttribute(name, global);
  const Attribute found = attribute(*number);
  if (found.global == global) return found;
  throw FileError(path(), "wrongScope",
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
