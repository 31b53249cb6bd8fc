// Attributes and their entries.
#include "tool/content/attributes.h"

#include <algorithm>
#include <cstdint>
#include <utility>

#include "tool/content/values.h"
#include "tool/convert/convert.h"

namespace ambrix::tool {
namespace {

/// Numbers of variables move down by the number of those before them that are left out.
double targetEntry(const Conversion& conversion, const Attribute& attribute, double entry) {
  if (attribute.global) return entry;
  for (const Copied& variable : conversion.variables)
    if (variable.source.number == entry) return variable.target.number;
  const double all = countVariables(conversion.input);
  return entry - (all - static_cast<double>(conversion.variables.size()));
}

bool isLeftOut(const Conversion& conversion, const Attribute& attribute, double entry) {
  if (attribute.global || entry >= countVariables(conversion.input)) return false;
  return std::ranges::none_of(conversion.variables, [&](const Copied& variable) {
    return variable.source.number == entry;
  });
}

/// The value with as many elements as the entry has: the module ends texts at a zero byte.
Array completeText(Array value, std::size_t elements) {
  if (value.classId() != ClassId::kChar || value.elementCount() >= elements) return value;
  std::u16string units = value.text();
  units.resize(elements);
  return Array::text(units);
}

/// Whether anything but zeros was behind the end of a text that came back short.
bool hasLostText(const Conversion& conversion, double attribute, double entry) {
  if (!conversion.hiddenTexts) return true;  // it may have
  return conversion.hiddenTexts->contains(
      {static_cast<std::uint64_t>(attribute), static_cast<std::uint64_t>(entry)});
}

void copyEntry(Conversion& conversion, const Attribute& attribute, const EntryHeader& entry) {
  const auto elements = static_cast<std::size_t>(entry.elements);
  Array given = readEntry(conversion.input, attribute, entry.number);
  const std::size_t length = given.elementCount();
  const Array value = completeText(std::move(given), elements);
  const bool isShort = value.elementCount() > length;
  if (isShort && hasLostText(conversion, attribute.number, entry.number)) ++conversion.cutTexts;
  const Array number = Array::scalar(attribute.number);
  const Array target = Array::scalar(targetEntry(conversion, attribute, entry.number));
  const Array datatype = Array::scalar(datatypeCode(conversion.module, entry.datatype));
  const ArrayView arguments[] = {number, target, datatype, value};
  conversion.output.call("putAttrEntry", arguments);
}

}  // namespace

void copyAttributes(Conversion& conversion) {
  const double scopes[] = {constantValue(conversion.module, "VARIABLE_SCOPE"),
                           constantValue(conversion.module, "GLOBAL_SCOPE")};
  const double count = countAttributes(conversion.input);
  for (double number = 0; number < count; ++number) {
    const Attribute attribute = inquireAttribute(conversion.input, number);
    const Array name = Array::fromNarrow(attribute.name);
    const Array scope = Array::scalar(scopes[attribute.global ? 1 : 0]);
    const ArrayView arguments[] = {name, scope};
    conversion.output.call("createAttr", arguments);
    forEachEntry(conversion.input, attribute, [&](const EntryHeader& entry) {
      if (!entry.supported || isLeftOut(conversion, attribute, entry.number)) return;
      copyEntry(conversion, attribute, entry);
    });
  }
}

}  // namespace ambrix::tool
