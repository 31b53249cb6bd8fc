#include <algorithm>
#include <cstdio>
#include <exception>
#include <iostream>
#include <stdexcept>

#include "bench/setup.h"

namespace ambrix_bench {
namespace {

double runRound(const Setup& setup, std::span<const Workload> workloads, std::string_view name) {
  const auto found = std::ranges::find(workloads, name, &Workload::name);
  if (found == workloads.end()) throw std::invalid_argument("no workload " + std::string(name));
  return found->round(setup);
}

void answerAll(const Setup& setup, std::span<const Workload> workloads) {
  std::cout << "ready" << std::endl;
  for (std::string name; std::getline(std::cin, name);) {
    std::cout << runRound(setup, workloads, name) << std::endl;
  }
}

}  // namespace

int serve(int argumentCount, char** arguments, std::span<const Workload> workloads) {
  if (argumentCount < 3) {
    std::cerr << "usage: " << arguments[0] << " FOLDER DIVISOR [WORKLOAD]\n";
    return 2;
  }
  try {
    const Setup setup{arguments[1], std::stoul(arguments[2])};
    std::cout.precision(9);
    if (argumentCount == 3) {
      answerAll(setup, workloads);
    } else {
      std::cout << runRound(setup, workloads, arguments[3]) << '\n';
    }
  } catch (const std::exception& error) {
    std::cerr << arguments[0] << ": " << error.what() << '\n';
    return 1;
  }
  return 0;
}

}  // namespace ambrix_bench
