#include <nlohmann/json.hpp>

#include "tool/content/values.h"
#include "tool/info/info.h"

namespace ambrix::tool {
namespace {

using OrderedJson = nlohmann::ordered_json;

/// Numbers as they are written elsewhere, which keeps every digit.
OrderedJson valueAsJson(const ValueText& value) {
  return value.isText ? OrderedJson(toUtf8(value.text)) : OrderedJson::parse(value.text);
}

OrderedJson valuesAsJson(const Info& info, ArrayView array, Datatype datatype,
                         std::size_t elements) {
  OrderedJson list = OrderedJson::array();
  for (const ValueText& value : formatValues(info.module, array, datatype, elements))
    list.push_back(valueAsJson(value));
  return list;
}

OrderedJson compressionAsJson(const Compression& compression) {
  OrderedJson object = {{"type", compression.type}};
  if (!compression.parameter.empty()) object["parameter"] = compression.parameter;
  object["percentage"] = static_cast<std::int64_t>(compression.percentage);
  return object;
}

OrderedJson variableAsJson(const Info& info, const VariableDescription& facts) {
  const Variable& variable = facts.definition;
  OrderedJson object = {{"number", variable.number},
                        {"name", toUtf8(variable.name)},
                        {"datatype", datatypeName(variable.datatype)},
                        {"supported", variable.supported}};
  if (variable.supported) {
    object["elements"] = variable.elements;
    object["dimensions"] = variable.sizes;
    object["recordVariance"] = variable.recordVaries;
    object["dimensionVariances"] = variable.varies;
    object["padValue"] = valuesAsJson(info, facts.padValue, variable.datatype, variable.elements);
  }
  object["records"] = facts.records;
  object["recordsStored"] = facts.written;
  object["compression"] = compressionAsJson(facts.compression);
  object["sparseRecords"] = facts.sparseRecords;
  return object;
}

OrderedJson entryAsJson(const Info& info, const EntryDescription& described) {
  const Entry& entry = described.entry;
  const ArrayView value = described.value;
  OrderedJson object = {{"number", entry.number},
                        {"datatype", datatypeName(entry.datatype)},
                        {"supported", entry.supported}};
  if (!entry.supported) return object;
  object["values"] = valuesAsJson(info, value, entry.datatype, value.elementCount());
  return object;
}

OrderedJson attributeAsJson(const Info& info, const AttributeDescription& attribute) {
  OrderedJson entries = OrderedJson::array();
  for (const EntryDescription& entry : attribute.entries)
    entries.push_back(entryAsJson(info, entry));
  return {{"name", toUtf8(attribute.attribute.name)},
          {"scope", attribute.attribute.global ? "GLOBAL_SCOPE" : "VARIABLE_SCOPE"},
          {"entries", entries}};
}

}  // namespace

std::string infoAsJson(const Info& info) {
  const FileFacts& facts = info.file.facts;
  OrderedJson object = {{"file", toUtf8(info.options.file)},
                        {"version", facts.version},
                        {"format", facts.format},
                        {"encoding", facts.encoding},
                        {"majority", facts.majority},
                        {"compression", compressionAsJson(facts.compression)},
                        {"checksum", facts.checksum},
                        {"records", facts.records},
                        {"globalAttributes", facts.globalAttributes},
                        {"variableAttributes", facts.variableAttributes},
                        {"variables", OrderedJson::array()}};
  for (const VariableDescription& variable : info.file.variables)
    object["variables"].push_back(variableAsJson(info, variable));
  if (info.options.attributes) object["attributes"] = OrderedJson::array();
  for (const AttributeDescription& attribute : info.file.attributes)
    object["attributes"].push_back(attributeAsJson(info, attribute));
  return object.dump(2, ' ', true) + '\n';  // in ASCII, lest a terminal obey it
}

}  // namespace ambrix::tool
