// A module that shows its host from the inside. Every host runs its checks, its refusals and its
// samples (see probe.h); the other commands are for what differs from host to host: what arguments
// look like, and what becomes of results, messages and exceptions.
#include <algorithm>
#include <cstdint>
#include <new>
#include <span>
#include <stdexcept>
#include <string>
#include <vector>

#include "host/qvh.h"
#include "tests/conformance/probe.h"

namespace {

using probe::Call;
using probe::doubles;
using TOLVEX::ambrix::MessageId;

std::vector<std::size_t> sizesOf(const qvArray* array) {
  std::vector<std::size_t> sizes;
  for (const double size : doubles(array))
    sizes.push_back(static_cast<std::size_t>(static_cast<std::ptrdiff_t>(size)));
  return sizes;
}

std::u16string unitsOf(const qvArray* array) {
  std::u16string units;
  for (const double unit : doubles(array))
    units += static_cast<char16_t>(unit);
  return units;
}

qvArray* row(std::span<const double> values) {
  qvArray* const array = qvCreateNumericMatrix(1, values.size(), qvDOUBLE_CLASS, qvREAL);
  std::ranges::copy(values, static_cast<double*>(qvGetData(array)));
  return array;
}

// --- What arguments are ---------------------------------------------------------------------

void inspect(const Call& call) {
  const qvArray* const array = call.arguments[0];
  const std::span sizes(qvGetDimensions(array), qvGetNumberOfDimensions(array));
  call.outputs[0] = qvCreateDoubleScalar(qvGetClassID(array));
  call.outputs[1] = qvCreateString(qvGetClassName(array));
  call.outputs[2] = qvCreateDoubleScalar(static_cast<double>(qvGetNumberOfElements(array)));
  call.outputs[3] = row(std::vector<double>(sizes.begin(), sizes.end()));
  call.outputs[4] = qvCreateDoubleScalar(qvGetReadOnlyData(array) != nullptr ? 1 : 0);
}

void units(const Call& call) {
  const qvArray* const text = call.arguments[0];
  const std::span shown(qvGetReadOnlyChars(text), qvGetNumberOfElements(text));
  call.outputs[0] = row(std::vector<double>(shown.begin(), shown.end()));
}

/// The class numbers of what a cell array holds, and of what is behind its end.
void cells(const Call& call) {
  std::vector<double> classes;
  for (std::size_t i = 0; i <= qvGetNumberOfElements(call.arguments[0]); ++i) {
    const qvArray* const cell = qvGetCell(call.arguments[0], i);
    classes.push_back(cell == nullptr ? -1 : qvGetClassID(cell));
  }
  call.outputs[0] = row(classes);
}

// --- What becomes of results ----------------------------------------------------------------

void zeros(const Call& call) {
  const auto sizes = sizesOf(call.arguments[0]);
  const auto classId = static_cast<qvClassID>(doubles(call.arguments[1])[0]);
  const auto complexity = static_cast<qvComplexity>(doubles(call.arguments[2])[0]);
  call.outputs[0] = qvCreateNumericArray(sizes.size(), sizes.data(), classId, complexity);
}

void falses(const Call& call) {
  const auto sizes = sizesOf(call.arguments[0]);
  call.outputs[0] = qvCreateLogicalArray(sizes.size(), sizes.data());
}

void text(const Call& call) {
  const std::u16string wanted = unitsOf(call.arguments[0]);
  const std::size_t sizes[] = {1, wanted.size()};
  call.outputs[0] = qvCreateCharArray(2, sizes);
  std::ranges::copy(wanted, qvGetChars(call.outputs[0]));
  char* const copy = qvArrayToString(call.outputs[0]);
  call.outputs[1] = qvCreateString(copy);
  qvFree(copy);
}

void narrow(const Call& call) {
  const std::u16string wanted = unitsOf(call.arguments[0]);
  char* const copy = qvUtf16ToNarrow(wanted.data(), wanted.size());
  call.outputs[0] = copy == nullptr ? qvCreateDoubleScalar(-1) : qvCreateString(copy);
  qvFree(copy);
}

/// {7, "text"; {int8 (0)}, not set}
void nested(const Call& call) {
  qvArray* const inner = qvCreateCellMatrix(1, 1);
  qvSetCell(inner, 0, qvCreateNumericMatrix(1, 1, qvINT8_CLASS, qvREAL));
  qvArray* const outer = qvCreateCellMatrix(2, 2);
  qvSetCell(outer, 0, qvCreateString("replaced"));
  qvSetCell(outer, 0, qvCreateDoubleScalar(7));
  qvSetCell(outer, 1, inner);
  qvSetCell(outer, 2, qvCreateString("text"));
  call.outputs[0] = outer;
}

void outside(const Call& call) {
  qvSetCell(qvCreateCellMatrix(1, 1), 1, call.outputs[0]);
}

void manyResults(const Call& call) {
  for (int i = 0; i < 8; ++i)
    call.outputs[i] = qvCreateDoubleScalar(i == 0 ? call.outputCount : i);
}

// --- Messages, exceptions and memory --------------------------------------------------------

const MessageId message("TEST:probe", "told", {-5, std::string("n%s"), std::u16string(u"\u20AC")});

void warns(const Call& call) {
  qvWarningMsgId(message);
  call.outputs[0] = qvCreateDoubleScalar(1);
}

void raises(const Call&) {
  qvErrMsgId(message);
}

void throws(const Call& call) {
  switch (static_cast<int>(doubles(call.arguments[0])[0])) {
    case 0:
      throw std::runtime_error("a foreign error");
    case 1:
      throw std::bad_alloc();
    default:
      throw 5;
  }
}

/// Leaves memory to the host, as a failure does.
void litters(const Call& call) {
  const auto bytes = static_cast<std::size_t>(doubles(call.arguments[0])[0]);
  std::fill_n(static_cast<char*>(qvMalloc(bytes)), std::min<std::size_t>(bytes, 1 << 20), 'x');
  qvFree(qvMalloc(0));
  qvFree(nullptr);
  raises(call);
}

struct Command {
  const char* name;
  void (*run)(const Call&);
};

constexpr Command kCommands[] = {
    {"inspect", inspect},
    {"units", units},
    {"cells", cells},
    {"zeros", zeros},
    {"falses", falses},
    {"text", text},
    {"narrow", narrow},
    {"nested", nested},
    {"outside", outside},
    {"many", manyResults},
    {"warns", warns},
    {"raises", raises},
    {"throws", throws},
    {"litters", litters},
    {"conformance", probe::runChecks},
    {"refusals", probe::nameRefusals},
    {"refuse", probe::refuse},
    {"samples", probe::nameSamples},
    {"sample", probe::makeSample},
    {"recognise", probe::recogniseSample},
};

}  // namespace

extern "C" void qvhAbandonFile(std::uint64_t) {}

extern "C" void qvhFunction(int outputCount, qvArray* outputs[], int inputCount,
                            const qvArray* inputs[]) {
  char* const copy = qvArrayToString(inputs[0]);
  const std::string name = copy == nullptr ? "" : copy;
  qvFree(copy);
  const auto* const command = std::ranges::find(kCommands, name, &Command::name);
  const std::span all(inputs, static_cast<std::size_t>(inputCount));
  command->run({outputCount, outputs, all.subspan(1)});
}
