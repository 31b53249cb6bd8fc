// Entries of one attribute.
#pragma once

#include <cstddef>
#include <exception>
#include <optional>

#include "ambrix/file.h"

namespace ambrix {

/// Reads entries one after the other with arguments that it makes once.
class EntryReader {
 public:
  /// The observer, if there is one, is told of what `inquire` and `value` throw.
  EntryReader(File& file, const Attribute& attribute, FileObserver* observer);

  Entry inquire(std::size_t number);
  Array value(std::size_t number);
  /// How many there are.
  std::size_t count();
  /// The entry of that number; if there is none, why.
  std::optional<Entry> find(std::size_t number, std::exception_ptr& failure);
  /// Throws what `find` has told, or what the observer throws in its place.
  [[noreturn]] void rethrow(const std::exception_ptr& failure) const;

 private:
  std::vector<Array> call(const Array& command, std::size_t number);

  File& file_;
  const Attribute& attribute_;
  FileObserver* observer_;
  Array inquireCommand_;
  Array valueCommand_;
  Array attributeNumber_;
  Array entryNumber_;
};

}  // namespace ambrix
