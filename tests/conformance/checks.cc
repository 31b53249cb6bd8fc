// What a module finds by itself in a host that conforms.
#include <bit>
#include <cstdint>
#include <cstring>
#include <exception>

#include "tests/conformance/array_checks.h"
#include "tests/conformance/probe.h"

namespace probe {
namespace {

bool isEmptyMatrix(const qvArray* array) {
  return qvGetDimensions(array)[0] == 0 && qvGetDimensions(array)[1] == 0;
}

void stringsAreRowsOfBytes(Findings& findings) {
  const qvArray* const text = qvCreateString("a\xff");
  findings.expect(qvGetDimensions(text)[0] == 1 && qvGetDimensions(text)[1] == 2, "a row");
  findings.expect(qvGetReadOnlyChars(text)[1] == u'\xff', "the byte b as the unit b");
  findings.expect(isEmptyMatrix(qvCreateString("")), "an empty text is 0-by-0");
}

void narrowCopiesKeepTheLowBits(Findings& findings) {
  const std::size_t sizes[] = {1, 2};
  qvArray* const array = qvCreateCharArray(2, sizes);
  qvGetChars(array)[0] = u'\xff';
  qvGetChars(array)[1] = u'\u0161';
  char* const copy = qvArrayToString(array);
  findings.expect(copy == std::string_view("\xff\x61"), "the low 8 bits of each unit");
  qvFree(copy);
  char* const empty = qvArrayToString(qvCreateString(""));
  findings.expect(empty == std::string_view(), "an empty text");
  qvFree(empty);
}

void plainFileNamesStayAsTheyAre(Findings& findings) {
  char* const name = qvUtf16ToNarrow(u"folder/a b.cdf", 14);
  findings.expect(name == std::string_view("folder/a b.cdf"), "ASCII");
  qvFree(name);
}

void buffersAreAligned(Findings& findings) {
  for (const std::size_t bytes : {0U, 1U, 100U, 10'000'000U}) {
    void* const memory = qvMalloc(bytes);
    findings.expect(memory != nullptr, "never null");
    findings.expect(std::bit_cast<std::uintptr_t>(memory) % alignof(std::max_align_t) == 0,
                    "aligned");
    std::memset(memory, 1, bytes);
    if (bytes != 100) qvFree(memory);  // one is left to the host
  }
  qvFree(nullptr);
}

void messagesHaveTexts(Findings& findings) {
  std::string text;
  qvGetMessageText({"TEST:probe", "told", {-5, "n%s", u"\u20ac"}}, text);
  findings.expect(text == "TEST:probe:told: -5, n%s, \xe2\x82\xac", text);
  qvGetMessageText({"TOLVEX:host", "outOfMemory"}, text);
  findings.expect(!text.empty() && !text.starts_with("TOLVEX"), text);
}

void extendedDatatypesAreAskedFor(Findings& findings) {
  if (qvOffersExtendedDatatypes == nullptr) return;
  findings.expect(!qvOffersExtendedDatatypes(), "they are offered to those who did not ask");
}

struct Check {
  const char* name;
  void (*run)(Findings&);
};

constexpr Check kChecks[] = {
    {"sizes follow the rules", sizesFollowTheRules},
    {"numbers have their class and are 0", numbersHaveTheirClass},
    {"unset numbers can be written", unsetNumbersCanBeWritten},
    {"logicals are bytes", logicalsAreBytes},
    {"characters have 16 bits", charactersHave16Bits},
    {"strings are rows of bytes", stringsAreRowsOfBytes},
    {"scalars keep their value", scalarsKeepTheirValue},
    {"accessors of other classes give null", accessorsOfOtherClassesGiveNull},
    {"cells hold arrays", cellsHoldArrays},
    {"only real numbers are numeric", onlyRealNumbersAreNumeric},
    {"narrow copies keep the low bits", narrowCopiesKeepTheLowBits},
    {"plain file names stay as they are", plainFileNamesStayAsTheyAre},
    {"buffers are aligned", buffersAreAligned},
    {"messages have texts", messagesHaveTexts},
    {"extended datatypes are asked for", extendedDatatypesAreAskedFor},
};

std::string findingsOf(const Check& check) {
  Findings findings;
  try {
    check.run(findings);
  } catch (const std::exception& failure) {
    findings.expect(false, failure.what());
  }
  return findings.text();
}

}  // namespace

void runChecks(const Call& call) {
  std::vector<std::string> names;
  std::vector<std::string> findings;
  for (const Check& check : kChecks) {
    names.emplace_back(check.name);
    findings.push_back(findingsOf(check));
  }
  call.outputs[0] = textColumn(names);
  call.outputs[1] = textColumn(findings);
}

}  // namespace probe
