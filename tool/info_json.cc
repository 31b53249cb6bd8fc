#include <nlohmann/json.hpp>

#include "tool/info.h"

namespace ambrix::tool {
namespace {

using Json = nlohmann::ordered_json;

Json countAsJson(double value) {
  return static_cast<std::int64_t>(value);
}

/// Numbers as they are written elsewhere, which keeps every digit.
Json valueAsJson(const ValueText& value) {
  return value.isText ? Json(toUtf8(value.text)) : Json::parse(value.text);
}

Json valuesAsJson(const std::vector<ValueText>& values) {
  Json list = Json::array();
  for (const ValueText& value : values)
    list.push_back(valueAsJson(value));
  return list;
}

Json compressionAsJson(const Compression& compression) {
  Json object = {{"type", compression.type}};
  if (!compression.parameter.empty()) object["parameter"] = compression.parameter;
  object["percentage"] = countAsJson(compression.percentage);
  return object;
}

Json variableAsJson(const VariableFacts& facts) {
  const Variable& variable = facts.definition;
  Json object = {{"number", countAsJson(variable.number)},
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

Json entryAsJson(const EntryFacts& entry) {
  Json object = {{"number", countAsJson(entry.number)},
                 {"datatype", entry.datatype},
                 {"supported", entry.supported}};
  if (entry.supported) object["values"] = valuesAsJson(entry.values);
  return object;
}

Json attributeAsJson(const AttributeFacts& attribute) {
  Json entries = Json::array();
  for (const EntryFacts& entry : attribute.entries)
    entries.push_back(entryAsJson(entry));
  return {{"name", toUtf8(attribute.name)},
          {"scope", attribute.global ? "GLOBAL_SCOPE" : "VARIABLE_SCOPE"},
          {"entries", entries}};
}

}  // namespace

std::string factsAsJson(const FileFacts& facts, const InfoOptions& options) {
  Json object = {{"file", toUtf8(options.file)},
                 {"version", facts.version},
                 {"format", facts.format},
                 {"encoding", facts.encoding},
                 {"majority", facts.majority},
                 {"compression", compressionAsJson(facts.compression)},
                 {"checksum", facts.checksum},
                 {"records", countAsJson(facts.records)},
                 {"globalAttributes", countAsJson(facts.globalAttributes)},
                 {"variableAttributes", countAsJson(facts.variableAttributes)},
                 {"variables", Json::array()}};
  for (const VariableFacts& variable : facts.variables)
    object["variables"].push_back(variableAsJson(variable));
  if (options.attributes) object["attributes"] = Json::array();
  for (const AttributeFacts& attribute : facts.attributes)
    object["attributes"].push_back(attributeAsJson(attribute));
  return object.dump(2) + '\n';
}

}  // namespace ambrix::tool
