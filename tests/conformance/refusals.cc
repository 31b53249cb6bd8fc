// What a host refuses, with which error.
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <new>

#include "tests/conformance/probe.h"

namespace probe {
namespace {

constexpr const char* kBadDimension = "TOLVEX:host:badDimension";
constexpr const char* kOutOfMemory = "TOLVEX:host:outOfMemory";

constexpr std::size_t kMinusOne = std::numeric_limits<std::size_t>::max();
constexpr std::size_t kMostNegative = std::size_t{1} << 63U;
constexpr std::size_t kHalf = std::size_t{1} << 32U;

void numbers(std::initializer_list<std::size_t> sizes) {
  (void)qvCreateNumericArray(sizes.size(), std::data(sizes), qvDOUBLE_CLASS, qvREAL);
}

struct Refusal {
  const char* name;
  const char* identifier;
  void (*run)();
};

constexpr Refusal kRefusals[] = {
    {"a negative size", kBadDimension, [] { numbers({kMinusOne}); }},
    {"the most negative size", kBadDimension,
     [] {
       numbers({2, kMostNegative});
     }},
    {"a negative size beside 0", kBadDimension,
     [] {
       numbers({0, kMinusOne});
     }},
    {"a negative size beside large ones", kBadDimension,
     [] {
       numbers({kMostNegative - 1, kMostNegative - 1, kMinusOne});
     }},
    {"a negative number of cells", kBadDimension, [] { (void)qvCreateCellMatrix(kMinusOne, 1); }},
    {"a negative number of characters", kBadDimension,
     [] { (void)qvCreateCharArray(1, &kMinusOne); }},
    {"a negative number of logicals", kBadDimension,
     [] { (void)qvCreateLogicalArray(1, &kMinusOne); }},
    {"a negative number of rows", kBadDimension,
     [] { (void)qvCreateNumericMatrix(kMinusOne, 1, qvINT8_CLASS, qvREAL); }},
    {"more elements than can be counted", kOutOfMemory,
     [] {
       numbers({kHalf, kHalf});
     }},
    {"more bytes than can be counted", kOutOfMemory,
     [] {
       numbers({kHalf, kHalf / 8});
     }},
    {"more numbers than can be had", kOutOfMemory,
     [] {
       numbers({kHalf, kHalf / 64});
     }},
    {"more characters than can be had", kOutOfMemory,
     [] {
       const std::size_t sizes[] = {kHalf, kHalf / 8};
       (void)qvCreateCharArray(2, sizes);
     }},
    {"more cells than can be counted", kOutOfMemory,
     [] { (void)qvCreateCellMatrix(kHalf, kHalf / 4); }},
    {"more cells than can be had", kOutOfMemory,
     [] { (void)qvCreateCellMatrix(kHalf, kHalf / 64); }},
    {"a buffer that cannot be had", kOutOfMemory, [] { (void)qvMalloc(std::size_t{1} << 62U); }},
    {"a buffer beyond all memory", kOutOfMemory, [] { (void)qvMalloc(kMinusOne); }},
    {"exhaustion of memory in the module", kOutOfMemory, [] { throw std::bad_alloc(); }},
    {"what the module raises", "TEST:probe:told",
     [] {
       qvErrMsgId({"TEST:probe", "told", {-5, "n%s", u"\u20ac"}});
     }},
};

}  // namespace

void nameRefusals(const Call& call) {
  std::vector<std::string> names;
  std::vector<std::string> identifiers;
  for (const Refusal& refusal : kRefusals) {
    names.emplace_back(refusal.name);
    identifiers.emplace_back(refusal.identifier);
  }
  call.outputs[0] = textColumn(names);
  call.outputs[1] = textColumn(identifiers);
}

void refuse(const Call& call) {
  // What a failed call leaves behind is the host's to reclaim, results included.
  call.outputs[0] = qvCreateNumericMatrix(100, 100, qvDOUBLE_CLASS, qvREAL);
  qvArray* const cell = qvCreateCellMatrix(1, 1);
  qvSetCell(cell, 0, qvCreateString("left behind"));
  (void)qvMalloc(1000);
  std::span(kRefusals)[indexIn(call.arguments[0])].run();
}

}  // namespace probe
