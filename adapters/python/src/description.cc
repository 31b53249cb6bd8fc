#include "src/description.h"

#include <string>
#include <utility>

#include "src/messages.h"
#include "src/results.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

nb::tuple compressionOf(const Compression& compression) {
  return nb::make_tuple(textOf(compression.type), textOf(compression.parameter),
                        compression.percentage);
}

nb::object valueOf(Array&& value, ResultKind kind) {
  return value ? convertResult(kind, std::move(value)) : nb::none();
}

template <typename T>
nb::tuple tupleOf(const std::vector<T>& values) {
  nb::list items;
  for (const T value : values)
    items.append(value);
  return nb::tuple(items);
}

nb::object variableOf(VariableDescription&& variable) {
  const Variable& definition = variable.definition;
  nb::dict facts;
  facts["number"] = definition.number;
  facts["name"] = textOf(definition.name);
  facts["datatype"] = static_cast<int>(definition.datatype);
  facts["elements"] = definition.elements;
  facts["sizes"] = tupleOf(definition.sizes);
  facts["record_varies"] = definition.recordVaries;
  facts["varies"] = tupleOf(definition.varies);
  facts["records"] = variable.records;
  facts["written"] = variable.written;
  facts["compression"] = compressionOf(variable.compression);
  facts["sparse_records"] = textOf(variable.sparseRecords);
  facts["pad_value"] = valueOf(std::move(variable.padValue), ResultKind::kValue);
  return facts;
}

nb::object attributeOf(AttributeDescription&& attribute) {
  nb::list entries;
  for (EntryDescription& entry : attribute.entries) {
    entries.append(nb::make_tuple(entry.entry.number, static_cast<int>(entry.entry.datatype),
                                  valueOf(std::move(entry.value), ResultKind::kRow)));
  }
  return nb::make_tuple(textOf(attribute.attribute.name), attribute.attribute.global, entries);
}

nb::dict factsOf(const FileFacts& file) {
  nb::dict facts;
  facts["version"] = textOf(file.version);
  facts["format"] = textOf(file.format);
  facts["encoding"] = textOf(file.encoding);
  facts["majority"] = textOf(file.majority);
  facts["checksum"] = textOf(file.checksum);
  facts["compression"] = compressionOf(file.compression);
  return facts;
}

}  // namespace

nb::object describedInPython(FileDescription&& description) {
  nb::list variables;
  for (VariableDescription& variable : description.variables)
    variables.append(variableOf(std::move(variable)));
  nb::list attributes;
  for (AttributeDescription& attribute : description.attributes)
    attributes.append(attributeOf(std::move(attribute)));
  return nb::make_tuple(factsOf(description.facts), variables, attributes);
}

}  // namespace ambrix::python
