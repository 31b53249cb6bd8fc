// What the library says of a variable, in one inquiry.
#pragma once

#include <cdf.h>

#include <span>

#include "gateway/cdf_id.h"

namespace TOLVEX::ambrix {

struct VariableDescription {
  char name[CDF_VAR_NAME_LEN256 + 1] = {};
  long datatype = 0;
  long elements = 0;  // characters of one value; 1 for every other datatype of a sane file
  long dimensions = 0;
  long recordVariance = 0;
  long sizeSlots[CDF_MAX_DIMS] = {};
  long varianceSlots[CDF_MAX_DIMS] = {};

  // In the library's order of dimensions.
  [[nodiscard]] std::span<const long> sizes() const { return {sizeSlots, count()}; }
  [[nodiscard]] std::span<const long> variances() const { return {varianceSlots, count()}; }

  /// Product of all dimension sizes, whatever their variances; 1 for a scalar variable.
  [[nodiscard]] long valuesPerRecord() const;
  /// The same in elements: characters for text.
  [[nodiscard]] long elementsPerRecord() const;
  /// The same in bytes, of what the library stores: along a dimension that does not vary, one
  /// value.
  [[nodiscard]] long storedBytesPerRecord() const;
  [[nodiscard]] bool allDimensionsVary() const;

 private:
  [[nodiscard]] std::size_t count() const { return static_cast<std::size_t>(dimensions); }
};

/// Raises `libraryFailure` with the routine that the inquiry stands for.
VariableDescription inquireVariable(CdfId file, long variable,
                                    const char* routine = "CDFinquirezVar");

/// Refuses, as the library's bad record number, a record that its routines for whole records must
/// not see: they would abort all access to the file, or leave a file that cannot be opened.
void requireRecordNumber(long record, const char* routine);

/// The library counts records in 32 bits: refuses, as its bad record number, to read or write the
/// one record whose number has a place there and whose count has none. Where records do not vary it
/// is not so.
void requireCountableRecord(const VariableDescription& variable, long record, const char* routine);

/// Refuses, as the library's bad number of elements, values of no elements.
void requireElements(const VariableDescription& variable, const char* routine);

/// The library counts the bytes of a record in 32 bits: refuses, as its bad dimension size or bad
/// number of elements, descriptions that only a damaged file or a variable too large to store has.
/// Readers and writers call this after all their other checks.
void requireUsableRecord(const VariableDescription& variable, const char* routine);

/// Some commands make the library divide by the bytes of a record of a single-file CDF: refuses, as
/// its bad dimension size, variables for which they wrap around to zero, and no others.
void requireDivisibleRecord(CdfId file, const VariableDescription& variable, const char* routine);

/// Refuses, as the library's bad number of elements, to move `values` values of the variable to or
/// from `bytes` bytes if they are not enough.
void requireRoom(const VariableDescription& variable, long values, std::size_t bytes,
                 const char* routine);

}  // namespace TOLVEX::ambrix
