#include "tests/support/examples.h"

#include <map>

namespace ambrix_test {

Given exampleOf(const Argument& argument) {
  static const std::map<std::string, Given> kExamples = {
      {"amount", 9},
      {"attribute", 2},
      {"attributeName", "a"},
      {"backward", 1},
      {"checksum", 1},
      {"components", {1, 2, 3, 4, 5, 6, 7}},
      {"components16", {1, 2, 3, 4, 5, 6, 7, 8, 9, 10}},
      {"compression", 5},
      {"constantName", "VARY"},
      {"counts", {1, 2}},
      {"datatype", 51},
      {"elements", 1},
      {"entry", 5},
      {"entryValues", "text"},
      {"epochs", {1, 2}},
      {"epochs16", {1, 2}},
      {"file", file()},
      {"format", 2},
      {"indices", {1, 2}},
      {"majority", 2},
      {"mode", 0},
      {"newName", "b"},
      {"parameter", 6},
      {"path", "a.cdf"},
      {"record", 0},
      {"recordValues", elements<double>(6)},
      {"records", 1},
      {"scope", 1},
      {"sizes", {2, 3}},
      {"slabValues", {8, 9}},
      {"sparseness", 1},
      {"start", {0, 0}},
      {"stride", 1},
      {"strides", {1, 1}},
      {"value", 8},
      {"variable", 3},
      {"variableName", "v"},
      {"variance", -1},
      {"variances", {-1, 0}},
  };
  return kExamples.at(argument.kind);
}

Arguments examplesOf(const Command& command) {
  Arguments arguments;
  for (const Argument& argument : command.arguments)
    arguments.push_back(exampleOf(argument));
  return arguments;
}

}  // namespace ambrix_test
