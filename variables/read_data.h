// Reading values of a variable into a new host array. Numbers are not converted, dimensions of a
// row-major file are reversed, bytes of characters are widened as signed values.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "getVarData" (identifier, variable, record, [indices]): one value, 1-by-1; 2-by-1 doubles for
/// epoch16, a column of its characters for text. Raises `cannotOmitDimSpec`, `badDimSpec`,
/// `unrecognizedValue` ("DATATYPE"), `libraryFailure` ("CDFinquirezVar", "CDFgetMajority",
/// "CDFgetzVarData").
void getVarData(int, qvArray* outputs[], std::int32_t argumentCount, const qvArray* arguments[],
                const CommandEntry*);

/// "getVarRecordData" (identifier, variable, record): one record in the shape of the variable.
/// Raises `unrecognizedValue` ("DATATYPE"), `libraryFailure` ("CDFinquirezVar", "CDFgetMajority",
/// "CDFgetzVarRecordData").
void getVarRecordData(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*);

/// "hyperGetVarData" (identifier, variable, record start, count and interval, start, count and
/// interval of each dimension): counts of each dimension by records. Raises `badDimSpec`,
/// `dimSizeTooLarge`, `unrecognizedValue` ("DATATYPE"), `libraryFailure` ("CDFinquirezVar",
/// "CDFgetMajority", "CDFhyperGetzVarData").
void hyperGetVarData(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

}  // namespace TOLVEX::ambrix
