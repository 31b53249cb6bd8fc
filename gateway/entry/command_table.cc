#include "gateway/entry/command_table.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <string>

#include "attributes/attribute_counts.h"
#include "attributes/attribute_entries.h"
#include "attributes/attributes.h"
#include "constants/constant_table.h"
#include "epoch/epoch.h"
#include "file/compression.h"
#include "file/file_inquiry.h"
#include "file/file_lifecycle.h"
#include "file/file_settings.h"
#include "file/library_modes.h"
#include "file/read_only_mode.h"
#include "gateway/errors.h"
#include "gateway/extension.h"
#include "gateway/raise_error.h"
#include "variables/pad_values.h"
#include "variables/read_data.h"
#include "variables/variable_definition.h"
#include "variables/variable_settings.h"
#include "variables/write_data.h"

namespace TOLVEX::ambrix {
namespace {

// The ids are fixed and not in table order; 47 and 81 are not used.
// clang-format off
constexpr CommandEntry CommandTable[] = {
    { 0, "close",                    1, 1, closeFile},
    { 1, "closeVar",                 2, 2, closeVar},
    { 2, "computeEpoch",             1, 1, computeEpoch},
    { 3, "computeEpoch16",           1, 1, computeEpoch16},
    { 4, "create",                   1, 1, createFile},
    { 5, "createAttr",               3, 3, createAttr},
    { 6, "createVar",                7, 7, createVar},
    { 7, "delete",                   1, 1, deleteFile},
    { 8, "deleteAttr",               2, 2, deleteAttr},
    { 9, "deleteAttrEntry",          3, 3, deleteAttrEntry<kZEntry>},
    {10, "deleteAttrgEntry",         3, 3, deleteAttrEntry<kGEntry>},
    {11, "deleteVar",                2, 2, deleteVar},
    {12, "deleteVarRecords",         4, 4, deleteVarRecords},
    {13, "epochBreakdown",           1, 1, epochBreakdown},
    {14, "epoch16Breakdown",         1, 1, epoch16Breakdown},
    {19, "getAttrName",              2, 2, getAttrName},
    {20, "getAttrNum",               2, 2, getAttrNum},
    {15, "getAttrgEntry",            3, 3, getAttrEntry<kGEntry>},
    {17, "getAttrMaxEntry",          2, 2, getEntryCount<kGetAttrMaxEntry>},
    {18, "getAttrMaxgEntry",         2, 2, getEntryCount<kGetAttrMaxgEntry>},
    {21, "getAttrScope",             2, 2, getAttrScope},
    {16, "getAttrEntry",             3, 3, getAttrEntry<kZEntry>},
    {22, "getCacheSize",             1, 1, getFileProperty<kGetCacheSize>},
    {23, "getChecksum",              1, 1, getNamedSetting<kGetChecksum>},
    {24, "getCompression",           1, 1, getCompression},
    {25, "getCompressionCacheSize",  1, 1, getFileProperty<kGetCompressionCacheSize>},
    {26, "getCopyright",             1, 1, getCopyright},
    {27, "getFileBackward",          0, 0, getFileBackward},
    {28, "getFormat",                1, 1, getNamedSetting<kGetFormat>},
    {30, "getLibraryVersion",        0, 0, getLibraryVersion},
    {29, "getLibraryCopyright",      0, 0, getLibraryCopyright},
    {31, "getMajority",              1, 1, getNamedSetting<kGetMajority>},
    {34, "getName",                  1, 1, getName},
    {35, "getNumAttrgEntries",       2, 2, getEntryCount<kGetNumAttrgEntries>},
    {36, "getNumAttrEntries",        2, 2, getEntryCount<kGetNumAttrEntries>},
    {37, "getNumgAttributes",        1, 1, getFileProperty<kGetNumgAttributes>},
    {38, "getNumvAttributes",        1, 1, getFileProperty<kGetNumvAttributes>},
    {39, "getReadOnlyMode",          1, 1, getNamedSetting<kGetReadOnlyMode>},
    {40, "getStageCacheSize",        1, 1, getFileProperty<kGetStageCacheSize>},
    {41, "getValidate",              0, 0, getValidate},
    {42, "getVarAllocRecords",       2, 2, getVariableProperty<kGetVarAllocRecords>},
    {43, "getVarCacheSize",          2, 2, getVarCacheSize},
    {44, "getVarName",               2, 2, getVarName},
    {32, "getVarNum",                2, 2, getVarNum},
    {45, "getVarPadValue",           2, 2, getVarPadValue},
    {33, "getVarReservePercent",     2, 2, getVariableProperty<kGetVarReservePercent>},
    {46, "getVersion",               1, 1, getVersion},
    {48, "getVarBlockingFactor",     2, 2, getVariableProperty<kGetVarBlockingFactor>},
    {49, "getVarCompression",        2, 2, getVarCompression},
    {50, "getVarData",               3, 4, getVarData},
    {52, "getVarMaxWrittenRecNum",   2, 2, getVariableProperty<kGetVarMaxWrittenRecNum>},
    {51, "getVarMaxAllocRecNum",     2, 2, getVariableProperty<kGetVarMaxAllocRecNum>},
    {53, "getVarNumRecsWritten",     2, 2, getVariableProperty<kGetVarNumRecsWritten>},
    {54, "getVarRecordData",         3, 3, getVarRecordData},
    {55, "getVarsMaxWrittenRecNum",  1, 1, getFileProperty<kGetVarsMaxWrittenRecNum>},
    {56, "getVarSparseRecords",      2, 2, getVarSparseRecords},
    {58, "hyperGetVarData",          8, 8, hyperGetVarData},
    {57, "hyperPutVarData",          9, 9, hyperPutVarData},
    {59, "inquire",                  1, 1, inquireFile},
    {63, "inquireVar",               2, 2, inquireVar},
    {60, "inquireAttr",              2, 2, inquireAttr},
    {61, "inquireAttrgEntry",        3, 3, inquireAttrEntry<kGEntry>},
    {62, "inquireAttrEntry",         3, 3, inquireAttrEntry<kZEntry>},
    {64, "open",                     1, 1, openFile},
    {65, "putAttrEntry",             5, 5, putAttrEntry},
    {66, "putAttrgEntry",            5, 5, putAttrEntry},
    {67, "putVarData",               5, 5, putVarData},
    {68, "putVarRecordData",         4, 4, putVarRecordData},
    {69, "renameAttr",               3, 3, renameAttr},
    {70, "renameVar",                3, 3, renameVar},
    {71, "setCacheSize",             2, 2, setFileSetting<kSetCacheSize>},
    {72, "setChecksum",              2, 2, setFileSetting<kSetChecksum>},
    {73, "setCompression",           2, 3, setCompression},
    {74, "setCompressionCacheSize",  2, 2, setFileSetting<kSetCompressionCacheSize>},
    {75, "setFileBackward",          1, 1, setFileBackward},
    {76, "setFormat",                2, 2, setFileSetting<kSetFormat>},
    {77, "setMajority",              2, 2, setFileSetting<kSetMajority>},
    {78, "setReadOnlyMode",          2, 2, setReadOnlyMode},
    {89, "setStageCacheSize",        2, 2, setFileSetting<kSetStageCacheSize>},
    {79, "setValidate",              1, 1, setValidate},
    {80, "setVarAllocBlockRecords",  4, 4, setVarAllocBlockRecords},
    {82, "setVarBlockingFactor",     3, 3, setVariableSetting<kSetVarBlockingFactor>},
    {83, "setVarCacheSize",          3, 3, setVarCacheSize},
    {84, "setVarsCacheSize",         2, 2, setFileSetting<kSetVarsCacheSize>},
    {86, "setVarPadValue",           3, 3, setVarPadValue},
    {87, "setVarReservePercent",     3, 3, setVariableSetting<kSetVarReservePercent>},
    {88, "setVarSparseRecords",      3, 3, setVariableSetting<kSetVarSparseRecords>},
    {85, "setVarInitialRecs",        3, 3, setVariableSetting<kSetVarInitialRecs>},
    {90, "setVarCompression",        3, 4, setVarCompression},
    {91, "getConstantNames",         0, 0, getConstantNames},
    {92, "getConstantValue",         1, 1, getConstantValue},
};
// clang-format on
static_assert(std::size(CommandTable) == 91);

/// The names with their lengths, so that most rows differ at a glance.
constexpr auto kNames = [] {
  std::array<std::string_view, std::size(CommandTable)> names;
  std::ranges::transform(CommandTable, names.begin(), &CommandEntry::name);
  return names;
}();

/// Raises `invalidOperation` unless the host's extension has the command.
const CommandEntry& extendedCommand(std::string_view name) {
  for (const CommandEntry& entry : extension().commands) {
    if (entry.name == name) return entry;
  }
  raiseError(cdflib::invalidOperation(std::string(name)));
}

}  // namespace

std::span<const CommandEntry> commandTable() {
  return CommandTable;
}

const CommandEntry& lookupCommand(std::string_view name, std::int32_t argumentCount) {
  const auto found = std::ranges::find(kNames, name);
  const CommandEntry& entry =
      found != kNames.end() ? CommandTable[found - kNames.begin()] : extendedCommand(name);
  const bool suits =
      argumentCount >= entry.minimumArguments && argumentCount <= entry.maximumArguments;
  if (!suits) raiseError(validate::wrongNumberOfInputs());
  return entry;
}

}  // namespace TOLVEX::ambrix
