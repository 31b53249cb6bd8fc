// What all 91 commands have in common: the number of their arguments, and the file that comes
// first.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using EveryCommandTest = ModuleTest;

struct Command {
  const char* name;
  std::size_t minimum;
  std::size_t maximum;
  bool takesFile;
};

// clang-format off
const Command kCommands[] = {
    {"close", 1, 1, true},
    {"closeVar", 2, 2, true},
    {"computeEpoch", 1, 1, false},
    {"computeEpoch16", 1, 1, false},
    {"create", 1, 1, false},
    {"createAttr", 3, 3, true},
    {"createVar", 7, 7, true},
    {"delete", 1, 1, true},
    {"deleteAttr", 2, 2, true},
    {"deleteAttrEntry", 3, 3, true},
    {"deleteAttrgEntry", 3, 3, true},
    {"deleteVar", 2, 2, true},
    {"deleteVarRecords", 4, 4, true},
    {"epochBreakdown", 1, 1, false},
    {"epoch16Breakdown", 1, 1, false},
    {"getAttrName", 2, 2, true},
    {"getAttrNum", 2, 2, true},
    {"getAttrgEntry", 3, 3, true},
    {"getAttrMaxEntry", 2, 2, true},
    {"getAttrMaxgEntry", 2, 2, true},
    {"getAttrScope", 2, 2, true},
    {"getAttrEntry", 3, 3, true},
    {"getCacheSize", 1, 1, true},
    {"getChecksum", 1, 1, true},
    {"getCompression", 1, 1, true},
    {"getCompressionCacheSize", 1, 1, true},
    {"getCopyright", 1, 1, true},
    {"getFileBackward", 0, 0, false},
    {"getFormat", 1, 1, true},
    {"getLibraryVersion", 0, 0, false},
    {"getLibraryCopyright", 0, 0, false},
    {"getMajority", 1, 1, true},
    {"getName", 1, 1, true},
    {"getNumAttrgEntries", 2, 2, true},
    {"getNumAttrEntries", 2, 2, true},
    {"getNumgAttributes", 1, 1, true},
    {"getNumvAttributes", 1, 1, true},
    {"getReadOnlyMode", 1, 1, true},
    {"getStageCacheSize", 1, 1, true},
    {"getValidate", 0, 0, false},
    {"getVarAllocRecords", 2, 2, true},
    {"getVarCacheSize", 2, 2, true},
    {"getVarName", 2, 2, true},
    {"getVarNum", 2, 2, true},
    {"getVarPadValue", 2, 2, true},
    {"getVarReservePercent", 2, 2, true},
    {"getVersion", 1, 1, true},
    {"getVarBlockingFactor", 2, 2, true},
    {"getVarCompression", 2, 2, true},
    {"getVarData", 3, 4, true},
    {"getVarMaxWrittenRecNum", 2, 2, true},
    {"getVarMaxAllocRecNum", 2, 2, true},
    {"getVarNumRecsWritten", 2, 2, true},
    {"getVarRecordData", 3, 3, true},
    {"getVarsMaxWrittenRecNum", 1, 1, true},
    {"getVarSparseRecords", 2, 2, true},
    {"hyperGetVarData", 8, 8, true},
    {"hyperPutVarData", 9, 9, true},
    {"inquire", 1, 1, true},
    {"inquireVar", 2, 2, true},
    {"inquireAttr", 2, 2, true},
    {"inquireAttrgEntry", 3, 3, true},
    {"inquireAttrEntry", 3, 3, true},
    {"open", 1, 1, false},
    {"putAttrEntry", 5, 5, true},
    {"putAttrgEntry", 5, 5, true},
    {"putVarData", 5, 5, true},
    {"putVarRecordData", 4, 4, true},
    {"renameAttr", 3, 3, true},
    {"renameVar", 3, 3, true},
    {"setCacheSize", 2, 2, true},
    {"setChecksum", 2, 2, true},
    {"setCompression", 2, 3, true},
    {"setCompressionCacheSize", 2, 2, true},
    {"setFileBackward", 1, 1, false},
    {"setFormat", 2, 2, true},
    {"setMajority", 2, 2, true},
    {"setReadOnlyMode", 2, 2, true},
    {"setStageCacheSize", 2, 2, true},
    {"setValidate", 1, 1, false},
    {"setVarAllocBlockRecords", 4, 4, true},
    {"setVarBlockingFactor", 3, 3, true},
    {"setVarCacheSize", 3, 3, true},
    {"setVarsCacheSize", 2, 2, true},
    {"setVarPadValue", 3, 3, true},
    {"setVarReservePercent", 3, 3, true},
    {"setVarSparseRecords", 3, 3, true},
    {"setVarInitialRecs", 3, 3, true},
    {"setVarCompression", 3, 4, true},
    {"getConstantNames", 0, 0, false},
    {"getConstantValue", 1, 1, false},
};
// clang-format on
static_assert(std::size(kCommands) == 91);

/// The first argument and others that no command takes.
Arguments withFirst(const Given& first, std::size_t count) {
  Arguments arguments(count, Given(Array::cell({1, 2})));
  if (count > 0) arguments[0] = first;
  return arguments;
}

TEST_F(EveryCommandTest, TakesItsNumberOfArgumentsAndNoOther) {
  for (const Command& command : kCommands) {
    const Given bad = Array::cell({1, 2});
    if (command.minimum > 0) {
      EXPECT_EQ(does(command.name, withFirst(bad, command.minimum - 1)), kWrongNumberOfInputs)
          << command.name;
    }
    EXPECT_EQ(does(command.name, withFirst(bad, command.maximum + 1)), kWrongNumberOfInputs)
        << command.name;
    for (std::size_t count = command.minimum; count <= command.maximum; ++count) {
      EXPECT_NE(does(command.name, withFirst(bad, count)), kWrongNumberOfInputs) << command.name;
    }
  }
}

TEST_F(EveryCommandTest, ChecksItsFileBeforeAnythingElse) {
  for (const Command& command : kCommands) {
    if (!command.takesFile) continue;
    EXPECT_EQ(does(command.name, withFirst(5, command.minimum)),
              validate("argumentNotUint64Scalar", "CDFID"))
        << command.name;
    EXPECT_EQ(does(command.name, withFirst(Array::scalar(std::uint64_t{5}), command.minimum)),
              kInvalidFileId)
        << command.name;
  }
}

TEST_F(EveryCommandTest, RefusesAFileThatWasClosed) {
  const Given file = create();
  results("close", {file});
  for (const Command& command : kCommands) {
    if (!command.takesFile) continue;
    EXPECT_EQ(does(command.name, withFirst(file, command.minimum)), kInvalidFileId) << command.name;
  }
}

}  // namespace
}  // namespace ambrix_test
