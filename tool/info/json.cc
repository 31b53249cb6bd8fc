#include <nlohmann/json.hpp>

#include "tool/info/info.h"

namespace ambrix::tool {
namespace {

using OrderedJson = nlohmann::ordered_json;

OrderedJson countAsJson(double value) {
  return static_cast<std::int64_t>(value);
}

/// Numbers as they are written elsewhere, which keeps every digit.
OrderedJson valueAsJson(const ValueText& value) {
  return value.isText ? OrderedJson(toUtf8(value.text)) : OrderedJson::parse(value.text);
}

OrderedJson valuesAsJson(const std::vector<ValueText>& values) {
  OrderedJson list = OrderedJson::array();
  for (const ValueText& value : values)
    list.push_back(valueAsJson(value));
  return list;
}

OrderedJson compressionAsJson(const Compression& compression) {
  OrderedJson object = {{"type", compression.type}};
  if (!compression.parameter.empty()) object["parameter"] = compression.parameter;
  object["percentage"] = countAsJson(compression.percentage);
  return object;
}

OrderedJson variableAsJson(const VariableFacts& facts) {
  const Variable& variable = facts.definition;
  OrderedJson object = {{"number", countAsJson(variable.number)},
                        {"name", toUtf8(variable.name)},
                        {"datatype", variable.datatype},
                        {"supported", variable.supported}};
  if (variable.supported) {
    object["elements"] = variable.elements;
    object["dimensions"] = variable.sizes;
    object["recordVariance"] = variable.recordVaries;
    object["dimensionVariances"] = variable.varies;
    object["padValue"] = valuesAsJson(facts.padValue);
  }
  object["records"] = countAsJson(facts.records);
  object["recordsStored"] = countAsJson(facts.written);
  object["compression"] = compressionAsJson(facts.compression);
  object["sparseRecords"] = facts.sparseRecords;
  return object;
}

OrderedJson entryAsJson(const EntryFacts& entry) {
  OrderedJson object = {{"number", countAsJson(entry.number)},
                        {"datatype", entry.datatype},
                        {"supported", entry.supported}};
  if (entry.supported) object["values"] = valuesAsJson(entry.values);
  return object;
}

OrderedJson attributeAsJson(const AttributeFacts& attribute) {
  OrderedJson entries = OrderedJson::array();
  for (const EntryFacts& entry : attribute.entries)
    entries.push_back(entryAsJson(entry));
  return {{"name", toUtf8(attribute.name)},
          {"scope", attribute.global ? "GLOBAL_SCOPE" : "VARIABLE_SCOPE"},
          {"entries", entries}};
}

}  // namespace

std::string factsAsJson(const FileFacts& facts, const InfoOptions& options) {
  OrderedJson object = {{"file", toUtf8(options.file)},
                        {"version", facts.version},
                        {"format", facts.format},
                        {"encoding", facts.encoding},
                        {"majority", facts.majority},
                        {"compression", compressionAsJson(facts.compression)},
                        {"checksum", facts.checksum},
                        {"records", countAsJson(facts.records)},
                        {"globalAttributes", countAsJson(facts.globalAttributes)},
                        {"variableAttributes", countAsJson(facts.variableAttributes)},
                        {"variables", OrderedJson::array()}};
  for (const VariableFacts& variable : facts.variables)
    object["variables"].push_back(variableAsJson(variable));
  if (options.attributes) object["attributes"] = OrderedJson::array();
  for (const AttributeFacts& attribute : facts.attributes)
    object["attributes"].push_back(attributeAsJson(attribute));
  return object.dump(2, ' ', true) + '\n';  // in ASCII, lest a terminal obey it
}

}  // namespace ambrix::tool
