// Writing values of a variable from host arrays, and deleting its records. The number of elements
// and the class of the data are checked, never the shape; numbers reach the library byte for byte
// in the host's order, of characters the low 8 bits.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "putVarData" (identifier, variable, record, indices, data): one value; of a text its first
/// character only. Raises `badDimensionExtent`, `wrongNumberOfPutVarDataElements`,
/// `unrecognizedValue` ("DATATYPE"), `datatypeMismatch`, `libraryFailure` ("CDFinquirezVar",
/// "CDFgetMajority", "CDFputzVarData").
void putVarData(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "putVarRecordData" (identifier, variable, record, data): one record. Raises
/// `wrongNumberOfPutVarRecordDataElements`, `unrecognizedValue` ("DATATYPE"), `datatypeMismatch`,
/// `libraryFailure` ("CDFinquirezVar", "CDFputzVarRecordData").
void putVarRecordData(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*);

/// "hyperPutVarData" (identifier, variable, record start, count and interval, start, count and
/// interval of each dimension, data). Raises `wrongNumberOfHyperPutVarDataElements`,
/// `unrecognizedValue` ("DATATYPE"), `datatypeMismatch`, `libraryFailure` ("CDFinquirezVar",
/// "CDFgetMajority", "CDFhyperPutzVarData").
void hyperPutVarData(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

/// "deleteVarRecords" (identifier, variable, first record, last record). Raises `libraryFailure`
/// ("CDFdeletezVarRecords").
void deleteVarRecords(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*);

}  // namespace TOLVEX::ambrix
