// Attributes, their entries, and the description of a whole file.
#include <dlfcn.h>

#include <cstdlib>
#include <optional>
#include <stdexcept>

#include "tests/file_layer/file_layer_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::Field;
using testing::IsEmpty;

class FileAttributesTest : public FileLayerTest {
 protected:
  void SetUp() override {
    File file = create();
    for (const char* const name : {"a", "b", "c"})
      file.createVariable({.name = name, .datatype = Datatype::kReal4});
    file.close();
  }
};

TEST_F(FileAttributesTest, SetsAndReadsEntries) {
  File file = open("new", Access::kWrite);
  const Variable b = file.variable("b");
  file.setAttribute("Title", "first");
  file.setAttribute("Title", "third", 2);
  file.setAttribute("Version", Datatype::kInt2, rowOf<std::int16_t>({3, 9}));
  file.setAttribute(b, "UNITS", "nT");
  file.setAttribute(b, "FILLVAL", Datatype::kReal4, Array::scalar(-0.5F));
  file.close();

  File read = open();
  EXPECT_EQ(read.attributeCount(), 4);
  const Attribute title = read.attribute("Title");
  EXPECT_TRUE(title.global);
  EXPECT_EQ(title.maxEntry, 2);
  EXPECT_THAT(read.entries(title), ElementsAre(Field(&Entry::number, 0), Field(&Entry::number, 2)));
  EXPECT_EQ(shown(read.value(title, 2)), "char 1x5 'third'");
  const Entry version = read.entry(read.attribute("Version"), 0);
  EXPECT_EQ(version.datatype, Datatype::kInt2);
  EXPECT_EQ(version.elements, 2);
  EXPECT_FALSE(read.attribute("UNITS").global);
  EXPECT_EQ(shown(*read.attributeValue(b, "UNITS")), "char 1x2 'nT'");
  EXPECT_EQ(shown(*read.attributeValue(b, "FILLVAL")), "single 1x1 [-0.5]");
  EXPECT_FALSE(read.attributeValue(read.variable("a"), "UNITS"));
  EXPECT_FALSE(read.attributeValue(b, "Title"));
  EXPECT_FALSE(read.attributeValue(b, "nothing"));
}

TEST_F(FileAttributesTest, ChangesAndDeletesThem) {
  File file = open("new", Access::kWrite);
  const Variable a = file.variable("a");
  file.setAttribute(a, "UNITS", "nT");
  file.setAttribute(a, "UNITS", "pT or less");
  EXPECT_EQ(shown(*file.attributeValue(a, "UNITS")), "char 1x10 'pT or less'");
  file.deleteEntry(file.attribute("UNITS"), a.number);
  EXPECT_FALSE(file.attributeValue(a, "UNITS"));
  file.setAttribute("Title", "x");
  file.renameAttribute(file.attribute("Title"), "Name");
  EXPECT_FALSE(file.findAttribute("Title"));
  file.deleteEntry(file.attribute("Name"), 0);
  EXPECT_THAT(file.entries(file.attribute("Name")), IsEmpty());
  file.deleteAttribute(file.attribute("UNITS"));
  EXPECT_EQ(file.attributeCount(), 1);
}

TEST_F(FileAttributesTest, AnAttributeOfTheOtherScopeIsRefused) {
  File file = open("new", Access::kWrite);
  const Variable a = file.variable("a");
  file.setAttribute("Title", "x");
  file.setAttribute(a, "UNITS", "nT");
  EXPECT_EQ(errorOf([&] { file.setAttribute(a, "Title", "y"); }),
            "ambrix:wrongScope: new: attribute \"Title\" is a global one, or choose another name");
  EXPECT_EQ(
      errorOf([&] { file.setAttribute("UNITS", "y"); }),
      "ambrix:wrongScope: new: attribute \"UNITS\" is one of variables; name the variable, or "
      "choose another name");
}

TEST_F(FileAttributesTest, FindsEntriesWhoseNumbersLieFarApart) {
  File file = open("new", Access::kWrite);
  for (const std::size_t number : {0UL, 7UL, 20000UL, 1200000UL})
    file.setAttribute("Title", "x", number);
  const Attribute title = file.attribute("Title");
  EXPECT_EQ(errorOf([&] { file.entries(title); }),
            "ambrix:noScratchCopy: new: the file has entries with numbers far apart, and to look "
            "for them it must be opened for reading");
  file.close();
  std::filesystem::create_directory("scratch");
  File read = File::open(module, "new", {.scratchFolder = "scratch"});
  std::vector<std::size_t> numbers;
  read.forEachEntry(title, [&](const Entry& entry) { numbers.push_back(entry.number); });
  EXPECT_THAT(numbers, ElementsAre(0, 7, 20000, 1200000));
  EXPECT_EQ(read.describeAttribute(title.number).entries.size(), 4);
  EXPECT_TRUE(std::filesystem::is_empty("scratch"));
  std::filesystem::remove("scratch");
  EXPECT_THAT(errorOf([&] { read.entries(title); }),
              testing::StartsWith("ambrix:noScratchCopy: new: the file has entries with numbers "
                                  "far apart, and no copy can be made in scratch"));
}

TEST_F(FileAttributesTest, FindsThemWhereverTheProgramHasGone) {
  File file = open("new", Access::kWrite);
  file.setAttribute("Title", "x", 1200000);
  file.close();
  File read = open();
  std::filesystem::create_directory("elsewhere");
  std::filesystem::current_path("elsewhere");
  EXPECT_EQ(read.entries(read.attribute("Title")).size(), 1);
  std::filesystem::current_path("..");
  const char* const before = std::getenv("TMPDIR");
  const std::string kept = before == nullptr ? "/tmp" : before;
  ::setenv("TMPDIR", "absent", 1);
  EXPECT_THAT(errorOf([&] { read.entries(read.attribute("Title")); }),
              testing::StartsWith("ambrix:noScratchCopy: new: "));
  ::setenv("TMPDIR", kept.c_str(), 1);
}

TEST_F(FileAttributesTest, DescribesAWholeFile) {
  File file = open("new", Access::kWrite);
  const Variable c = file.variable("c");
  file.write(c, rowOf<float>({1, 2}));
  file.setAttribute("Title", "x");
  file.setAttribute(c, "VALIDMIN", Datatype::kReal4, Array::scalar(1.5F));
  file.close();
  const auto found = open().describe();
  EXPECT_EQ(found.facts.globalAttributes, 1);
  EXPECT_EQ(found.facts.records, 2);
  ASSERT_EQ(found.variables.size(), 3);
  EXPECT_EQ(found.variables[2].definition.name, "c");
  EXPECT_EQ(found.variables[2].records, 2);
  EXPECT_EQ(found.variables[1].records, 0);
  EXPECT_EQ(found.variables[2].sparseRecords, "NO_SPARSERECORDS");
  EXPECT_EQ(found.variables[2].padValue.classId(), ClassId::kSingle);
  ASSERT_EQ(found.attributes.size(), 2);
  EXPECT_EQ(shown(found.attributes[0].entries.at(0).value), "char 1x1 'x'");
  EXPECT_EQ(found.attributes[1].attribute.name, "VALIDMIN");
  ASSERT_EQ(found.attributes[1].entries.size(), 1);
  EXPECT_EQ(found.attributes[1].entries[0].entry.number, 2);
  EXPECT_EQ(shown(found.attributes[1].entries[0].value), "single 1x1 [1.5]");
}

/// The module as it is, but counted.
using EntryPoint = ::ambrix::Module::EntryPoint;
EntryPoint realEntryPoint = nullptr;
int callCount = 0;

void countedEntryPoint(int outputCount, qvArray* outputs[], int inputCount,
                       const qvArray* inputs[]) {
  ++callCount;
  realEntryPoint(outputCount, outputs, inputCount, inputs);
}

class CountedModule {
 public:
  CountedModule() : library_(dlopen(::ambrix::defaultModulePath().c_str(), RTLD_NOW)) {
    if (library_ == nullptr) throw std::runtime_error(dlerror());
    realEntryPoint = reinterpret_cast<EntryPoint>(dlsym(library_, "qvhFunction"));
    module_.emplace(countedEntryPoint);
  }
  CountedModule(const CountedModule&) = delete;
  CountedModule& operator=(const CountedModule&) = delete;
  ~CountedModule() {
    module_.reset();
    dlclose(library_);
  }

  int callsToDescribe(const char* name) {
    File file = File::open(*module_, name);
    callCount = 0;
    (void)file.describe();
    return callCount;
  }

 private:
  void* library_;
  std::optional<::ambrix::Module> module_;
};

/// Gives variables "a" and "c" of a file the attribute, and "b" not.
void setForTwo(File& file, const char* attribute) {
  for (const char* const name : {"a", "c"})
    file.setAttribute(file.variable(name), attribute, "x");
}

TEST_F(FileAttributesTest, TriesNoNumbersThatAttributesOfTheSameVariablesLack) {
  std::filesystem::copy_file("new.cdf", "more.cdf");
  File one = open("new", Access::kWrite);
  setForTwo(one, "first");
  one.close();
  File three = open("more", Access::kWrite);
  for (const char* const attribute : {"first", "second", "third"})
    setForTwo(three, attribute);
  three.close();
  module.unload();
  CountedModule counted;
  // Of each attribute more: what it is, how many entries it has, and two calls for each of these.
  EXPECT_EQ(counted.callsToDescribe("more") - counted.callsToDescribe("new"), 2 * (2 + 2 * 2));
}

}  // namespace
}  // namespace ambrix_test
