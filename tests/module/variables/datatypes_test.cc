// Values of every datatype: written by each writer, in both majorities, read by each reader.
#include "tests/support/datatypes.h"

#include <cstring>

#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

struct Datatype {
  long code;
  Given values;       // two values
  const char* texts;  // as shown
  std::string bytes;  // as they stand in the file
};

template <typename T>
Datatype numbers(long code, std::initializer_list<T> values, const char* texts) {
  return {code, Array::row<T>(values), texts, bytesOf<T>(values)};
}

std::vector<Datatype> datatypes() {
  return {
      numbers<std::int8_t>(1, {-128, 127}, "[-128 127]"),
      numbers<std::int16_t>(2, {-32768, 32767}, "[-32768 32767]"),
      numbers<std::int32_t>(4, {-2147483647 - 1, 2147483647}, "[-2147483648 2147483647]"),
      numbers<std::uint8_t>(11, {200, 255}, "[200 255]"),
      numbers<std::uint16_t>(12, {40000, 65535}, "[40000 65535]"),
      numbers<std::uint32_t>(14, {3000000000, 4294967295}, "[3000000000 4294967295]"),
      numbers<float>(21, {1.5F, -2.25F}, "[1.5 -2.25]"),
      numbers<double>(22, {1e300, -0.1}, "[1.0000000000000001e+300 -0.10000000000000001]"),
      numbers<double>(31, {63113904000000.0, 62167219200000.0}, "[63113904000000 62167219200000]"),
      numbers<double>(32, {63113904000.0, 123456789012.0, 63113904001.0, 5.0},
                      "[63113904000 123456789012 63113904001 5]"),
      numbers<std::int8_t>(41, {-1, 1}, "[-1 1]"),
      numbers<float>(44, {3.25F, 1e30F}, "[3.25 1.00000002e+30]"),
      numbers<double>(45, {0.5, -7}, "[0.5 -7]"),
      {51, "xY", "'xY'", "xY"},
      {52, Array::text(u"\u00E9\u007F"), "'\\xFFE9\\x7F'", "\xE9\x7F"},
  };
}

std::string classOf(const Datatype& datatype) {
  return findCdfDatatype(datatype.code)->className;
}

class DatatypesTest : public ModuleTest {
 protected:
  /// A file of either majority with a variable of two values for each datatype.
  Given fileOfAll(bool rowMajor) {
    const Given file = rowMajor ? create() : createColumnMajor();
    for (const Datatype& datatype : datatypes()) {
      const std::string name = "v" + std::to_string(datatype.code);
      createVar(file, {.datatype = datatype.code, .sizes = {2}, .name = name.c_str()});
    }
    return file;
  }

  /// How a record of two values reads: pairs keep theirs in the first dimension.
  static std::string record(const Datatype& datatype) {
    return std::string(classOf(datatype)) + (datatype.code == 32 ? " 2x2 " : " 2x1 ") +
           datatype.texts;
  }
};

TEST_F(DatatypesTest, NoneIsLeftOut) {
  EXPECT_TRUE(
      std::ranges::equal(datatypes(), kCdfDatatypes, {}, &Datatype::code, &CdfDatatype::code));
}

TEST_F(DatatypesTest, RecordsComeBackWholeAndStandInTheFileAsTheyAre) {
  for (const bool rowMajor : {true, false}) {
    Given file = fileOfAll(rowMajor);
    double variable = 0;
    for (const Datatype& datatype : datatypes())
      EXPECT_EQ(does("putVarRecordData", {file, variable++, 0, datatype.values}), "done");
    file = reopen(file);
    const std::string content = fileBytes("new.cdf");
    variable = 0;
    for (const Datatype& datatype : datatypes()) {
      EXPECT_EQ(does("getVarRecordData", {file, variable++, 0}), record(datatype));
      EXPECT_THAT(content, testing::HasSubstr(datatype.bytes)) << datatype.code;
    }
    results("delete", {file});
  }
}

TEST_F(DatatypesTest, HyperslabsComeBackWhole) {
  for (const bool rowMajor : {true, false}) {
    Given file = fileOfAll(rowMajor);
    double variable = 0;
    for (const Datatype& datatype : datatypes()) {
      EXPECT_EQ(does("hyperPutVarData", {file, variable++, 1, 1, 1, 0, 2, 1, datatype.values}),
                "done");
    }
    file = reopen(file);
    variable = 0;
    for (const Datatype& datatype : datatypes()) {
      const bool leading = datatype.code == 32 || datatype.code == 51 || datatype.code == 52;
      const char* size = datatype.code == 32 ? " 2x2 " : leading ? " 1x2 " : " 2x1 ";
      EXPECT_EQ(does("hyperGetVarData", {file, variable++, 1, 1, 1, 0, 2, 1}),
                classOf(datatype) + (size + std::string(datatype.texts)));
    }
    results("delete", {file});
  }
}

TEST_F(DatatypesTest, SingleValuesComeBackInTheirPlaces) {
  Given file = fileOfAll(true);
  double variable = 0;
  for (const Datatype& datatype : datatypes()) {
    results("putVarRecordData", {file, variable, 0, datatype.values});
    const Array second = result("getVarData", {file, variable, 0, 1});
    results("putVarData", {file, variable, 1, 1, second.clone()});
    results("putVarData", {file, variable, 1, 0, result("getVarData", {file, variable, 0, 0})});
    EXPECT_EQ(does("getVarRecordData", {file, variable, 1}), record(datatype));
    EXPECT_THAT(second.size(), testing::ElementsAre(datatype.code == 32 ? 2 : 1, 1));
    ++variable;
  }
}

TEST_F(DatatypesTest, AllBitPatternsPassUnchanged) {
  const Given file = create();
  createVar(file, {.datatype = 45, .sizes = {5}});
  const std::vector<double> values = {NAN, HUGE_VAL, -HUGE_VAL, -0.0, 5e-324};
  results("putVarRecordData", {file, 0, 0, Array::row<double>(values)});
  const Array back = result("getVarRecordData", {reopen(file), 0, 0});
  EXPECT_EQ(std::memcmp(back.bytes().data(), values.data(), 40), 0);
}

TEST_F(DatatypesTest, AnInt8ArrayServesBothItsDatatypes) {
  const Given file = create();
  createVar(file, {.datatype = 1, .name = "a"});
  createVar(file, {.datatype = 41, .name = "b"});
  for (const double variable : {0, 1}) {
    EXPECT_EQ(does("putVarData", {file, variable, 0, {}, row<std::int8_t>({-9})}), "done");
    EXPECT_EQ(does("getVarData", {file, variable, 0}), "int8 1x1 [-9]");
  }
}

TEST_F(DatatypesTest, ValuesOfEveryEncodingAreThoseOfTheOriginal) {
  AMBRIX_NEED_SAMPLE(original, "nasajava_test.cdf");
  AMBRIX_NEED_SAMPLE(folder, "encodings");
  const Given first = open(original);
  for (const char* encoding :
       {"alphaosf1", "alphavmsi", "decstation", "hp", "ibmrs", "next", "sgi", "sun"}) {
    const Given other = open(folder + "/alltypes_" + encoding + ".cdf");
    for (const char* name : {"Latitude", "Latitude1", "Longitude", "Longitude1", "Delta", "volume",
                             "Time", "Name", "Temp1", "dp", "ep", "ep16"}) {
      EXPECT_EQ(does("getVarRecordData", {other, number("getVarNum", {other, name}), 0}),
                does("getVarRecordData", {first, number("getVarNum", {first, name}), 0}))
          << encoding << ' ' << name;
    }
  }
}

TEST_F(DatatypesTest, ValuesOfOthersAreKnown) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const auto record = [&](const char* name, double number_) {
    return does("getVarRecordData", {others, number("getVarNum", {others, name}), number_});
  };
  EXPECT_EQ(record("Latitude", 0), "int8 3x1 [1 2 3]");
  EXPECT_EQ(record("Latitude1", 2), "uint8 3x1 [100 128 255]");
  EXPECT_EQ(record("Longitude", 0), "int16 3x1 [100 200 300]");
  EXPECT_EQ(record("Longitude1", 3), "uint16 3x1 [32767 65534 65535]");
  EXPECT_EQ(record("Delta", 2), "int32 2x3 [90 95 96 97 32767 -32768]");
  EXPECT_EQ(record("Time", 4), "uint32 2x3 [90 95 96 97 2147483648 4294967295]");
  EXPECT_EQ(record("Temp1", 2), "single 3x1 [10.5 10.6000004 10.6999998]");
  EXPECT_EQ(record("dp", 5),
            "double 3x1 [333.33300000000003 444.44400000000002 555.55499999999995]");
  EXPECT_EQ(record("Temperature2", 0), "single 1x1 [77.7699966]");
}

}  // namespace
}  // namespace ambrix_test
