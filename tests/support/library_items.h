// The items of the library's variadic interface that the stand-in understands, restated from the
// library's manual: the numbers are typed here, so that a wrong name in the module shows.
#pragma once

namespace ambrix_test {

/// What follows an item in an argument list, one letter each. Lower case is handed over, upper case
/// is filled in by the library.
///   h handle; n number; s text; v one number per dimension; p parameters; d data
struct Item {
  long operation;
  long code;
  const char* name;
  const char* arguments;
};

/// Null for a pair that the module has no reason to use.
const Item* findItem(long operation, long code);

/// Null for a number that is no operation.
const char* operationName(long operation);

}  // namespace ambrix_test
