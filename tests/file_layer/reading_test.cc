// What a file is made of, and its values.
#include "tests/file_layer/file_layer_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class FileReadingTest : public FileLayerTest {
 protected:
  /// A file that commands have written: no part of what is tested.
  Given byCommands() { return ModuleTest::create("new"); }
  Given variable(const Given& file, const NewVariable& definition) {
    return createVar(file, definition);
  }
  void put(const Given& file, const Given& number, double record, Array data) {
    results("putVarRecordData", {file, number, record, std::move(data)});
  }
  void finish(const Given& file) { results("close", {file}); }
};

struct DatatypeCase {
  long code;
  const char* name;
  std::function<Array()> record;
  const char* read;  // with another dimension for the only record
};

TEST_F(FileReadingTest, ReadsValuesOfEveryDatatype) {
  const DatatypeCase cases[] = {
      {1, "cdf_int1",
       [] {
         return rowOf<std::int8_t>({-3, 4});
       },
       "int8 2x1 [-3 4]"},
      {2, "cdf_int2",
       [] {
         return rowOf<std::int16_t>({-300, 4});
       },
       "int16 2x1 [-300 4]"},
      {4, "cdf_int4",
       [] {
         return rowOf<std::int32_t>({-70000, 4});
       },
       "int32 2x1 [-70000 4]"},
      {11, "cdf_uint1",
       [] {
         return rowOf<std::uint8_t>({200, 4});
       },
       "uint8 2x1 [200 4]"},
      {12, "cdf_uint2",
       [] {
         return rowOf<std::uint16_t>({60000, 4});
       },
       "uint16 2x1 [60000 4]"},
      {14, "cdf_uint4",
       [] {
         return rowOf<std::uint32_t>({4000000000, 4});
       },
       "uint32 2x1 [4000000000 4]"},
      {21, "cdf_real4",
       [] {
         return rowOf<float>({1.5F, -2});
       },
       "single 2x1 [1.5 -2]"},
      {22, "cdf_real8",
       [] {
         return rowOf<double>({0.25, -2});
       },
       "double 2x1 [0.25 -2]"},
      {31, "cdf_epoch",
       [] {
         return rowOf<double>({6e13, 0});
       },
       "double 2x1 [60000000000000 0]"},
      {32, "cdf_epoch16",
       [] {
         return rowOf<double>({6e10, 5, 7, 8});
       },
       "double 2x2 [60000000000 5 7 8]"},
      {41, "cdf_byte",
       [] {
         return rowOf<std::int8_t>({-3, 4});
       },
       "int8 2x1 [-3 4]"},
      {44, "cdf_float",
       [] {
         return rowOf<float>({1.5F, -2});
       },
       "single 2x1 [1.5 -2]"},
      {45, "cdf_double",
       [] {
         return rowOf<double>({0.25, -2});
       },
       "double 2x1 [0.25 -2]"},
      {51, "cdf_char", [] { return Array::fromNarrow("abcd"); }, "char 2x2 'abcd'"},
      {52, "cdf_uchar", [] { return Array::fromNarrow("wxyz"); }, "char 2x2 'wxyz'"}};
  const Given file = byCommands();
  for (const DatatypeCase& one : cases) {
    const Given number = variable(
        file,
        {.datatype = one.code, .sizes = {2}, .elements = one.code > 50 ? 2 : 1, .name = one.name});
    put(file, number, 0, one.record());
  }
  finish(file);
  File read = open();
  EXPECT_EQ(read.variableCount(), std::size(cases));
  for (const DatatypeCase& one : cases) {
    const Variable found = read.variable(one.name);
    EXPECT_EQ(static_cast<long>(found.datatype), one.code) << one.name;
    EXPECT_TRUE(found.supported);
    EXPECT_EQ(shown(read.read(found)), one.read) << one.name;
  }
}

TEST_F(FileReadingTest, DefinesVariablesAsTheyAre) {
  const Given file = byCommands();
  variable(file, {.datatype = 4, .sizes = {2, 3}, .name = "a", .variances = {-1, 0}});
  variable(file, {.datatype = 51, .elements = 7, .name = "b", .recordsVary = false});
  finish(file);
  File read = open();
  const std::vector<Variable> found = read.variables();
  ASSERT_EQ(found.size(), 2);
  EXPECT_EQ(found[0].name, "a");
  EXPECT_THAT(found[0].sizes, ElementsAre(2, 3));
  EXPECT_THAT(found[0].varies, ElementsAre(true, false));
  EXPECT_TRUE(found[0].recordVaries);
  EXPECT_EQ(found[0].recordElements(), 6);
  EXPECT_EQ(found[1].number, 1);
  EXPECT_EQ(found[1].elements, 7);
  EXPECT_THAT(found[1].sizes, IsEmpty());
  EXPECT_FALSE(found[1].recordVaries);
  EXPECT_EQ(found[1].recordElements(), 7);
}

TEST_F(FileReadingTest, ReadsBothMajoritiesFirstDimensionFastest) {
  for (const char* const majority : {"ROW_MAJOR", "COLUMN_MAJOR"}) {
    const Given file = byCommands();
    results(
        "setMajority",
        {file,
         module.call("getConstantValue", {Array::fromNarrow(majority)}).at(0).data<double>()[0]});
    const Given number = variable(file, {.datatype = 4, .sizes = {2, 3}});
    put(file, number, 0, rowOf<std::int32_t>({11, 21, 12, 22, 13, 23}));
    put(file, number, 1, rowOf<std::int32_t>({1, 2, 3, 4, 5, 6}));
    finish(file);
    File read = open();
    EXPECT_EQ(read.facts().majority, majority);
    const Variable found = read.variable("v");
    EXPECT_EQ(shown(read.read(found)), "int32 2x3x2 [11 21 12 22 13 23 1 2 3 4 5 6]") << majority;
    EXPECT_EQ(shown(read.read(found, {0, 2, {1, 0}, {1, 2}, 1, {1, 2}})), "int32 1x2x2 [21 23 2 6]")
        << majority;
    read.close();
    std::filesystem::remove("new.cdf");
  }
}

TEST_F(FileReadingTest, ReadsWhatAnotherProgramHasWritten) {
  File read = open(distributionSample("example2.cdf"));
  EXPECT_EQ(read.facts().majority, "ROW_MAJOR");
  const Variable temperature = read.variable("Temperature");
  EXPECT_EQ(read.recordCount(temperature), 24);
  EXPECT_EQ(shown(read.read(temperature, Slab::ofRecords(temperature, 0, 1))),
            "single 2x2 [20 21.7000008 19.2000008 20.7000008]");
  const Variable time = read.variable("Time");
  EXPECT_EQ(shown(read.read(time, Slab::ofRecords(time, 20, 3, 1))), "int32 3x1 [2000 2100 2200]");
  EXPECT_EQ(shown(read.read(time, Slab::ofRecords(time, 1, 3, 10))), "int32 3x1 [100 1100 2100]");
}

TEST_F(FileReadingTest, ReadsVariablesWithoutDimensionsAndRecords) {
  const Given file = byCommands();
  const Given scalar = variable(file, {.datatype = 22, .name = "scalar", .recordsVary = false});
  put(file, scalar, 0, Array::scalar(2.5));
  variable(file, {.datatype = 22, .sizes = {3}, .name = "numbers"});
  variable(file, {.datatype = 51, .sizes = {3}, .elements = 4, .name = "texts"});
  variable(file, {.datatype = 32, .name = "times"});
  finish(file);
  File read = open();
  EXPECT_EQ(shown(read.read(read.variable("scalar"))), "double 1x1 [2.5]");
  EXPECT_EQ(shown(read.read(read.variable("numbers"))), "double 3x0 []");
  EXPECT_EQ(shown(read.read(read.variable("texts"))), "char 4x3x0 ''");
  EXPECT_EQ(shown(read.read(read.variable("times"))), "double 2x0 []");
}

TEST_F(FileReadingTest, ReadsSparseRecords) {
  const Given file = byCommands();
  const Given number = variable(file, {.datatype = 4});
  results("setVarPadValue", {file, number, Array::scalar(std::int32_t{-9})});
  results("setVarSparseRecords", {file, number, 1});
  put(file, number, 0, rowOf<std::int32_t>({1}));
  put(file, number, 3, rowOf<std::int32_t>({4}));
  finish(file);
  File read = open();
  const Variable found = read.variable("v");
  EXPECT_EQ(read.sparseRecords(found), "PAD_SPARSERECORDS");
  EXPECT_EQ(shown(read.padValue(found)), "int32 1x1 [-9]");
  EXPECT_EQ(read.recordCount(found), 4);
  EXPECT_EQ(read.recordsWritten(found), 2);
  EXPECT_EQ(shown(read.read(found)), "int32 4x1 [1 -9 -9 4]");
}

TEST_F(FileReadingTest, ReadsIntoMemoryOfTheCaller) {
  const Given file = byCommands();
  const Given number = variable(file, {.datatype = 4, .sizes = {2, 3}});
  for (int record = 0; record < 3; ++record) {
    const auto base = static_cast<std::int32_t>(10 * record);
    put(file, number, record,
        rowOf<std::int32_t>({base, base + 1, base + 2, base + 3, base + 4, base + 5}));
  }
  finish(file);
  File read = open();
  const Variable found = read.variable("v");
  std::vector<std::int32_t> memory(18);
  read.readInto(found, Slab::ofRecords(found, 0, 3), std::as_writable_bytes(std::span(memory)));
  EXPECT_THAT(memory,
              ElementsAre(0, 1, 2, 3, 4, 5, 10, 11, 12, 13, 14, 15, 20, 21, 22, 23, 24, 25));
  memory.resize(4);
  read.readInto(found, {0, 2, {1, 0}, {1, 2}, 2, {1, 2}},
                std::as_writable_bytes(std::span(memory)));
  EXPECT_THAT(memory, ElementsAre(1, 5, 21, 25));
}

TEST_F(FileReadingTest, ReadsRecordsThatAreTooLargeForOnePiece) {
  constexpr std::size_t kSize = 1200;  // 1.44 million values in a record
  const Given file = byCommands();
  const Given number = variable(file, {.datatype = 4, .sizes = {kSize, kSize}});
  std::vector<std::int32_t> values(kSize * kSize);
  for (std::size_t i = 0; i < values.size(); ++i)
    values[i] = static_cast<std::int32_t>(i);
  for (const int record : {0, 1}) {
    put(file, number, record, Array::row(std::span<const std::int32_t>(values)));
    values.front() = -1;
  }
  finish(file);
  File read = open();
  const Variable found = read.variable("v");
  std::vector<std::int32_t> memory(2 * values.size());
  read.readInto(found, Slab::ofRecords(found, 0, 2), std::as_writable_bytes(std::span(memory)));
  EXPECT_TRUE(std::equal(values.begin(), values.end(), memory.begin() + kSize * kSize));
  values.front() = 0;
  EXPECT_TRUE(std::equal(values.begin(), values.end(), memory.begin()));
}

TEST_F(FileReadingTest, TellsWhatTheFileIs) {
  File read = open(distributionSample("example1.cdf"));
  const auto facts = read.facts();
  EXPECT_EQ(facts.format, "SINGLE_FILE");
  EXPECT_EQ(facts.majority, "ROW_MAJOR");
  EXPECT_EQ(facts.checksum, "NO_CHECKSUM");
  EXPECT_EQ(facts.compression.type, "NO_COMPRESSION");
  EXPECT_EQ(facts.globalAttributes, static_cast<std::size_t>(read.number("getNumgAttributes")));
  EXPECT_EQ(facts.records, static_cast<std::int64_t>(read.number("getVarsMaxWrittenRecNum")) + 1);
  EXPECT_EQ(read.text("getFormat"), "SINGLE_FILE");
}

TEST_F(FileReadingTest, ReadsTexts) {
  const Given file = byCommands();
  const Given number = variable(file, {.datatype = 51, .sizes = {2}, .elements = 3});
  put(file, number, 0,
      Array::fromNarrow("ab \xE9"
                        "de"));
  finish(file);
  File read = open();
  const Array values = read.read(read.variable("v"));
  EXPECT_THAT(::ambrix::textsOf(values, 3), ElementsAre("ab ",
                                                        "\xE9"
                                                        "de"));
  EXPECT_EQ(::ambrix::bytesOf(values),
            "ab \xE9"
            "de");
  EXPECT_THAT(::ambrix::textsOf(Array::fromNarrow(""), 0), ElementsAre(""));
}

}  // namespace
}  // namespace ambrix_test
