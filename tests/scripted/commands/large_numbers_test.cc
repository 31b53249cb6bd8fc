// The library keeps 32 bits of a number. What does not fit reaches it as a number that it refuses,
// and never as the number that the lower bits make.
#include <sstream>

#include "tests/scripted/commands/command_test.h"

namespace ambrix_test {
namespace {

constexpr long kNoSuchVar = -2019;
constexpr long kBadVarNum = -2041;

class LargeNumbersTest : public CommandTest {
 protected:
  LargeNumbersTest() {
    ::ambrix::setByteLimit(1 << 20);
    fake.endWith("zVAR_ 2147483647", kNoSuchVar);
    fake.endWith("zVAR_ -1", kBadVarNum);
  }
  ~LargeNumbersTest() override { ::ambrix::setByteLimit(SIZE_MAX); }
  void moveAndCompare(std::size_t argument, std::size_t at, double distance);

  std::vector<std::string> usual;  // the words of the calls that succeed
};

std::vector<std::string> wordsOf(const std::vector<std::string>& calls) {
  std::vector<std::string> words;
  for (const std::string& call : calls) {
    std::string text = call;
    for (char& c : text)
      c = c == '[' || c == ']' ? ' ' : c;
    std::istringstream in(text);
    for (std::string word; in >> word;)
      words.push_back(word);
  }
  return words;
}

/// The places of a command's numbers: argument and element.
std::vector<std::pair<std::size_t, std::size_t>> numbersOf(const Command& command) {
  std::vector<std::pair<std::size_t, std::size_t>> places;
  for (std::size_t i = 0; i < command.arguments.size(); ++i) {
    const Conversion conversion = command.arguments[i].conversion;
    if (conversion != Conversion::kNumber && conversion != Conversion::kNumbers) continue;
    for (std::size_t at = 0; at < exampleOf(command.arguments[i]).view().elementCount(); ++at)
      places.emplace_back(i, at);
  }
  return places;
}

/// The argument with one of its numbers moved by a distance that 32 bits do not show.
Given moved(ArrayView argument, std::size_t at, double distance) {
  std::vector<double> numbers(argument.data<double>().begin(), argument.data<double>().end());
  numbers[at] += distance;
  return Array::row(std::span<const double>(numbers));
}

/// What differs from the usual calls, as far as the command came, are numbers that are refused.
void expectRefusedNumbers(const std::vector<std::string>& words,
                          const std::vector<std::string>& usual, std::size_t argument) {
  for (std::size_t i = 0; i < std::min(words.size(), usual.size()); ++i) {
    if (words[i] == usual[i]) continue;
    EXPECT_THAT(words[i], testing::AnyOf("-1", "2147483647")) << "argument " << argument;
  }
}

/// The calls after one number of the argument has been moved.
void LargeNumbersTest::moveAndCompare(std::size_t argument, std::size_t at, double distance) {
  Arguments given = arguments();
  given[argument] = moved(given[argument].view(), at, distance);
  const std::string error = errorOf(command(), given);
  const std::vector<std::string> words = wordsOf(calls());
  EXPECT_TRUE(error != "no error" || words.size() == usual.size()) << "argument " << argument;
  EXPECT_NE(words, usual) << "argument " << argument << " was cut";
  expectRefusedNumbers(words, usual, argument);
}

TEST_P(LargeNumbersTest, NumbersBeyond32BitsNeverReachTheLibraryCut) {
  call("setVarInitialRecs", {file(), 3, 1});  // writers differ before the first to a file
  fake.forgetCalls();
  call(command(), arguments());
  usual = wordsOf(calls());
  for (const auto& [argument, at] : numbersOf(GetParam())) {
    for (const double distance : {4294967296.0, -4294967296.0, 1e15})
      moveAndCompare(argument, at, distance);
  }
}

INSTANTIATE_TEST_SUITE_P(Commands, LargeNumbersTest, testing::ValuesIn(commands()), nameOf);

using KindsOfNumbersTest = ScriptedTest;

TEST_F(KindsOfNumbersTest, EachKindOfNumberIsReplacedByOneOfItsKind) {
  constexpr double kFar = 4294967296.0;
  struct Call {
    const char* command;
    Arguments arguments;
    const char* text;
  };
  const Call replaced[] = {
      {"getVarName", {file(), kFar + 3}, "SELECT_ CDF_ 7 | zVAR_ 2147483647 | GET_ zVAR_NAME_"},
      {"getVarName", {file(), -kFar}, "SELECT_ CDF_ 7 | zVAR_ -1 | GET_ zVAR_NAME_"},
      {"getAttrName", {file(), kFar}, "SELECT_ CDF_ 7 | ATTR_ 2147483647 | GET_ ATTR_NAME_"},
      {"getAttrName", {file(), -kFar}, "SELECT_ CDF_ 7 | ATTR_ -1 | GET_ ATTR_NAME_"},
      {"deleteAttrEntry", {file(), 2, kFar}, "CDFdeleteAttrEntry 7 3 2 -1"},
      {"setFormat", {file(), kFar + 1}, "SELECT_ CDF_ 7 | PUT_ CDF_FORMAT_ -1"},
      {"createAttr", {file(), "a", kFar + 1}, "SELECT_ CDF_ 7 | CREATE_ ATTR_ 'a' -1"},
      // -1 would mean "on" to the library.
      {"setReadOnlyMode", {file(), kFar}, "SELECT_ CDF_ 7 | CDF_READONLY_MODE_ 2147483647"},
      {"setVarCompression",
       {file(), 3, 5, kFar + 6},
       "SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_COMPRESSION_ 5 [-1]"},
      {"deleteVarRecords",
       {file(), 3, 0, kFar},
       "SELECT_ CDF_ 7 | zVAR_ 3 | DELETE_ zVAR_RECORDS_ 0 -1"}};
  for (const auto& [command, arguments, text] : replaced) {
    call(command, arguments);
    EXPECT_EQ(calls().back(), text);
  }
}

TEST_F(KindsOfNumbersTest, TheFirstNumbersBeyondAreReplaced) {
  for (const double first : {2147483648.0, -2147483649.0}) {
    call("setVarBlockingFactor", {file(), 3, first});
    EXPECT_EQ(calls().back(), "SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_BLOCKINGFACTOR_ -1");
  }
}

TEST_F(KindsOfNumbersTest, The32BitNumbersThemselvesPassAsTheyAre) {
  call("setVarBlockingFactor", {file(), 3, 2147483647.0});
  EXPECT_EQ(calls().back(), "SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_BLOCKINGFACTOR_ 2147483647");
  call("setVarBlockingFactor", {file(), 3, -2147483648.0});
  EXPECT_EQ(calls().back(), "SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_BLOCKINGFACTOR_ -2147483648");
}

}  // namespace
}  // namespace ambrix_test
