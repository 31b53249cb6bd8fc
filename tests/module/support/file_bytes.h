// What stands in a file, as evidence beside reading it back.
#pragma once

#include <fstream>
#include <initializer_list>
#include <iterator>
#include <string>

namespace ambrix_test {

inline std::string fileBytes(const std::string& name) {
  std::ifstream file(name, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

/// Numbers as consecutive values in the byte order of this machine, in which new files are written.
template <typename T>
std::string bytesOf(std::initializer_list<T> values) {
  return {reinterpret_cast<const char*>(std::data(values)), values.size() * sizeof(T)};
}

}  // namespace ambrix_test
