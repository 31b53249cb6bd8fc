#include "fuzz/calls/command_signatures.h"

#include <algorithm>
#include <iterator>

namespace ambrix_fuzz {
namespace {

// clang-format off
constexpr Command kCommands[] = {
    {"close",                   "f",         ""},
    {"closeVar",                "fv",        ""},
    {"computeEpoch",            "7",         "1"},
    {"computeEpoch16",          "0",         "2"},
    {"create",                  "c",         "h"},
    {"createAttr",              "fwg",       "d"},
    {"createVar",               "fwdnDRS",   "d"},
    {"delete",                  "f",         ""},
    {"deleteAttr",              "fa",        ""},
    {"deleteAttrEntry",         "fae",       ""},
    {"deleteAttrgEntry",        "fae",       ""},
    {"deleteVar",               "fv",        ""},
    {"deleteVarRecords",        "fvrr",      ""},
    {"epochBreakdown",          "1",         "7"},
    {"epoch16Breakdown",        "2",         "0"},
    {"getAttrName",             "fa",        "t"},
    {"getAttrNum",              "fA",        "d"},
    {"getAttrgEntry",           "fae",       "v"},
    {"getAttrMaxEntry",         "fa",        "d"},
    {"getAttrMaxgEntry",        "fa",        "d"},
    {"getAttrScope",            "fa",        "t"},
    {"getAttrEntry",            "fae",       "v"},
    {"getCacheSize",            "f",         "d"},
    {"getChecksum",             "f",         "t"},
    {"getCompression",          "f",         "tpd"},
    {"getCompressionCacheSize", "f",         "d"},
    {"getCopyright",            "f",         "t"},
    {"getFileBackward",         "",          "t"},
    {"getFormat",               "f",         "t"},
    {"getLibraryVersion",       "",          "ddd"},
    {"getLibraryCopyright",     "",          "t"},
    {"getMajority",             "f",         "t"},
    {"getName",                 "f",         "t"},
    {"getNumAttrgEntries",      "fa",        "d"},
    {"getNumAttrEntries",       "fa",        "d"},
    {"getNumgAttributes",       "f",         "d"},
    {"getNumvAttributes",       "f",         "d"},
    {"getReadOnlyMode",         "f",         "t"},
    {"getStageCacheSize",       "f",         "d"},
    {"getValidate",             "",          "t"},
    {"getVarAllocRecords",      "fv",        "d"},
    {"getVarCacheSize",         "fv",        "d"},
    {"getVarName",              "fv",        "t"},
    {"getVarNum",               "fV",        "d"},
    {"getVarPadValue",          "fv",        "v"},
    {"getVarReservePercent",    "fv",        "d"},
    {"getVersion",              "f",         "ddd"},
    {"getVarBlockingFactor",    "fv",        "d"},
    {"getVarCompression",       "fv",        "tpd"},
    {"getVarData",              "fvr?i",     "v"},
    {"getVarMaxWrittenRecNum",  "fv",        "d"},
    {"getVarMaxAllocRecNum",    "fv",        "d"},
    {"getVarNumRecsWritten",    "fv",        "d"},
    {"getVarRecordData",        "fvr",       "v"},
    {"getVarsMaxWrittenRecNum", "f",         "d"},
    {"getVarSparseRecords",     "fv",        "t"},
    {"hyperGetVarData",         "fvrktIKT",  "v"},
    {"hyperPutVarData",         "fvrktIKTH", ""},
    {"inquire",                 "f",         "ttddd"},
    {"inquireVar",              "fv",        "ttdrlL"},
    {"inquireAttr",             "fa",        "ttdd"},
    {"inquireAttrgEntry",       "fae",       "td"},
    {"inquireAttrEntry",        "fae",       "td"},
    {"open",                    "o",         "h"},
    {"putAttrEntry",            "faedE",     ""},
    {"putAttrgEntry",           "faedE",     ""},
    {"putVarData",              "fvrix",     ""},
    {"putVarRecordData",        "fvrX",      ""},
    {"renameAttr",              "faw",       ""},
    {"renameVar",               "fvw",       ""},
    {"setCacheSize",            "fb",        ""},
    {"setChecksum",             "fC",        ""},
    {"setCompression",          "fz?Z",      ""},
    {"setCompressionCacheSize", "fb",        ""},
    {"setFileBackward",         "B",         ""},
    {"setFormat",               "fF",        ""},
    {"setMajority",             "fg",        ""},
    {"setReadOnlyMode",         "fO",        ""},
    {"setStageCacheSize",       "fb",        ""},
    {"setValidate",             "O",         ""},
    {"setVarAllocBlockRecords", "fvrr",      ""},
    {"setVarBlockingFactor",    "fvb",       ""},
    {"setVarCacheSize",         "fvb",       ""},
    {"setVarsCacheSize",        "fb",        ""},
    {"setVarPadValue",          "fvx",       ""},
    {"setVarReservePercent",    "fvb",       ""},
    {"setVarSparseRecords",     "fvs",       ""},
    {"setVarInitialRecs",       "fvb",       ""},
    {"setVarCompression",       "fvz?Z",     ""},
    {"getConstantNames",        "",          "c"},
    {"getConstantValue",        "N",         "d"},
};
// clang-format on
static_assert(std::size(kCommands) == 91);

}  // namespace

std::span<const Command> commands() {
  return kCommands;
}

std::size_t placeOf(std::string_view name) {
  const auto* found =
      std::ranges::find_if(kCommands, [name](const Command& row) { return name == row.name; });
  return static_cast<std::size_t>(found - kCommands);
}

}  // namespace ambrix_fuzz
