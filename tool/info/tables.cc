#include <fmt/format.h>

#include "tool/info/info.h"

namespace ambrix::tool {
namespace {

std::string numberText(double value) {
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

std::string padText(const VariableFacts& facts) {
  return facts.definition.supported ? joinValues(facts.padValue) : "";
}

std::string recordsText(const VariableFacts& facts) {
  if (facts.written == facts.records) return numberText(facts.records);
  return fmt::format("{} ({} stored)", facts.records, facts.written);
}

std::vector<std::string> variableRow(const VariableFacts& facts) {
  const Variable& variable = facts.definition;
  const bool known = variable.supported;
  return {numberText(variable.number),
          printable(variable.name),
          known ? variable.datatype : variable.datatype + " (not supported)",
          known ? fmt::format("{}", variable.elements) : "?",
          known ? sizesText(variable) : "?",
          recordsText(facts),
          known ? variancesText(variable) : "?",
          compressionText(facts.compression),
          sparseText(facts.sparseRecords),
          padText(facts)};
}

std::string variableTable(const FileFacts& facts, const Style& style) {
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
  for (const VariableFacts& variable : facts.variables)
    table.addRow(variableRow(variable));
  return table.render(style);
}

std::string summary(const FileFacts& facts, const InfoOptions& options, const Style& style) {
  std::string text;
  const auto line = [&](const char* label, const std::string& value) {
    text += style.bold(fmt::format("{:<12}", label)) + value + '\n';
  };
  line("File", printable(options.file));
  line("Version", facts.version);
  line("Format", facts.format);
  line("Encoding", facts.encoding);
  line("Majority", facts.majority);
  line("Compression", compressionText(facts.compression));
  line("Checksum", facts.checksum);
  line("Records", numberText(facts.records));
  line("Variables", fmt::format("{}", facts.variables.size()));
  line("Attributes",
       fmt::format("{} global, {} variable", facts.globalAttributes, facts.variableAttributes));
  return text;
}

std::string entryOwner(const FileFacts& facts, const AttributeFacts& attribute, double number) {
  const auto index = static_cast<std::size_t>(number);
  if (attribute.global || index >= facts.variables.size()) return numberText(number);
  return printable(facts.variables[index].definition.name);
}

std::string attributeTable(const FileFacts& facts, bool global, const Style& style) {
  TextTable table({{"Attribute"}, {global ? "Entry" : "Variable"}, {"Datatype"}, {"Value"}});
  for (const AttributeFacts& attribute : facts.attributes) {
    if (attribute.global != global) continue;
    const std::string name = printable(attribute.name);
    if (attribute.entries.empty()) table.addRow({name, "", "", "(no entries)"});
    for (const EntryFacts& entry : attribute.entries) {
      const std::string value = entry.supported ? joinValues(entry.values) : "(not supported)";
      table.addRow({name, entryOwner(facts, attribute, entry.number), entry.datatype, value});
    }
  }
  return table.render(style);
}

}  // namespace

std::string factsAsTables(const FileFacts& facts, const InfoOptions& options, const Style& style) {
  std::string text = summary(facts, options, style);
  if (!facts.variables.empty()) text += '\n' + variableTable(facts, style);
  if (options.attributes && facts.globalAttributes > 0) {
    text += "\n" + style.bold("Global attributes") + "\n" + attributeTable(facts, true, style);
  }
  if (options.attributes && facts.variableAttributes > 0) {
    text += "\n" + style.bold("Variable attributes") + "\n" + attributeTable(facts, false, style);
  }
  return text;
}

}  // namespace ambrix::tool
