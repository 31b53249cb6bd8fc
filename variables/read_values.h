// Letting the library write values into a new host array: numbers straight into its data,
// characters through a byte buffer.
#pragma once

#include <cstddef>
#include <cstring>

#include "gateway/scratch.h"
#include "gateway/sizes.h"
#include "host/qv.h"
#include "variables/characters.h"
#include "variables/datatypes.h"
#include "variables/guards/record_limits.h"
#include "variables/host_dimensions.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {

/// What one read asks of the library.
struct ReadRequest {
  long values;       // that the library writes at the most
  long bufferBytes;  // that characters are read into: at least those of the values
  bool writesAll;    // else what the library leaves unwritten reads as zeros
};

/// `read` lets the library write into the buffer that it is given.
template <typename Read>
qvArray* readCharacters(const HostDimensions& dimensions, const ReadRequest& request,
                        const Read& read) {
  qvArray* array = qvCreateCharArray(dimensions.count(), dimensions.data());
  const std::size_t characters = qvGetNumberOfElements(array);
  const ScratchBuffer buffer(saturatedProduct({request.bufferBytes}));
  if (!request.writesAll) std::memset(buffer.data(), 0, characters);
  read(buffer.data());
  widenCharacters(buffer.data(), characters, qvGetChars(array));
  return array;
}

template <typename Read>
qvArray* readNumbers(const VariableOperation& variable, const VariableDescription& description,
                     const HostDimensions& dimensions, const ReadRequest& request,
                     const Read& read) {
  const qvClassID classId = classIdForDatatype(description.datatype);
  const auto create = request.writesAll ? qvCreateUninitNumericArray : qvCreateNumericArray;
  qvArray* array = create(dimensions.count(), dimensions.data(), classId, qvREAL);
  requireRoom(variable, description, request.values, bytesOfArray(array, description.datatype));
  read(qvGetData(array));
  return array;
}

template <typename Read>
qvArray* readValues(const VariableOperation& variable, const VariableDescription& description,
                    const HostDimensions& dimensions, const ReadRequest& request,
                    const Read& read) {
  return isCharacterDatatype(description.datatype)
             ? readCharacters(dimensions, request, read)
             : readNumbers(variable, description, dimensions, request, read);
}

}  // namespace TOLVEX::ambrix
