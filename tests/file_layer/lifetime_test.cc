// Errors, closing, observers.
#include <sys/wait.h>
#include <unistd.h>

#include "tests/file_layer/file_layer_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class FileLifetimeTest : public FileLayerTest {
 protected:
  void SetUp() override {
    File file = create();
    variable_ = file.createVariable({.name = "Flux", .datatype = Datatype::kInt4, .sizes = {2}});
    file.write(variable_, rowOf<std::int32_t>({1, 2}));
    file.setAttribute("Title", "x");
    file.close();
  }

  Variable variable_;
};

TEST_F(FileLifetimeTest, NamesTheFileAndWhatItHas) {
  File file = open("./new");
  EXPECT_EQ(errorOf([&] { file.variable("flux"); }),
            "ambrix:noSuchVariable: ./new: there is no variable \"flux\"; the file has \"Flux\"");
  EXPECT_EQ(errorOf([&] { file.attribute("title"); }),
            "ambrix:noSuchAttribute: ./new: there is no attribute \"title\"; the file has "
            "\"Title\"");
  try {
    file.variable("flux");
  } catch (const FileError& error) {
    EXPECT_EQ(error.file(), "./new");
    EXPECT_EQ(error.reason(), "there is no variable \"flux\"; the file has \"Flux\"");
  }
}

TEST_F(FileLifetimeTest, ListsNoMoreNamesThanCanBeRead) {
  File file = create("many");
  EXPECT_EQ(errorOf([&] { file.variable("x"); }),
            "ambrix:noSuchVariable: many: there is no variable \"x\"; the file has none");
  for (int i = 0; i < 21; ++i)
    file.createVariable({.name = "v" + std::to_string(i), .datatype = Datatype::kInt4});
  EXPECT_THAT(errorOf([&] { file.variable("x"); }),
              testing::EndsWith("\"v18\", \"v19\" and others"));
}

TEST_F(FileLifetimeTest, LeavesErrorsOfTheModuleAsTheyAre) {
  EXPECT_EQ(errorOf([&] { open("absent"); }), "TOLVEX:ambrix:cdflib:fileOpenError()");
  EXPECT_EQ(errorOf([&] { create(); }), kCreateError);
  File file = open("new", Access::kWrite);
  EXPECT_EQ(errorOf([&] {
              file.write(variable_, rowOf<double>({1, 2}));
            }),
            cdflib("datatypeMismatch", "double", "CDF_INT4"));
}

TEST_F(FileLifetimeTest, RefusesNamesThatAreNoText) {
  EXPECT_EQ(errorOf([&] { open("\xFF"); }),
            "ambrix:badFileName: \xFF: the name of the file is not valid UTF-8");
}

TEST_F(FileLifetimeTest, RefusesChangesOfAFileOpenedForReading) {
  File file = open();
  const std::string refusal =
      "ambrix:openedForReading: new: the file was opened for reading; open it with Access::kWrite "
      "to change it";
  EXPECT_EQ(errorOf([&] { file.append(variable_, rowOf<std::int32_t>({3, 4})); }), refusal);
  EXPECT_EQ(errorOf([&] { file.setAttribute("Title", "y"); }), refusal);
  EXPECT_EQ(errorOf([&] { file.write(variable_, rowOf<std::int32_t>({})); }), refusal);
  EXPECT_EQ(errorOf([&] { file.deleteRecords(variable_, 0, 0); }), refusal);
  EXPECT_EQ(errorOf([&] { file.remove(); }), refusal);
  EXPECT_EQ(file.text("getReadOnlyMode"), "READONLYon");
  file.close();
  EXPECT_EQ(open("new", Access::kWrite).text("getReadOnlyMode"), "READONLYoff");
}

TEST_F(FileLifetimeTest, RefusesValuesThatDoNotFit) {
  File file = open("new", Access::kWrite);
  EXPECT_EQ(errorOf([&] {
              file.write(variable_, rowOf<std::int32_t>({1, 2, 3}));
            }),
            "ambrix:partOfRecord: new: 3 elements for variable \"Flux\", whose records have 2");
  std::vector<std::byte> memory(9);
  const Slab slab = Slab::ofRecords(variable_, 0, 1);
  const std::string refusal =
      "ambrix:wrongSize: new: the memory for values is of another size than the values";
  EXPECT_EQ(errorOf([&] { file.readInto(variable_, slab, memory); }), refusal);
  memory.resize(7);
  EXPECT_EQ(errorOf([&] { file.readInto(variable_, slab, memory); }), refusal);
}

TEST_F(FileLifetimeTest, HasExtendedDatatypesWhereCommandsAreStrict) {
  File file = create("other");
  const Variable time = file.createVariable({.name = "Epoch", .datatype = Datatype::kTimeTt2000});
  file.setPadValue(time, rowOf<std::int64_t>({INT64_MIN}));
  file.append(time, rowOf<std::int64_t>({INT64_MIN + 1, 536500868184000000, INT64_MAX}));
  file.setAttribute(time, "VALIDMAX", Datatype::kInt8, rowOf<std::int64_t>({9007199254740993}));
  EXPECT_EQ(shown(*file.attributeValue(time, "VALIDMAX")), "int64 1x1 [9007199254740993]");
  const std::string refusal = cdflib("unrecognizedValue", 33, "DATATYPE");
  EXPECT_EQ(errorOf([&] { file.call("inquireVar", {0.0}); }), refusal);
  EXPECT_EQ(errorOf([&] {
              module.call("getVarPadValue", {file.id(), Array::scalar(0.0)});
            }),
            refusal);
  const auto description = file.describe();
  EXPECT_TRUE(description.variables.at(0).definition.supported);
  EXPECT_EQ(shown(description.variables.at(0).padValue), "int64 1x1 [-9223372036854775808]");
  EXPECT_EQ(shown(file.read(time)),
            "int64 3x1 [-9223372036854775807 536500868184000000 9223372036854775807]");
  EXPECT_FALSE(module.extended());
}

TEST_F(FileLifetimeTest, CanBeClosedTwiceAndMoved) {
  File file = open();
  file.close();
  EXPECT_FALSE(file.isOpen());
  file.close();
  const std::string refusal = "ambrix:fileClosed: new: the file is closed; open it again";
  EXPECT_EQ(errorOf([&] { file.variableCount(); }), refusal);
  EXPECT_EQ(errorOf([&] { file.value({}, 0); }), refusal);

  file = open();
  EXPECT_EQ(file.variableCount(), 1);
  File other = std::move(file);
  EXPECT_EQ(errorOf([&] { file.read(variable_); }), refusal);
  EXPECT_EQ(shown(other.read(variable_)), "int32 2x1 [1 2]");
  other = std::move(other);
  EXPECT_TRUE(other.isOpen());
  file.close();
  file = std::move(other);
  EXPECT_EQ(file.variableCount(), 1);
  EXPECT_EQ(file.path(), "new");
}

TEST_F(FileLifetimeTest, ClosesSilentlyWhatIsStillOpen) {
  {
    const File read = open();
    const File written = create("other");
  }
  EXPECT_TRUE(std::filesystem::file_size("other.cdf") > 0);
  module.unload();
  EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(FileLifetimeTest, IsClosedByTheCommandsThatClose) {
  File file = open();
  file.call("close");
  EXPECT_FALSE(file.isOpen());
  file = open("new", Access::kWrite);
  file.call("delete");
  EXPECT_FALSE(file.isOpen());
}

TEST_F(FileLifetimeTest, LeavesAFileToTheProcessThatOpenedIt) {
  File file = create("other");
  const Variable variable = file.createVariable({.name = "v", .datatype = Datatype::kInt4});
  const pid_t child = ::fork();
  if (child == 0) {
    {
      File mine = std::move(file);
      mine.close();
    }
    ::_exit(std::filesystem::file_size("other.cdf") == 0 ? 0 : 1);
  }
  int status = -1;
  ::waitpid(child, &status, 0);
  EXPECT_EQ(status, 0);  // what was created reaches the disk when it is closed
  file.write(variable, rowOf<std::int32_t>({5}));
  file.close();
  EXPECT_EQ(shown(open("other").read(variable)), "int32 1x1 [5]");
}

class Notes : public ::ambrix::FileObserver {
 public:
  void begins(const ::ambrix::Step& step) override {
    steps.push_back(std::to_string(static_cast<int>(step.kind)) + ' ' +
                    std::to_string(step.number) + ' ' + std::string(step.name));
  }
  void failed(const ::ambrix::Error& error) override {
    if (refuses) throw std::runtime_error("instead of " + error.identifier());
  }

  std::vector<std::string> steps;
  bool refuses = false;
};

TEST_F(FileLifetimeTest, TellsItsObserverWhatBegins) {
  Notes notes;
  File file = File::open(module, "new", {.observer = &notes});
  EXPECT_THAT(notes.steps, ElementsAre("0 0 ", "2 0 ", "2 0 Title"));
  notes.steps.clear();
  file.read(file.variable("Flux"));
  EXPECT_THAT(notes.steps, ElementsAre("1 0 ", "3 0 Flux"));
}

TEST_F(FileLifetimeTest, LetsItsObserverReplaceErrors) {
  Notes notes;
  File file = File::open(module, "new", {.observer = &notes});
  EXPECT_THROW(file.call("inquireVar", {9.0}), ::ambrix::Error);
  notes.refuses = true;
  EXPECT_THROW(file.call("inquireVar", {9.0}), std::runtime_error);
  const Attribute title = file.attribute("Title");
  EXPECT_THROW(file.value(title, 3), std::runtime_error);
  EXPECT_THROW(file.entry(title, 3), std::runtime_error);
  EXPECT_FALSE(file.attributeValue(variable_, "UNITS"));
  EXPECT_THROW(File::create(module, "new", {.observer = &notes}), std::runtime_error);
  EXPECT_THAT(file.variables().size(), 1);
}

TEST_F(FileLifetimeTest, ClosesSilentlyWhateverItsObserverThrows) {
  class Thrower : public ::ambrix::FileObserver {
    void failed(const ::ambrix::Error& /*error*/) override { throw 1; }
  } thrower;
  {
    const File file = File::open(module, "new", {.observer = &thrower});
    module.call("close", {file.id()});
  }
  EXPECT_EQ(open().variableCount(), 1);
}

TEST_F(FileLifetimeTest, FindsNoNamesThatThereCannotBe) {
  File opened = open();
  File created = create("other");
  for (File* const file : {&opened, &created}) {
    for (const std::string& name : {std::string(), std::string(" "), std::string(300, 'x')}) {
      EXPECT_FALSE(file->findVariable(name)) << name;
      EXPECT_FALSE(file->findAttribute(name)) << name;
    }
  }
}

}  // namespace
}  // namespace ambrix_test
