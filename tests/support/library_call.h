// The variadic call of the CDF library, taken apart as the library does it.
#pragma once

#include <cstdarg>
#include <cstddef>
#include <string>

#include "tests/support/library_items.h"
#include "tests/support/library_variable.h"

namespace ambrix_test {

/// Reads the argument list of one call of CDFlib; stand-ins for the library say what to do with its
/// parts.
class LibraryCall {
 public:
  explicit LibraryCall(std::va_list list) { va_copy(list_, list); }
  virtual ~LibraryCall() { va_end(list_); }
  LibraryCall(const LibraryCall&) = delete;
  LibraryCall& operator=(const LibraryCall&) = delete;

  /// Reads from the first operation up to NULL_; false for a list that makes no sense.
  bool read(long operation);

 protected:
  virtual void beginOperation(const char* /*name*/) {}
  virtual void beginItem(const Item& /*item*/, bool /*first*/) {}

  // What is handed over.
  virtual void takeHandle(void* /*handle*/) {}
  virtual void takeNumber(const Item& item, long number) = 0;
  virtual void takeText(const char* text) = 0;
  virtual void takeParameters(const long* parameters) = 0;
  virtual void takeVector(const Slots& entries) = 0;
  /// As many bytes as values of the variable, as it describes itself.
  virtual void takeData(const void* data, long values) = 0;

  // What is to be filled in; `index` counts the places of one item.
  virtual void fill(const Item& item, char kind, std::size_t index, void* place) = 0;
  virtual void fillData(void* data, long values) = 0;

  /// The variable that the library would move data of.
  [[nodiscard]] virtual LibraryVariable variable() const = 0;

  /// Of the variable that the list creates; negative in other lists.
  [[nodiscard]] long createdDimensions() const { return createdDimensions_; }
  [[nodiscard]] long lastNumber() const { return lastNumber_; }

 private:
  bool readItems();
  void readArguments(const Item& item);
  void readInput(const Item& item, char kind);
  void readNumber(const Item& item);
  void readVector(const Item& item);
  [[nodiscard]] long valuesOf(const Item& item) const;

  std::va_list list_;
  long operation_ = 0;
  long next_ = 0;
  long lastNumber_ = 0;
  long createdDimensions_ = -1;
  LibrarySelection selection_;
};

}  // namespace ambrix_test
