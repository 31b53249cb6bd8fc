// Attributes and their entries.
#include <algorithm>
#include <utility>

#include "tool/convert/convert.h"

namespace ambrix::tool {
namespace {

/// Numbers of variables move down by the number of those before them that are left out.
std::size_t targetEntry(const Conversion& conversion, const Attribute& attribute,
                        std::size_t entry) {
  if (attribute.global) return entry;
  for (const Copied& variable : conversion.variables)
    if (variable.source.number == entry) return variable.target.number;
  return entry - (conversion.input.variableCount() - conversion.variables.size());
}

bool isLeftOut(const Conversion& conversion, const Attribute& attribute, std::size_t entry) {
  if (attribute.global || entry >= conversion.input.variableCount()) return false;
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
bool hasLostText(const Conversion& conversion, std::size_t attribute, std::size_t entry) {
  if (!conversion.hiddenTexts) return true;  // it may have
  return conversion.hiddenTexts->contains({attribute, entry});
}

void copyEntry(Conversion& conversion, const Attribute& attribute, const Attribute& target,
               const Entry& entry) {
  Array given = conversion.input.value(attribute, entry.number);
  const std::size_t length = given.elementCount();
  const Array value = completeText(std::move(given), entry.elements);
  const bool isShort = value.elementCount() > length;
  if (isShort && hasLostText(conversion, attribute.number, entry.number)) ++conversion.cutTexts;
  const std::size_t number = targetEntry(conversion, attribute, entry.number);
  conversion.output.putEntry(target, number, entry.datatype, value);
}

}  // namespace

void copyAttributes(Conversion& conversion) {
  const std::size_t count = conversion.input.attributeCount();
  for (std::size_t number = 0; number < count; ++number) {
    const Attribute attribute = conversion.input.attribute(number);
    const Attribute target = conversion.output.createAttribute(attribute.name, attribute.global);
    conversion.input.forEachEntry(attribute, [&](const Entry& entry) {
      if (!entry.supported || isLeftOut(conversion, attribute, entry.number)) return;
      copyEntry(conversion, attribute, target, entry);
    });
  }
}

}  // namespace ambrix::tool
