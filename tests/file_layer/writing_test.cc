// New files and changes of files.
#include "tests/file_layer/file_layer_test.h"
#include "tests/module/support/file_bytes.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class FileWritingTest : public FileLayerTest {};

TEST_F(FileWritingTest, WritesValuesOfEveryDatatypeAndReadsThemBack) {
  File file = create();
  for (const auto& facts : ::ambrix::datatypes()) {
    const Variable variable = file.createVariable({.name = std::string(facts.name),
                                                   .datatype = facts.datatype,
                                                   .elements = facts.elements == 0 ? 3U : 1U,
                                                   .sizes = {2}});
    file.write(variable, Array::zeros(facts.classId, {variable.recordElements(), 5}));
  }
  file.close();
  File read = open();
  for (const Variable& variable : read.variables()) {
    EXPECT_EQ(variable.name, ::ambrix::datatypeName(variable.datatype));
    EXPECT_EQ(read.recordCount(variable), 5);
    EXPECT_EQ(read.read(variable).elementCount(), 5 * variable.recordElements());
  }
  EXPECT_EQ(read.variableCount(), 17);
}

TEST_F(FileWritingTest, WritesWhatIsThenInTheFile) {
  for (const char* const majority : {"ROW_MAJOR", "COLUMN_MAJOR"}) {
    File file = create();
    file.setMajority(majority);
    const Variable variable =
        file.createVariable({.name = "v", .datatype = Datatype::kInt4, .sizes = {2, 3}});
    file.write(variable, rowOf<std::int32_t>({101, 102, 103, 104, 105, 106}));
    file.close();
    // Both ways the elements are in the file as they are in the array: it is the order of
    // dimensions that differs.
    EXPECT_THAT(fileBytes("new.cdf"),
                HasSubstr(bytesOf<std::int32_t>({101, 102, 103, 104, 105, 106})))
        << majority;
    const Variable found = open().variable("v");
    EXPECT_THAT(found.sizes, ElementsAre(2, 3));
    EXPECT_EQ(shown(open().read(found)), "int32 2x3 [101 102 103 104 105 106]");
    std::filesystem::remove("new.cdf");
  }
}

TEST_F(FileWritingTest, AppendsRecordsAndWritesSlabs) {
  File file = create();
  const Variable variable =
      file.createVariable({.name = "v", .datatype = Datatype::kInt2, .sizes = {3}});
  file.write(variable, rowOf<std::int16_t>({1, 2, 3, 4, 5, 6}));
  file.append(variable, rowOf<std::int16_t>({7, 8, 9}));
  file.write(variable, rowOf<std::int16_t>({10, 11, 12}), 3);
  file.write(variable, {0, 2, {0}, {2}, 3, {2}}, rowOf<std::int16_t>({-1, -3, -10, -12}));
  file.append(variable, Array::zeros(ClassId::kInt16, {3, 0}));
  file.close();
  File read = open();
  EXPECT_EQ(shown(read.read(variable)), "int16 3x4 [-1 2 -3 4 5 6 7 8 9 -10 11 -12]");
  read.close();
  File again = open("new", Access::kWrite);
  again.deleteRecords(variable, 1, 2);
  again.deleteRecords(variable, 0, 0);
  EXPECT_EQ(shown(again.read(variable)), "int16 3x2 [-1 2 -3 -10 11 -12]");
}

TEST_F(FileWritingTest, WritesFromMemoryOfTheCaller) {
  File file = create();
  const Variable variable =
      file.createVariable({.name = "v", .datatype = Datatype::kReal8, .sizes = {2}});
  const std::vector<double> memory = {1, 2, 3, 4};
  file.write(variable, Array::borrowed(std::span<const double>(memory), {2, 2}));
  EXPECT_EQ(shown(file.read(variable)), "double 2x2 [1 2 3 4]");
}

TEST_F(FileWritingTest, MakesSettingsOfFilesAndVariables) {
  File file = create();
  file.setFormat("SINGLE_FILE");
  file.setMajority("COLUMN_MAJOR");
  file.setChecksum("MD5_CHECKSUM");
  const Variable a = file.createVariable({.name = "a",
                                          .datatype = Datatype::kInt4,
                                          .sizes = {4, 2},
                                          .recordVaries = false,
                                          .varies = {true, false}});
  file.setCompression(a, {"GZIP_COMPRESSION", "7"});
  file.setPadValue(a, Array::scalar(std::int32_t{-4}));
  const Variable b = file.createVariable({.name = "b", .datatype = Datatype::kInt4});
  file.setSparseRecords(b, "PREV_SPARSERECORDS");
  file.setBlockingFactor(b, 50);
  file.setCompression(b, {"RLE_COMPRESSION"});
  file.close();
  File read = open();
  EXPECT_EQ(read.facts().majority, "COLUMN_MAJOR");
  EXPECT_EQ(read.facts().checksum, "MD5_CHECKSUM");
  EXPECT_EQ(read.compression(a).type, "GZIP_COMPRESSION");
  EXPECT_EQ(read.compression(a).parameter, "7");
  EXPECT_EQ(read.compression(b).parameter, "RLE_OF_ZEROs");
  EXPECT_EQ(shown(read.padValue(a)), "int32 1x1 [-4]");
  EXPECT_EQ(read.sparseRecords(b), "PREV_SPARSERECORDS");
  EXPECT_EQ(read.blockingFactor(b), 50);
  EXPECT_FALSE(read.variable("a").recordVaries);
  EXPECT_THAT(read.variable("a").varies, ElementsAre(true, false));
}

TEST_F(FileWritingTest, CompressesWholeFiles) {
  File file = create();
  file.setCompression({"GZIP_COMPRESSION", "9"});
  file.createVariable({.name = "a", .datatype = Datatype::kInt4});
  file.close();
  EXPECT_EQ(open().facts().compression.type, "GZIP_COMPRESSION");
  EXPECT_EQ(open().facts().compression.parameter, "9");
  File other = create("other");
  EXPECT_EQ(errorOf([&] {
              other.setCompression({"GZIP_COMPRESSION", "much"});
            }),
            "ambrix:badSetting: other: \"much\" is no level of compression");
  EXPECT_EQ(errorOf([&] { other.setCompression({"GZIP_COMPRESSION"}); }),
            "TOLVEX:ambrix:cdflib:unspecifiedGzipCompressionLevel()");
  EXPECT_EQ(errorOf([&] { other.setChecksum("ROW_MAJOR"); }),
            "ambrix:badSetting: other: \"ROW_MAJOR\" is no checksum");
  EXPECT_EQ(errorOf([&] { other.setMajority("CDF_INT1"); }),
            "ambrix:badSetting: other: \"CDF_INT1\" is no majority");
  other.setCompression({"HUFF_COMPRESSION"});
  EXPECT_EQ(other.facts().compression.parameter, "OPTIMAL_ENCODING_TREES");
}

TEST_F(FileWritingTest, RenamesAndDeletesVariables) {
  File file = create();
  const Variable a = file.createVariable({.name = "a", .datatype = Datatype::kInt4});
  const Variable b = file.createVariable({.name = "b", .datatype = Datatype::kInt4});
  file.renameVariable(b, "c");
  file.deleteVariable(a);
  EXPECT_EQ(file.variableCount(), 1);
  EXPECT_EQ(file.findVariable("c"), 0);
  EXPECT_FALSE(file.findVariable("b"));
}

TEST_F(FileWritingTest, WritesTexts) {
  File file = create();
  const Variable variable =
      file.createVariable({.name = "v", .datatype = Datatype::kChar, .elements = 4});
  const std::vector<std::string> texts = {"one", "", "\xE9t\xE9!"};
  file.write(variable, ::ambrix::arrayOfTexts(texts, 4));
  file.close();
  File read = open();
  EXPECT_THAT(::ambrix::textsOf(read.read(variable), 4), ElementsAre("one ", "    ", "\xE9t\xE9!"));
  EXPECT_THROW(::ambrix::arrayOfTexts(texts, 3), std::invalid_argument);
}

TEST_F(FileWritingTest, DeletesTheFile) {
  File file = create();
  file.close();
  EXPECT_TRUE(std::filesystem::exists("new.cdf"));
  File again = open("new", Access::kWrite);
  again.remove();
  EXPECT_FALSE(again.isOpen());
  EXPECT_FALSE(std::filesystem::exists("new.cdf"));
}

TEST_F(FileWritingTest, WritesTwoFilesAtOnce) {
  File one = create("one");
  File two = create("two");
  const Variable a = one.createVariable({.name = "a", .datatype = Datatype::kInt4});
  const Variable b = two.createVariable({.name = "b", .datatype = Datatype::kReal8});
  one.write(a, rowOf<std::int32_t>({1}));
  two.write(b, rowOf<double>({2.5}));
  one.append(a, rowOf<std::int32_t>({3}));
  one.close();
  EXPECT_EQ(shown(two.read(b)), "double 1x1 [2.5]");
  two.close();
  File first = open("one");
  File second = open("two");
  EXPECT_EQ(shown(first.read(a)), "int32 2x1 [1 3]");
  EXPECT_EQ(shown(second.read(b)), "double 1x1 [2.5]");
}

}  // namespace
}  // namespace ambrix_test
