#include <fmt/format.h>

#include "tool/content/values.h"
#include "tool/info/info.h"

namespace ambrix::tool {
namespace {

template <typename T>
std::string numberText(T value) {
  return fmt::format("{}", value);
}

/// "GZIP 6 (37 %)", or "none".
std::string compressionText(const Compression& compression) {
  if (compression.type == "NO_COMPRESSION") return "none";
  std::string text = compression.type.substr(0, compression.type.find('_'));
  if (text == "GZIP") text += ' ' + compression.parameter;
  return text + fmt::format(" ({} %)", compression.percentage);
}

std::string sizesText(const Variable& variable) {
  std::string text;
  for (const std::size_t size : variable.sizes)
    text += fmt::format("{}{}", text.empty() ? "" : "x", size);
  return text.empty() ? "-" : text;
}

/// One letter for the records and one for each dimension: T where values vary, F where not.
std::string variancesText(const Variable& variable) {
  std::string text(variable.recordVaries ? "T" : "F");
  text += '/';
  for (const bool varies : variable.varies)
    text += varies ? 'T' : 'F';
  return text;
}

std::string sparseText(const std::string& mode) {
  return mode == "NO_SPARSERECORDS" ? "" : mode.substr(0, mode.find('_'));
}

std::string padText(const Info& info, const VariableDescription& facts) {
  const Variable& variable = facts.definition;
  if (!variable.supported) return "";
  return joinValues(
      formatValues(info.module, facts.padValue, variable.datatype, variable.elements));
}

std::string recordsText(const VariableDescription& facts) {
  if (facts.written == facts.records) return numberText(facts.records);
  return fmt::format("{} ({} stored)", facts.records, facts.written);
}

std::vector<std::string> variableRow(const Info& info, const VariableDescription& facts) {
  const Variable& variable = facts.definition;
  const bool known = variable.supported;
  const std::string datatype = datatypeName(variable.datatype);
  return {numberText(variable.number),
          printable(variable.name),
          known ? datatype : datatype + " (not supported)",
          known ? fmt::format("{}", variable.elements) : "?",
          known ? sizesText(variable) : "?",
          recordsText(facts),
          known ? variancesText(variable) : "?",
          compressionText(facts.compression),
          sparseText(facts.sparseRecords),
          padText(info, facts)};
}

std::string variableTable(const Info& info, const Style& style) {
  TextTable table({{"No.", true},
                   {"Name"},
                   {"Datatype"},
                   {"Elements", true},
                   {"Dimensions"},
                   {"Records", true},
                   {"Varies"},
                   {"Compression"},
                   {"Sparse"},
                   {"Pad value"}});
  for (const VariableDescription& variable : info.file.variables)
    table.addRow(variableRow(info, variable));
  return table.render(style);
}

std::string summary(const Info& info, const Style& style) {
  const FileFacts& facts = info.file.facts;
  std::string text;
  const auto line = [&](const char* label, const std::string& value) {
    text += style.bold(fmt::format("{:<12}", label)) + value + '\n';
  };
  line("File", printable(info.options.file));
  line("Version", facts.version);
  line("Format", facts.format);
  line("Encoding", facts.encoding);
  line("Majority", facts.majority);
  line("Compression", compressionText(facts.compression));
  line("Checksum", facts.checksum);
  line("Records", numberText(facts.records));
  line("Variables", numberText(info.file.variables.size()));
  line("Attributes",
       fmt::format("{} global, {} variable", facts.globalAttributes, facts.variableAttributes));
  return text;
}

std::string entryOwner(const Info& info, const Attribute& attribute, std::size_t number) {
  const auto& variables = info.file.variables;
  if (attribute.global || number >= variables.size()) return numberText(number);
  return printable(variables[number].definition.name);
}

std::string valueText(const Info& info, const EntryDescription& described) {
  if (!described.entry.supported) return "(not supported)";
  const ArrayView value = described.value;
  return joinValues(
      formatValues(info.module, value, described.entry.datatype, value.elementCount()));
}

std::string attributeTable(const Info& info, bool global, const Style& style) {
  TextTable table({{"Attribute"}, {global ? "Entry" : "Variable"}, {"Datatype"}, {"Value"}});
  for (const auto& [attribute, entries] : info.file.attributes) {
    if (attribute.global != global) continue;
    const std::string name = printable(attribute.name);
    if (entries.empty()) table.addRow({name, "", "", "(no entries)"});
    for (const EntryDescription& described : entries) {
      const Entry& entry = described.entry;
      table.addRow({name, entryOwner(info, attribute, entry.number), datatypeName(entry.datatype),
                    valueText(info, described)});
    }
  }
  return table.render(style);
}

}  // namespace

std::string infoAsTables(const Info& info, const Style& style) {
  const FileFacts& facts = info.file.facts;
  const bool attributes = info.options.attributes;
  std::string text = summary(info, style);
  if (!info.file.variables.empty()) text += '\n' + variableTable(info, style);
  if (attributes && facts.globalAttributes > 0) {
    text += "\n" + style.bold("Global attributes") + "\n" + attributeTable(info, true, style);
  }
  if (attributes && facts.variableAttributes > 0) {
    text += "\n" + style.bold("Variable attributes") + "\n" + attributeTable(info, false, style);
  }
  return text;
}

}  // namespace ambrix::tool
