// Arguments as tests write them: numbers, texts, rows of numbers.
#pragma once

#include <ambrix/embedded.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <string_view>
#include <utility>
#include <vector>

namespace ambrix_test {

using ::ambrix::Array;
using ::ambrix::ArrayView;
using ::ambrix::ClassId;

/// A copyable argument. Numbers are doubles; `Given()`, written {}, is an empty double array.
class Given {
 public:
  Given() : Given(Array::zeros(ClassId::kDouble, {0, 0})) {}
  Given(double number) : Given(Array::scalar(number)) {}
  Given(int number) : Given(static_cast<double>(number)) {}
  Given(const char* text) : Given(Array::fromNarrow(text)) {}
  Given(std::initializer_list<double> row) : Given(Array::row(row)) {}
  Given(Array array) : array_(std::make_shared<Array>(std::move(array))) {}

  [[nodiscard]] ArrayView view() const { return *array_; }

 private:
  std::shared_ptr<const Array> array_;
};

using Arguments = std::vector<Given>;

/// They end with the arguments.
inline std::vector<ArrayView> viewsOf(const Arguments& arguments) {
  std::vector<ArrayView> views;
  for (const Given& argument : arguments)
    views.push_back(argument.view());
  return views;
}

/// A row of any class: row<float>({1, 2}).
template <typename T>
Given row(std::initializer_list<T> values) {
  return Array::row(values);
}

/// n elements of any class that no test looks at.
template <typename T>
Given elements(std::size_t n) {
  return Array::zeros(::ambrix::classIdOf<T>(), {1, n});
}

/// The handle that the stand-in for the CDF library gives to opened files in most tests.
inline constexpr long kHandle = 7;

/// The identifier of the file that is open in each test.
inline Given file(std::uint64_t handle = kHandle) {
  return Array::scalar(handle);
}

}  // namespace ambrix_test
