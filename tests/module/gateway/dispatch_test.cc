// The entry point: the command's name, the number of arguments, numbers out of range.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using DispatchTest = ModuleTest;

TEST_F(DispatchTest, NamesMustMatchExactly) {
  for (const char* name : {"Open", "open ", " open", "ope", "opens", "OPEN", "\xE9"}) {
    EXPECT_EQ(does(name, {"x"}), cdflib("invalidOperation", std::string(name)));
  }
  EXPECT_EQ(does("", {"x"}), cdflib("invalidOperation", std::string()));
}

TEST_F(DispatchTest, ANameEndsAtItsFirstZero) {
  const Array name = Array::text(std::u16string_view(u"getValidate\0tail", 16));
  EXPECT_EQ(shown(module.call(name)), "char 1x14 'VALIDATEFILEon'");
}

TEST_F(DispatchTest, ANameOfAnyShapeIsReadInStorageOrder) {
  const std::u16string text = u"getValidate";
  const Array column = Array::of<char16_t>(text, {11, 1});
  EXPECT_EQ(shown(module.call(column)), "char 1x14 'VALIDATEFILEon'");
}

TEST_F(DispatchTest, OnlyTheLowByteOfACharacterOfTheNameCounts) {
  const Array name = Array::text(u"\u0167etValidate");  // 0x67 is g
  EXPECT_EQ(shown(module.call(name)), "char 1x14 'VALIDATEFILEon'");
}

TEST_F(DispatchTest, ACommandThatIsNoTextIsALogicError) {
  for (const Array& name : {Array::scalar(5.0), Array::cell({1, 1}), Array::scalar(true)}) {
    try {
      module.call(name);
      ADD_FAILURE() << "no error";
    } catch (const std::logic_error& error) {
      EXPECT_STREQ(error.what(), "basic_string::_M_construct null not valid");
    }
  }
}

TEST_F(DispatchTest, NumbersAreTruncatedTowardZero) {
  const Given file = create();
  createVar(file, {.name = "a"});
  createVar(file, {.name = "b"});
  EXPECT_EQ(does("getVarName", {file, 1.9}), "char 1x1 'b'");
  EXPECT_EQ(does("getVarName", {file, 0.7}), "char 1x1 'a'");
  EXPECT_EQ(does("getVarName", {file, -0.9}), "char 1x1 'a'");
  EXPECT_EQ(does("setValidate", {-1.9}), "done");
}

TEST_F(DispatchTest, NanIsTheMostNegativeNumberAndNoOverflow) {
  const Given file = create();
  createVar(file, {});
  EXPECT_EQ(does("getVarName", {file, NAN}), refused("CDFgetzVarName", kBadVarNum));
}

TEST_F(DispatchTest, TheUnloadHandlerIsRegisteredByACallThatFails) {
  ::ambrix::Module other = std::move(module);
  other.call("create", {Array::fromUtf8("left")});
  EXPECT_THROW(other.call("nonsense"), ::ambrix::Error);
  other.unload();
  module = ::ambrix::Module();
  EXPECT_EQ(other.lastWarnings().size(), 1U);
}

}  // namespace
}  // namespace ambrix_test
