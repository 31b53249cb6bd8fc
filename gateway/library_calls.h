// Calls of the CDF library, each with its status checked under the name of the routine that it
// stands for. A call reads as the library's manual writes it, without the selection of the file and
// the closing NULL_.
#pragma once

#include <cdf.h>

#include <cstdint>
#include <limits>
#include <type_traits>

#include "gateway/cdf_id.h"

namespace TOLVEX::ambrix {

/// Raises `libraryFailure` with the routine and the library's status text.
[[noreturn]] void raiseLibraryFailure(long status, const char* routine);

/// Passes every status of zero or more; a negative one, warnings of the library included, is
/// raised.
inline void checkLibraryStatus(long status, const char* routine) {
  if (status < 0) [[unlikely]]
    raiseLibraryFailure(status, routine);
}

/// The library's handle of a registered file. A file that the library has already freed (its
/// closing failed) is refused as the library would refuse it, without letting the library look at
/// it.
void* libraryHandle(CdfId file, const char* routine);
CdfId cdfIdOf(void* handle);

// The library reads numbers as long and keeps only 32 bits of them: 2^32 would address variable 0.
// A number that does not fit is replaced by one of its kind that the library itself refuses: for
// what exists or not (a variable, an attribute) by one of the same sign, which is too large or
// illegal as the number itself is; for entries, records, counts and amounts by a negative one.
inline constexpr long kNoSuchNumber = std::numeric_limits<std::int32_t>::max();
inline constexpr long kBadNumber = -1;

constexpr bool fitsLibrary(long number) {
  return number >= std::numeric_limits<std::int32_t>::min() &&
         number <= std::numeric_limits<std::int32_t>::max();
}
constexpr long libraryNumber(long number, long refused) {
  return fitsLibrary(number) ? number : refused;
}
constexpr long variableOrAttributeNumber(long number) {
  return libraryNumber(number, number < 0 ? kBadNumber : kNoSuchNumber);
}

/// What `CDFlib` may find in its argument list: it reads longs and pointers and cannot check them.
template <typename T>
inline constexpr bool kIsLibraryItem = std::is_same_v<T, long> || std::is_pointer_v<T>;

template <typename... Items>
void callLibrary(const char* routine, Items... items) {
  static_assert((kIsLibraryItem<Items> && ...), "CDFlib reads long values and pointers only");
  checkLibraryStatus(CDFlib(items..., NULL_), routine);
}

template <typename... Items>
void callOnFile(const char* routine, CdfId file, Items... items) {
  callLibrary(routine, SELECT_, CDF_, libraryHandle(file, routine), items...);
}

/// Selects zVariables in the routines that take either kind.
inline constexpr int kZVariables = 1;

/// A zVariable in hand: a routine of the library that is carried out on it, and under whose name
/// every failure on the way is reported.
class VariableOperation {
 public:
  VariableOperation(CdfId file, long number, const char* routine)
      : file_(file), number_(variableOrAttributeNumber(number)), routine_(routine) {}

  template <typename... Items>
  void call(Items... items) const {
    check(status(items...));
  }
  /// The same for callers who judge the status themselves.
  template <typename... Items>
  [[nodiscard]] long status(Items... items) const {
    static_assert((kIsLibraryItem<Items> && ...), "CDFlib reads long values and pointers only");
    return CDFlib(SELECT_, CDF_, handle(), zVAR_, number_, items..., NULL_);
  }
  void check(long status) const { checkLibraryStatus(status, routine_); }
  [[noreturn]] void fail(long status) const { raiseLibraryFailure(status, routine_); }

  [[nodiscard]] CdfId file() const { return file_; }
  [[nodiscard]] void* handle() const { return libraryHandle(file_, routine_); }
  /// As the library takes it.
  [[nodiscard]] long number() const { return number_; }

 private:
  CdfId file_;
  long number_;
  const char* routine_;
};

/// `ROW_MAJOR` files hold their last dimension fastest, the host its first.
bool isRowMajor(CdfId file);

}  // namespace TOLVEX::ambrix
