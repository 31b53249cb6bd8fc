#include "tests/scripted/commands/command_cases.h"

namespace ambrix_test {
namespace {

using Names = std::vector<std::string>;

// Readers and writers ask for the variable and the majority first.
Names afterInquiry(const char* routine) {
  return {"CDFinquirezVar", "CDFgetMajority", routine};
}
// Where the library would divide by the size of a record, a guard looks at the variable first.
Names guarded(const char* routine) {
  return {"", routine};
}
Names afterFormat(const char* routine) {
  return {"CDFgetFormat", routine};
}

}  // namespace

CommandTest::CommandTest() {
  describe({.sizes = {2, 3}});
  fake.answer("CDF_FORMAT_", {2});
  fake.answer("CDF_ENCODING_", {6});
  fake.answer("ATTR_SCOPE_", {1});
  fake.answer("CDFinquireAttr", {1, 0, 0, 0});
  fake.answer("CDFinquireAttrEntry", {45, 1});
}

// clang-format off
std::vector<CommandCase> commandCases() {
  return {
      {"close", {file()}, {"CDFcloseCDF"}},
      {"closeVar", {file(), 3}, {"CDFclosezVar"}},
      {"computeEpoch", {{1, 2, 3, 4, 5, 6, 7}}, {}, 0},
      {"computeEpoch16", {{1, 2, 3, 4, 5, 6, 7, 8, 9, 10}}, {}, 0},
      {"create", {"a.cdf"}, {"fileCreateError"}},
      {"createAttr", {file(), "a", 1}, {"CDFcreateAttr"}},
      {"createVar", {file(), "v", 4, 1, {2, 3}, -1, {-1, 0}}, {"CDFgetMajority", "CDFcreatezVar"}},
      {"delete", {file()}, {"CDFdelete"}},
      {"deleteAttr", {file(), 2}, {"CDFdeleteAttr"}},
      {"deleteAttrEntry", {file(), 2, 5}, {"CDFdeleteAttrzEntry"}},
      {"deleteAttrgEntry", {file(), 2, 5}, {"CDFdeleteAttrgEntry"}},
      {"deleteVar", {file(), 3}, {"CDFdeletezVar"}},
      {"deleteVarRecords", {file(), 3, 0, 9}, guarded("CDFdeletezVarRecords")},
      {"epochBreakdown", {{1, 2}}, {}, 0},
      {"epoch16Breakdown", {{1, 2}}, {}, 0},
      {"getAttrName", {file(), 2}, {"CDFgetAttrName"}},
      {"getAttrNum", {file(), "a"}, {"CDFgetAttrNum"}},
      {"getAttrgEntry", {file(), 2, 5}, {"CDFinquireAttrgEntry", "CDFgetAttrgEntry"}},
      {"getAttrMaxEntry", {file(), 2}, {"CDFgetAttrMaxzEntry"}},
      {"getAttrMaxgEntry", {file(), 2}, {"CDFgetAttrMaxgEntry"}},
      {"getAttrScope", {file(), 2}, {"CDFgetAttrScope"}},
      {"getAttrEntry", {file(), 2, 5}, {"CDFinquireAttrzEntry", "CDFgetAttrzEntry"}},
      {"getCacheSize", {file()}, {"CDFgetCacheSize"}},
      {"getChecksum", {file()}, {"CDFgetChecksum"}},
      {"getCompression", {file()}, {"CDFgetCompression"}},
      {"getCompressionCacheSize", {file()}, {"CDFgetCompressionCacheSize"}},
      {"getCopyright", {file()}, {"CDFgetCopyright"}},
      {"getFileBackward", {}, {}},
      {"getFormat", {file()}, {"CDFgetFormat"}},
      {"getLibraryVersion", {}, {"CDFgetLibraryVersion"}},
      {"getLibraryCopyright", {}, {"CDFgetLibraryCopyright"}},
      {"getMajority", {file()}, {"CDFgetMajority"}},
      {"getName", {file()}, {"CDFgetName"}},
      {"getNumAttrgEntries", {file(), 2}, {"CDFgetNumAttrgEntries"}},
      {"getNumAttrEntries", {file(), 2}, {"CDFgetNumAttrzEntries"}},
      {"getNumgAttributes", {file()}, {"CDFgetNumgAttributes"}},
      {"getNumvAttributes", {file()}, {"CDFgetNumvAttributes"}},
      {"getReadOnlyMode", {file()}, {"CDFgetReadOnlyMode"}},
      {"getStageCacheSize", {file()}, {"CDFgetStageCacheSize"}},
      {"getValidate", {}, {}},
      {"getVarAllocRecords", {file(), 3}, {"CDFgetzVarAllocRecords"}},
      {"getVarCacheSize", {file(), 3}, afterFormat("CDFgetzVarCacheSize")},
      {"getVarName", {file(), 3}, {"CDFgetzVarName"}},
      {"getVarNum", {file(), "v"}, {"CDFclosezVar"}},
      {"getVarPadValue", {file(), 3}, {"CDFinquirezVar", "CDFgetzVarPadValue"}},
      {"getVarReservePercent", {file(), 3}, guarded("CDFgetzVarReservePercent")},
      {"getVersion", {file()}, {"CDFgetVersion"}},
      {"getVarBlockingFactor", {file(), 3}, {"CDFgetzVarBlockingFactor"}},
      {"getVarCompression", {file(), 3}, {"CDFgetzVarCompression"}},
      {"getVarData", {file(), 3, 0, {1, 2}}, afterInquiry("CDFgetzVarData")},
      {"getVarMaxWrittenRecNum", {file(), 3}, {"CDFgetzVarMaxWrittenRecNum"}},
      {"getVarMaxAllocRecNum", {file(), 3}, {"CDFgetzVarMaxAllocRecNum"}},
      {"getVarNumRecsWritten", {file(), 3}, {"CDFgetzVarNumRecsWritten"}},
      {"getVarRecordData", {file(), 3, 0}, afterInquiry("CDFgetzVarRecordData")},
      {"getVarsMaxWrittenRecNum", {file()}, {"CDFgetzVarsMaxWrittenRecNum"}},
      {"getVarSparseRecords", {file(), 3}, {"CDFgetzVarSparseRecords"}},
      {"hyperGetVarData", {file(), 3, 0, 1, 1, {0, 0}, {1, 2}, {1, 1}},
       afterInquiry("CDFhyperGetzVarData")},
      {"hyperPutVarData", {file(), 3, 0, 1, 1, {0, 0}, {1, 2}, {1, 1}, {8, 9}},
       afterInquiry("CDFhyperPutzVarData"), 8},
      {"inquire", {file()}, {"CDFinquireCDF"}},
      {"inquireVar", {file(), 3}, {"CDFinquirezVar", "CDFgetMajority"}},
      {"inquireAttr", {file(), 2}, {"CDFinquireCDF"}},
      {"inquireAttrgEntry", {file(), 2, 5}, {"CDFinquireAttrgEntry"}},
      {"inquireAttrEntry", {file(), 2, 5}, {"CDFinquireAttrzEntry"}},
      {"open", {"a.cdf"}, {"fileOpenError", "CDFsetzMode"}},
      {"putAttrEntry", {file(), 2, 5, 45, 1}, {"CDFgetAttrScope", "CDFputAttrgEntry"}, 4},
      {"putAttrgEntry", {file(), 2, 5, 51, "text"}, {"CDFgetAttrScope", "CDFputAttrgEntry"}, 4},
      {"putVarData", {file(), 3, 0, {1, 2}, 8}, afterInquiry("CDFputzVarData"), 4},
      {"putVarRecordData", {file(), 3, 0, elements<double>(6)},
       {"CDFinquirezVar", "CDFputzVarRecordData"}, 3},
      {"renameAttr", {file(), 2, "b"}, {"CDFrenameAttr"}},
      {"renameVar", {file(), 3, "w"}, {"CDFrenamezVar"}},
      {"setCacheSize", {file(), 9}, {"CDFsetCacheSize"}},
      {"setChecksum", {file(), 1}, {"CDFsetChecksum"}},
      {"setCompression", {file(), 5, 6}, {"CDFsetCompression"}},
      {"setCompressionCacheSize", {file(), 9}, {"CDFsetCompressionCacheSize"}},
      {"setFileBackward", {1}, {}},
      {"setFormat", {file(), 2}, {"CDFsetFormat"}},
      {"setMajority", {file(), 2}, {"CDFsetMajority"}},
      {"setReadOnlyMode", {file(), 0}, {"CDFsetReadOnlyMode"}},
      {"setStageCacheSize", {file(), 9}, {"CDFsetStageCacheSize"}},
      {"setValidate", {-1}, {}},
      {"setVarAllocBlockRecords", {file(), 3, 0, 9}, guarded("CDFsetzVarAllocBlockRecords")},
      {"setVarBlockingFactor", {file(), 3, 9}, guarded("CDFsetzVarBlockingFactor")},
      {"setVarCacheSize", {file(), 3, 9}, afterFormat("CDFsetzVarCacheSize")},
      {"setVarsCacheSize", {file(), 9}, {"CDFsetzVarsCacheSize"}},
      {"setVarPadValue", {file(), 3, 1}, {"CDFinquirezVar", "CDFsetzVarPadValue"}, 2},
      {"setVarReservePercent", {file(), 3, 9}, guarded("CDFsetzVarReservePercent")},
      {"setVarSparseRecords", {file(), 3, 1}, {"CDFsetzVarSparseRecords"}},
      {"setVarInitialRecs", {file(), 3, 9}, guarded("CDFsetzVarInitialRecs")},
      {"setVarCompression", {file(), 3, 5, 6}, {"CDFsetzVarCompression"}},
      {"getConstantNames", {}, {}},
      {"getConstantValue", {"VARY"}, {}},
  };
}
// clang-format on

}  // namespace ambrix_test
