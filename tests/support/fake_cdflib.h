// A stand-in for the CDF library: writes down each call as text, and answers what the test has set.
//
// A call of CDFlib reads as its argument list, items separated by bars and without the closing
// NULL_: "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_NAME_". Numbers, texts and vectors that are handed
// over are shown, places to be filled are not. Other routines read "CDFgetAttrNum 7 'title'". A
// list that the library would not understand fails the test.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace ambrix_test {

using Numbers = std::vector<long>;
using Bytes = std::vector<unsigned char>;

class FakeCdflib {
 public:
  // --- What it answers: by the item of CDFlib or the name of the routine. Unset numbers are 0,
  // unset texts empty, unset data leave the caller's buffer as it is.

  /// The numbers that the item fills in, in order; a vector takes all of them.
  void answer(const std::string& item, Numbers numbers) { numbers_[item] = std::move(numbers); }
  void answerText(const std::string& item, std::string text) { texts_[item] = std::move(text); }
  /// What every item or routine that gives data writes into the caller's buffer.
  template <typename T>
  void answerData(const std::vector<T>& values) {
    const auto* bytes = reinterpret_cast<const Bytes::value_type*>(values.data());
    data_.assign(bytes, bytes + values.size() * sizeof(T));
  }
  /// From now on data are as many bytes as the library moves for the description of the variable or
  /// entry: it fills that many with this byte, and reads that many of what it is handed.
  void moveExactly(unsigned char fill) { fill_ = fill; }
  [[nodiscard]] bool movesExactly() const { return fill_.has_value(); }
  /// The number of bytes that it filled or read last.
  [[nodiscard]] std::size_t bytesMoved() const { return bytesMoved_; }
  void forgetBytesMoved() { bytesMoved_ = 0; }

  /// The results of the epoch routines, one call each; the last one stays.
  void answerEpochs(std::vector<double> epochs) { epochs_ = std::move(epochs); }

  /// The n-th call from now on (1 is the next) ends with the status.
  void failCall(std::size_t n, long status);
  /// Every call whose text contains the part ends with the status.
  void endWith(const std::string& part, long status) { statuses_[part] = status; }

  // --- What it saw.

  /// All calls but those that ask for the text of a status.
  [[nodiscard]] const std::vector<std::string>& calls() const { return calls_; }
  /// The calls that ask for the text of a status, which is "text of status N".
  [[nodiscard]] const std::vector<std::string>& statusCalls() const { return statusCalls_; }
  void forgetCalls();
  /// How many bytes it reads of data that it is handed; it keeps those of the last call.
  void readBytes(std::size_t count) { bytesToRead_ = count; }
  [[nodiscard]] const Bytes& bytesRead() const { return bytesRead_; }
  /// Whether data that it was handed was ever a null pointer.
  [[nodiscard]] bool sawNullData() const { return sawNullData_; }

  // --- For the routines of the library.

  /// Notes the call and gives the status that it ends with.
  long finish(const std::string& call, long status = 0);
  [[nodiscard]] long number(const std::string& item, std::size_t index = 0) const;
  [[nodiscard]] const Numbers& numbers(const std::string& item) const;
  [[nodiscard]] const std::string& text(const std::string& item) const;
  /// `bytes` is what the library moves, which counts after `moveExactly`.
  void give(void* buffer, std::size_t bytes);
  void take(const void* buffer, std::size_t bytes);
  double nextEpoch();

 private:
  std::map<std::string, Numbers> numbers_;
  std::map<std::string, std::string> texts_;
  std::map<std::string, long> statuses_;
  Bytes data_;
  std::vector<double> epochs_;
  std::size_t failAt_ = 0;
  long failStatus_ = 0;
  std::vector<std::string> calls_;
  std::vector<std::string> statusCalls_;
  std::size_t bytesToRead_ = 0;
  Bytes bytesRead_;
  bool sawNullData_ = false;
  std::optional<unsigned char> fill_;
  std::size_t bytesMoved_ = 0;
};

/// The one that the program is linked with.
FakeCdflib& fakeCdflib();

}  // namespace ambrix_test
