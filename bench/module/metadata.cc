// What there is to know of many variables.
#include "bench/module/module_calls.h"

namespace ambrix_bench {
namespace {

double countIn(const std::vector<Array>& facts, std::size_t place) {
  return facts[place].data<double>()[0];
}

void walk(const Array& file) {
  const std::vector<Array> facts = theModule().call("inquire", {file});
  const double variables = countIn(facts, 3), attributes = countIn(facts, 4);
  for (double attribute = 0; attribute < attributes; ++attribute)
    call("inquireAttr", {file, number(attribute)});
  for (double variable = 0; variable < variables; ++variable) {
    const Array variableNumber = number(variable);
    call("inquireVar", {file, variableNumber});
    for (double attribute = 0; attribute < attributes; ++attribute)
      call("getAttrEntry", {file, number(attribute), variableNumber});
  }
}

double openAndClose(const Setup& setup) {
  const Stopwatch watch;
  closeFile(openFile(setup, "metadata.cdf"));
  return watch.seconds();
}

/// A walk through a file with something set after it was opened.
template <typename Set>
double timeWalk(const Setup& setup, const Set& set) {
  const Stopwatch watch;
  const Array file = openFile(setup, "metadata.cdf");
  set(file);
  walk(file);
  closeFile(file);
  return watch.seconds();
}

}  // namespace

double walkMetadata(const Setup& setup) {
  return timeWalk(setup, [](const Array&) {});
}

double walkReadOnly(const Setup& setup) {
  return timeWalk(setup, [](const Array& file) {
    call("setReadOnlyMode", {file, constant("READONLYon")});
  });
}

double walkSmallCache(const Setup& setup) {
  return timeWalk(setup, [](const Array& file) { call("setCacheSize", {file, number(2)}); });
}

double openValidated(const Setup& setup) {
  return openAndClose(setup);
}

double openUnvalidated(const Setup& setup) {
  call("setValidate", {constant("VALIDATEFILEoff")});
  const double seconds = openAndClose(setup);
  call("setValidate", {constant("VALIDATEFILEon")});
  return seconds;
}

}  // namespace ambrix_bench
