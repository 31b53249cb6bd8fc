// Files that are damaged, or of a later library.
#include <fstream>

#include "tests/file_layer/file_layer_test.h"
#include "tests/module/support/file_bytes.h"

namespace ambrix_test {
namespace {

using testing::IsEmpty;

/// How far before the name of a variable or an attribute its other facts are in a file.
constexpr std::size_t kDatatypeToName = 64;
constexpr std::size_t kNextToName = 72;
constexpr std::size_t kEntriesToName = 20;
constexpr std::size_t kMaxEntryToName = 8;

/// A place in a file behind its end.
const std::string kFarPlace("\0\0\0\0\x7F\0\0\0", 8);

/// Puts bytes before the name of a variable or an attribute.
void changeBeforeName(const std::string& path, const std::string& name, std::size_t distance,
                      const std::string& bytes) {
  const std::size_t place = fileBytes(path).find(name + '\0');
  std::fstream file(path, std::ios::in | std::ios::out | std::ios::binary);
  file.seekp(static_cast<std::streamoff>(place - distance));
  file << bytes;
}

class DamagedFileTest : public FileLayerTest {
 protected:
  void SetUp() override {
    File file = create();
    variable_ = file.createVariable({.name = "Flux", .datatype = Datatype::kInt4, .sizes = {2}});
    file.write(variable_, rowOf<std::int32_t>({1, 2}));
    file.close();
  }

  /// Lets the module open damaged files.
  void setValidationOff() {
    const double off = ::ambrix::constantValue(module, "VALIDATEFILEOFF");
    module.call("setValidate", {Array::scalar(off)});
  }

  Variable variable_;
};

TEST_F(DamagedFileTest, TellsOfDatatypesThatAreNotKnown) {
  changeBeforeName("new.cdf", "Flux", kDatatypeToName, std::string("\0\0\0\x63", 4));
  EXPECT_EQ(errorOf([&] { open(); }), "TOLVEX:ambrix:cdflib:fileOpenError()");
  setValidationOff();
  File file = open();
  const auto description = file.describe();
  const Variable& found = description.variables.at(0).definition;
  EXPECT_FALSE(found.supported);
  EXPECT_EQ(found.name, "Flux");
  EXPECT_EQ(found.datatype, Datatype{99});
  EXPECT_FALSE(description.variables.at(0).padValue);
  EXPECT_EQ(errorOf([&] { file.read(found); }),
            "ambrix:unsupportedDatatype: new: variable \"Flux\" has the datatype datatype 99, "
            "which is not supported");
  file = open("new", Access::kWrite);
  EXPECT_THAT(errorOf([&] { file.write(found, Slab(), rowOf<double>({1})); }),
              testing::StartsWith("ambrix:unsupportedDatatype"));
  const Variable unknown = {.name = "Flux", .datatype = Datatype{99}};
  EXPECT_THAT(errorOf([&] { file.read(unknown, Slab()); }),
              testing::StartsWith("ambrix:unsupportedDatatype"));
}

/// The place of the next variable becomes one behind the end of the file.
TEST_F(DamagedFileTest, TellsADamagedFileFromOneWithoutTheName) {
  File file = open("new", Access::kWrite);
  file.createVariable({.name = "Next", .datatype = Datatype::kInt4});
  file.close();
  changeBeforeName("new.cdf", "Flux", kNextToName, kFarPlace);
  setValidationOff();
  file = open("new", Access::kWrite);
  EXPECT_THAT(errorOf([&] { file.variable("Next"); }), testing::HasSubstr("libraryFailure"));
}

TEST_F(DamagedFileTest, TellsDamagedEntriesFromMissingOnes) {
  File file = open("new", Access::kWrite);
  file.setAttribute(variable_, "UNITS", "nT");
  file.setAttribute(variable_, "FILLVAL", Datatype::kReal4, Array::scalar(-0.5F));
  file.close();
  changeBeforeName("new.cdf", "UNITS", kEntriesToName, kFarPlace);
  changeBeforeName("new.cdf", "FILLVAL", kMaxEntryToName, "\xFF\xFF\xFF\xF0");
  setValidationOff();
  file = open("new", Access::kWrite);
  EXPECT_EQ(file.attribute("FILLVAL").maxEntry, -1);
  EXPECT_THAT(file.describeAttribute(file.attribute("FILLVAL").number).entries, IsEmpty());
  EXPECT_THAT(errorOf([&] { file.attributeValue(variable_, "UNITS"); }),
              testing::HasSubstr("libraryFailure"));
}

}  // namespace
}  // namespace ambrix_test
