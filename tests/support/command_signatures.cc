#include "tests/support/command_signatures.h"

#include <algorithm>
#include <iterator>
#include <span>
#include <sstream>

namespace ambrix_test {
namespace {

struct Kind {
  std::string_view name;
  Conversion conversion;
  /// Of an argument of this kind, unless its command says otherwise.
  std::string_view label;
};

constexpr Kind kKinds[] = {
    {"file", Conversion::kFile, "CDFID"},
    {"path", Conversion::kText, ""},
    {"newName", Conversion::kText, ""},
    {"attributeName", Conversion::kText, ""},
    {"variableName", Conversion::kText, ""},
    {"constantName", Conversion::kText, ""},
    {"amount", Conversion::kNumber, "NUMBUFFERS"},
    {"attribute", Conversion::kNumber, "ATTRNUM"},
    {"backward", Conversion::kNumber, "MODE"},
    {"checksum", Conversion::kNumber, "MODE"},
    {"compression", Conversion::kNumber, "TYPE"},
    {"datatype", Conversion::kNumber, "DATATYPE"},
    {"elements", Conversion::kNumber, "NUMELEMENTS"},
    {"entry", Conversion::kNumber, "ENTRYNUM"},
    {"format", Conversion::kNumber, "NUMBUFFERS"},
    {"majority", Conversion::kNumber, "MAJORITY"},
    {"mode", Conversion::kNumber, "MODE"},
    {"parameter", Conversion::kNumber, "CPARM"},
    {"record", Conversion::kNumber, "RECNUM"},
    {"records", Conversion::kNumber, "RECCOUNT"},
    {"scope", Conversion::kNumber, "SCOPE"},
    {"sparseness", Conversion::kNumber, "STYPE"},
    {"stride", Conversion::kNumber, "RECSTRIDE"},
    {"variable", Conversion::kNumber, "VARNUM"},
    {"counts", Conversion::kNumbers, "DIMCOUNT"},
    {"indices", Conversion::kNumbers, "INDICES"},
    {"sizes", Conversion::kNumbers, "DIMS"},
    {"start", Conversion::kNumbers, "DIMSTART"},
    {"strides", Conversion::kNumbers, "DIMSTRIDE"},
    {"components", Conversion::kOwn, ""},
    {"components16", Conversion::kOwn, ""},
    {"components9", Conversion::kOwn, ""},
    {"entryValues", Conversion::kOwn, ""},
    {"epochs", Conversion::kOwn, "EPOCHTIME"},
    {"epochs16", Conversion::kOwn, "EPOCH16TIME"},
    {"nanoseconds", Conversion::kOwn, ""},
    {"recordValues", Conversion::kOwn, ""},
    {"slabValues", Conversion::kOwn, ""},
    {"value", Conversion::kOwn, ""},
    {"variance", Conversion::kOwn, "VARIANCE"},
    {"variances", Conversion::kOwn, "VARIANCE"},
};

/// An argument is a kind, with its label behind "=" where it is not that of the kind; those in
/// brackets can be left out.
struct Row {
  int id;
  const char* name;
  const char* arguments;
  const char* results;
  const char* reported;
};

// Odd, and relied on: the labels of "closeVar", "renameAttr", "deleteAttrEntry", "setFormat" and
// "hyperGetVarData", the routine of "getVarNum", and the entries of "putAttrEntry" and
// "putAttrgEntry", which the scope of the attribute tells apart.
// clang-format off
constexpr Row kRows[] = {
    {0, "close", "file", "", "CDFcloseCDF"},
    {1, "closeVar", "file variable=CDFID", "", "CDFclosezVar"},
    {2, "computeEpoch", "components", "epochs", ""},
    {3, "computeEpoch16", "components16", "epochs16", ""},
    {4, "create", "path", "file", "fileCreateError"},
    {5, "createAttr", "file newName scope", "number", "CDFcreateAttr"},
    {6, "createVar", "file newName datatype elements sizes variance variances", "number",
     "CDFgetMajority CDFcreatezVar"},
    {7, "delete", "file", "", "CDFdelete"},
    {8, "deleteAttr", "file attribute", "", "CDFdeleteAttr"},
    {9, "deleteAttrEntry", "file attribute=ATTNUM entry", "", "CDFdeleteAttrzEntry"},
    {10, "deleteAttrgEntry", "file attribute entry", "", "CDFdeleteAttrgEntry"},
    {11, "deleteVar", "file variable", "", "CDFdeletezVar"},
    {12, "deleteVarRecords", "file variable record=STARTREC record=ENDREC", "",
     "? CDFdeletezVarRecords"},
    {13, "epochBreakdown", "epochs", "components", ""},
    {14, "epoch16Breakdown", "epochs16", "components16", ""},
    {19, "getAttrName", "file attribute", "text", "CDFgetAttrName"},
    {20, "getAttrNum", "file attributeName", "number", "CDFgetAttrNum"},
    {15, "getAttrgEntry", "file attribute entry", "values",
     "CDFinquireAttrgEntry CDFgetAttrgEntry"},
    {17, "getAttrMaxEntry", "file attribute", "number", "CDFgetAttrMaxzEntry"},
    {18, "getAttrMaxgEntry", "file attribute", "number", "CDFgetAttrMaxgEntry"},
    {21, "getAttrScope", "file attribute", "text", "CDFgetAttrScope"},
    {16, "getAttrEntry", "file attribute entry", "values", "CDFinquireAttrzEntry CDFgetAttrzEntry"},
    {22, "getCacheSize", "file", "number", "CDFgetCacheSize"},
    {23, "getChecksum", "file", "text", "CDFgetChecksum"},
    {24, "getCompression", "file", "text parameter number", "CDFgetCompression"},
    {25, "getCompressionCacheSize", "file", "number", "CDFgetCompressionCacheSize"},
    {26, "getCopyright", "file", "text", "CDFgetCopyright"},
    {27, "getFileBackward", "", "text", ""},
    {28, "getFormat", "file", "text", "CDFgetFormat"},
    {30, "getLibraryVersion", "", "number number number", "CDFgetLibraryVersion"},
    {29, "getLibraryCopyright", "", "text", "CDFgetLibraryCopyright"},
    {31, "getMajority", "file", "text", "CDFgetMajority"},
    {34, "getName", "file", "text", "CDFgetName"},
    {35, "getNumAttrgEntries", "file attribute", "number", "CDFgetNumAttrgEntries"},
    {36, "getNumAttrEntries", "file attribute", "number", "CDFgetNumAttrzEntries"},
    {37, "getNumgAttributes", "file", "number", "CDFgetNumgAttributes"},
    {38, "getNumvAttributes", "file", "number", "CDFgetNumvAttributes"},
    {39, "getReadOnlyMode", "file", "text", "CDFgetReadOnlyMode"},
    {40, "getStageCacheSize", "file", "number", "CDFgetStageCacheSize"},
    {41, "getValidate", "", "text", ""},
    {42, "getVarAllocRecords", "file variable", "number", "CDFgetzVarAllocRecords"},
    {43, "getVarCacheSize", "file variable", "number", "CDFgetFormat CDFgetzVarCacheSize"},
    {44, "getVarName", "file variable", "text", "CDFgetzVarName"},
    {32, "getVarNum", "file variableName", "number", "CDFclosezVar"},
    {45, "getVarPadValue", "file variable", "values", "CDFinquirezVar CDFgetzVarPadValue"},
    {33, "getVarReservePercent", "file variable", "number", "? CDFgetzVarReservePercent"},
    {46, "getVersion", "file", "number number number", "CDFgetVersion"},
    {48, "getVarBlockingFactor", "file variable", "number", "CDFgetzVarBlockingFactor"},
    {49, "getVarCompression", "file variable", "text parameter number", "CDFgetzVarCompression"},
    {50, "getVarData", "file variable record [indices]", "values",
     "CDFinquirezVar CDFgetMajority CDFgetzVarData"},
    {52, "getVarMaxWrittenRecNum", "file variable", "number", "CDFgetzVarMaxWrittenRecNum"},
    {51, "getVarMaxAllocRecNum", "file variable", "number", "CDFgetzVarMaxAllocRecNum"},
    {53, "getVarNumRecsWritten", "file variable", "number", "CDFgetzVarNumRecsWritten"},
    {54, "getVarRecordData", "file variable record", "values",
     "CDFinquirezVar CDFgetMajority CDFgetzVarRecordData"},
    {55, "getVarsMaxWrittenRecNum", "file", "number", "CDFgetzVarsMaxWrittenRecNum"},
    {56, "getVarSparseRecords", "file variable", "text", "CDFgetzVarSparseRecords"},
    {58, "hyperGetVarData",
     "file variable record=RECSTART records stride start counts strides=DIMSTRIDe", "values",
     "CDFinquirezVar CDFgetMajority CDFhyperGetzVarData"},
    {57, "hyperPutVarData",
     "file variable record=RECSTART records stride start counts strides slabValues", "",
     "CDFinquirezVar CDFgetMajority CDFhyperPutzVarData"},
    {59, "inquire", "file", "text text number number number", "CDFinquireCDF"},
    {63, "inquireVar", "file variable", "text text number row logical logicals",
     "CDFinquirezVar CDFgetMajority"},
    {60, "inquireAttr", "file attribute", "text text number number", "CDFinquireCDF"},
    {61, "inquireAttrgEntry", "file attribute entry", "text number", "CDFinquireAttrgEntry"},
    {62, "inquireAttrEntry", "file attribute entry", "text number", "CDFinquireAttrzEntry"},
    {64, "open", "path", "file", "fileOpenError CDFsetzMode"},
    {65, "putAttrEntry", "file attribute entry datatype entryValues", "",
     "CDFgetAttrScope CDFputAttrgEntry"},
    {66, "putAttrgEntry", "file attribute entry datatype entryValues", "",
     "CDFgetAttrScope CDFputAttrgEntry"},
    {67, "putVarData", "file variable record indices value", "",
     "CDFinquirezVar CDFgetMajority CDFputzVarData"},
    {68, "putVarRecordData", "file variable record recordValues", "",
     "CDFinquirezVar CDFputzVarRecordData"},
    {69, "renameAttr", "file attribute=ATTNUM newName", "", "CDFrenameAttr"},
    {70, "renameVar", "file variable newName", "", "CDFrenamezVar"},
    {71, "setCacheSize", "file amount", "", "CDFsetCacheSize"},
    {72, "setChecksum", "file checksum", "", "CDFsetChecksum"},
    {73, "setCompression", "file compression [parameter]", "", "CDFsetCompression"},
    {74, "setCompressionCacheSize", "file amount", "", "CDFsetCompressionCacheSize"},
    {75, "setFileBackward", "backward", "", ""},
    {76, "setFormat", "file format", "", "CDFsetFormat"},
    {77, "setMajority", "file majority", "", "CDFsetMajority"},
    {78, "setReadOnlyMode", "file mode", "", "CDFsetReadOnlyMode"},
    {89, "setStageCacheSize", "file amount", "", "CDFsetStageCacheSize"},
    {79, "setValidate", "mode", "", ""},
    {80, "setVarAllocBlockRecords", "file variable record=RECSTART record=RECSTOP", "",
     "? CDFsetzVarAllocBlockRecords"},
    {82, "setVarBlockingFactor", "file variable amount=BLOCKINGFACTOR", "",
     "? CDFsetzVarBlockingFactor"},
    {83, "setVarCacheSize", "file variable amount", "", "CDFgetFormat CDFsetzVarCacheSize"},
    {84, "setVarsCacheSize", "file amount", "", "CDFsetzVarsCacheSize"},
    {86, "setVarPadValue", "file variable value", "", "CDFinquirezVar CDFsetzVarPadValue"},
    {87, "setVarReservePercent", "file variable amount=PERCENT", "", "? CDFsetzVarReservePercent"},
    {88, "setVarSparseRecords", "file variable sparseness", "", "CDFsetzVarSparseRecords"},
    {85, "setVarInitialRecs", "file variable amount=NUMRECS", "", "? CDFsetzVarInitialRecs"},
    {90, "setVarCompression", "file variable compression=CTYPE [parameter]", "",
     "CDFsetzVarCompression"},
    {91, "getConstantNames", "", "names", ""},
    {92, "getConstantValue", "constantName", "number", ""},
};
// clang-format on
static_assert(std::size(kRows) == 91);

constexpr Row kExtendedRows[] = {
    {93, "computeTT2000", "components9", "nanoseconds", ""},
    {94, "tt2000Breakdown", "nanoseconds", "components9", ""},
};

std::vector<std::string> words(const std::string& text) {
  std::istringstream in(text);
  std::vector<std::string> words;
  for (std::string word; in >> word;)
    words.push_back(word);
  return words;
}

Argument argument(std::string word) {
  const bool optional = word.front() == '[';
  if (optional) word = word.substr(1, word.size() - 2);
  const std::string name = word.substr(0, word.find('='));
  const auto* kind = std::ranges::find(kKinds, name, &Kind::name);
  const std::string label = name == word ? std::string(kind->label) : word.substr(name.size() + 1);
  return {name, label, kind->conversion, optional};
}

Command command(const Row& row) {
  Command command{row.id, row.name, {}, words(row.results), words(row.reported)};
  for (const std::string& word : words(row.arguments))
    command.arguments.push_back(argument(word));
  return command;
}

std::vector<Command> commandsOf(std::span<const Row> rows) {
  std::vector<Command> commands;
  std::ranges::transform(rows, std::back_inserter(commands), command);
  return commands;
}

}  // namespace

std::size_t Command::minimum() const {
  return static_cast<std::size_t>(std::ranges::count(arguments, false, &Argument::optional));
}

bool Command::takesFile() const {
  return !arguments.empty() && arguments[0].kind == "file";
}

const std::vector<Command>& commands() {
  static const std::vector<Command> kCommands = commandsOf(kRows);
  return kCommands;
}

const std::vector<Command>& extendedCommands() {
  static const std::vector<Command> kCommands = commandsOf(kExtendedRows);
  return kCommands;
}

std::size_t placeOf(std::string_view name) {
  std::size_t place = 0;
  for (const std::vector<Command>* table : {&commands(), &extendedCommands()}) {
    const auto found = std::ranges::find(*table, name, &Command::name);
    place += static_cast<std::size_t>(found - table->begin());
    if (found != table->end()) return place;
  }
  return place;
}

}  // namespace ambrix_test
