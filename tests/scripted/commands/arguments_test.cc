// What is converted of every command's arguments, in which order, and under which label a failure
// is reported.
#include "tests/scripted/commands/command_test.h"

namespace ambrix_test {
namespace {

using ArgumentsOfCommandsTest = CommandTest;

const std::string kNotText = "basic_string::_M_construct null not valid";
const std::string kOutOfBounds = validate("argumentOutOfBounds");

/// What is raised for a cell array in place of an argument.
std::string failureOf(const Argument& argument) {
  switch (argument.conversion) {
    case Conversion::kFile:
      return validate("argumentNotUint64Scalar", argument.label);
    case Conversion::kNumber:
      return notScalar(argument.label.c_str());
    case Conversion::kNumbers:
      return validate("argumentNotDoublePrecision", argument.label);
    default:
      return kNotText;
  }
}

TEST_P(ArgumentsOfCommandsTest, AreConvertedInTheirOrderUnderTheirLabels) {
  const std::vector<Argument>& kinds = GetParam().arguments;
  Arguments given(kinds.size(), Array::cell({1, 1}));
  for (std::size_t i = 0; i < kinds.size(); ++i) {
    if (kinds[i].conversion != Conversion::kOwn) {
      EXPECT_EQ(errorOf(command(), given), failureOf(kinds[i])) << "argument " << i;
    }
    given[i] = exampleOf(kinds[i]);
  }
}

TEST_P(ArgumentsOfCommandsTest, NumbersAreScalarsAndFitInto64Bits) {
  const std::vector<Argument>& kinds = GetParam().arguments;
  for (std::size_t i = 0; i < kinds.size(); ++i) {
    if (kinds[i].conversion != Conversion::kNumber) continue;
    Arguments given = arguments();
    for (const Given& other : {Given{}, Given{1, 2}, Given("x"), Given(Array::scalar(true))}) {
      given[i] = other;
      EXPECT_EQ(errorOf(command(), given), failureOf(kinds[i])) << "argument " << i;
    }
    for (const double number : {1e19, -1e19}) {
      given[i] = number;
      EXPECT_EQ(errorOf(command(), given), kOutOfBounds) << "argument " << i;
    }
  }
}

TEST_P(ArgumentsOfCommandsTest, SoDoNumbersOfVectors) {
  const std::vector<Argument>& kinds = GetParam().arguments;
  for (std::size_t i = 0; i < kinds.size(); ++i) {
    if (kinds[i].conversion != Conversion::kNumbers) continue;
    Arguments given = arguments();
    given[i] = {0, 1e19};
    EXPECT_EQ(errorOf(command(), given), kOutOfBounds) << "argument " << i;
  }
}

TEST_P(ArgumentsOfCommandsTest, AFileIsOneUint64ThatTheModuleHasHandedOut) {
  if (!GetParam().takesFile()) return;
  Arguments given = arguments();
  for (const Given& other : {Given(7), Given(row<std::uint64_t>({7, 7}))}) {
    given[0] = other;
    EXPECT_EQ(errorOf(command(), given), validate("argumentNotUint64Scalar", "CDFID"));
  }
  given[0] = file(8);
  EXPECT_EQ(errorOf(command(), given), cdflib("invalidFileId"));
  EXPECT_THAT(calls(), testing::IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Commands, ArgumentsOfCommandsTest, testing::ValuesIn(commands()), nameOf);

}  // namespace
}  // namespace ambrix_test
