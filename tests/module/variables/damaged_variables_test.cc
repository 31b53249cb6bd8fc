// Variables whose description is damaged: what they claim must not overrun any memory.
#include <filesystem>
#include <fstream>

#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Validation is off, which would refuse the damage.
class DamagedVariablesTest : public ModuleTest {
 protected:
  /// A file with variable 0, whose description has the given big-endian word at a distance from its
  /// name.
  Given fileWith(const NewVariable& variable, int distance, std::uint32_t word) {
    const Given file = create();
    NewVariable named = variable;
    named.name = "damaged-variable";
    createVar(file, named);
    results("close", {file});
    const auto place = static_cast<int>(fileBytes("new.cdf").find(named.name)) + distance;
    std::fstream bytes("new.cdf", std::ios::in | std::ios::out | std::ios::binary);
    bytes.seekp(place);
    for (const int shift : {24, 16, 8, 0})
      bytes.put(static_cast<char>(word >> shift));
    bytes.close();
    results("setValidate", {0});
    return open("new");
  }
  Given fileWithElements(const NewVariable& variable, std::uint32_t elements) {
    return fileWith(variable, -20, elements);
  }
  Given fileWithSize(const NewVariable& variable, std::uint32_t size) {
    return fileWith(variable, 260, size);
  }
};

TEST_F(DamagedVariablesTest, NumbersOfManyElementsNeverOverrunTheirArray) {
  const Given file = fileWithElements({.datatype = 4, .sizes = {2}}, 1000);
  EXPECT_EQ(shown(results("inquireVar", {file, 0})[2]), "double 1x1 [1000]");
  EXPECT_EQ(does("getVarData", {file, 0, 0, 0}), refused("CDFgetzVarData", kBadNumElems));
  EXPECT_EQ(does("getVarRecordData", {file, 0, 0}), refused("CDFgetzVarRecordData", kBadNumElems));
  EXPECT_EQ(does("hyperGetVarData", {file, 0, 0, 1, 1, 0, 2, 1}),
            refused("CDFhyperGetzVarData", kBadNumElems));
  EXPECT_EQ(does("getVarPadValue", {file, 0}), refused("CDFgetzVarPadValue", kBadNumElems));
}

TEST_F(DamagedVariablesTest, NumbersOfManyElementsNeverLetTheLibraryReadBeyondTheData) {
  const Given file = fileWithElements({.datatype = 4, .sizes = {2}}, 1000);
  EXPECT_EQ(does("putVarData", {file, 0, 0, 0, row<std::int32_t>({1})}),
            refused("CDFputzVarData", kBadNumElems));
  EXPECT_EQ(does("putVarRecordData", {file, 0, 0, row<std::int32_t>({1, 2})}),
            refused("CDFputzVarRecordData", kBadNumElems));
  EXPECT_EQ(does("setVarPadValue", {file, 0, row<std::int32_t>({1})}),
            refused("CDFsetzVarPadValue", kBadNumElems));
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, 0, 1, 1, row<std::int32_t>({1})}),
            cdflib("wrongNumberOfHyperPutVarDataElements", "[ 1 ]", 1L, "damaged-variable", 1000L));
}

TEST_F(DamagedVariablesTest, ValuesWithoutElementsAreRefused) {
  for (const std::uint32_t elements : {0U, 0xFFFFFFFFU}) {
    const Given file = fileWithElements({.datatype = 51, .elements = 3}, elements);
    const std::string read = does("getVarRecordData", {file, 0, 0});
    EXPECT_THAT(read, testing::HasSubstr("'CDFgetzVarRecordData', 'BAD_NUM_ELEMS")) << elements;
    EXPECT_EQ(does("getVarPadValue", {file, 0}).substr(0, 39),
              refused("CDFgetzVarPadValue", kBadNumElems).substr(0, 39));
    results("close", {file});
    std::filesystem::remove("new.cdf");
  }
}

TEST_F(DamagedVariablesTest, SizesThatMakeARecordTooLargeAreRefused) {
  const Given file = fileWithSize({.datatype = 22, .sizes = {2}}, 0x10000000);
  EXPECT_EQ(does("getVarRecordData", {file, 0, 0}), refused("CDFgetzVarRecordData", kBadDimSize));
  EXPECT_EQ(does("hyperGetVarData", {file, 0, 0, 1, 1, 0, 2, 1}),
            refused("CDFhyperGetzVarData", kBadDimSize));
  EXPECT_EQ(does("getVarData", {file, 0, 0, 0}), refused("CDFgetzVarData", kBadDimSize));
}

TEST_F(DamagedVariablesTest, SizesOfNothingAreRefused) {
  for (const std::uint32_t size : {0U, 0xFFFFFFFFU}) {
    const Given file = fileWithSize({.datatype = 22, .sizes = {2}}, size);
    EXPECT_EQ(does("getVarData", {file, 0, 0, 0}), refused("CDFgetzVarData", kBadDimSize));
    EXPECT_EQ(does("getVarRecordData", {file, 0, 0}), refused("CDFgetzVarRecordData", kBadDimSize));
    results("close", {file});
    std::filesystem::remove("new.cdf");
  }
}

}  // namespace
}  // namespace ambrix_test
