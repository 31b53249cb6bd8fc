// The operations over the table of datatypes. A code that is not supported is an unrecognised
// value.
#pragma once

#include <cstddef>
#include <string>

#include "gateway/datatype_table.h"
#include "gateway/value_buffer.h"
#include "host/qv.h"

namespace TOLVEX::ambrix {

/// Raises `unrecognizedValue` (code, "DATATYPE") unless the code is supported.
void validateDatatype(long code);

/// The class of the host array that carries values of the datatype. Raises like `validateDatatype`.
qvClassID classIdForDatatype(long code);

/// Bytes of one element in a CDF buffer; 16, two doubles, for `CDF_EPOCH16`. 0 if not supported.
long datatypeSize(long code);

/// Bytes of a numeric host array that carries values of the datatype.
std::size_t bytesOfArray(const qvArray* array, long code);

/// Upper-case name, for error messages. Raises like `validateDatatype`.
std::string datatypeName(long code);

/// Lower-case name as a host string, for inquiry results. Raises like `validateDatatype`.
qvArray* datatypeNameArray(long code);

/// A host array of the values in the buffer: a text for characters, which end at the first zero
/// byte; 2-by-n doubles for `CDF_EPOCH16`; else 1-by-n of the datatype's class, bit for bit.
qvArray* createArrayFromBuffer(const ValueBuffer& buffer, long code);

}  // namespace TOLVEX::ambrix
