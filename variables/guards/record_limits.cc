#include "variables/guards/record_limits.h"

#include <cdf.h>

#include <algorithm>
#include <cstdint>
#include <limits>

#include "gateway/sizes.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

constexpr long kMost = std::numeric_limits<std::int32_t>::max();

// Of the datatypes that the library knows and the module does not support.
constexpr long kOtherDatatypeSize = 8;

/// The bytes of a record as the library counts them.
std::uint32_t wrappedBytes(const VariableDescription& description) {
  const long supportedSize = datatypeSize(description.datatype);
  const long elementSize = supportedSize > 0 ? supportedSize : kOtherDatatypeSize;
  auto bytes = static_cast<std::uint32_t>(description.elements);
  bytes *= static_cast<std::uint32_t>(elementSize);
  for (std::size_t i = 0; i < description.sizes().size(); ++i) {
    if (description.variances()[i] == NOVARY) continue;
    bytes *= static_cast<std::uint32_t>(description.sizes()[i]);
  }
  return bytes;
}

}  // namespace

void requireRecordNumber(const VariableOperation& variable, long record) {
  if (record < 0 || !fitsLibrary(record)) variable.fail(BAD_REC_NUM);
}

void requireCountableRecord(const VariableOperation& variable,
                            const VariableDescription& description, long record) {
  if (description.recordVariance != NOVARY && record == kMost) variable.fail(BAD_REC_NUM);
}

void requireElements(const VariableOperation& variable, const VariableDescription& description) {
  if (description.elements < 1) variable.fail(BAD_NUM_ELEMS);
}

void requireUsableRecord(const VariableOperation& variable,
                         const VariableDescription& description) {
  requireElements(variable, description);
  const bool noSize = std::ranges::any_of(description.sizes(), [](long size) { return size < 1; });
  if (noSize || description.storedBytesPerRecord() > kMost) variable.fail(BAD_DIM_SIZE);
}

void requireDivisibleRecord(const VariableOperation& variable,
                            const VariableDescription& description) {
  if (wrappedBytes(description) != 0) return;
  long format = 0;
  const long status = variable.status(GET_, CDF_FORMAT_, &format);
  if (status >= CDF_OK && format == SINGLE_FILE) variable.fail(BAD_DIM_SIZE);
}

void requireDivisibleRecord(const VariableOperation& variable) {
  VariableDescription description;
  if (describe(variable, description) >= CDF_OK) requireDivisibleRecord(variable, description);
}

void requireRoom(const VariableOperation& variable, const VariableDescription& description,
                 long values, std::size_t bytes) {
  const std::size_t needed =
      saturatedProduct({values, description.elements, datatypeSize(description.datatype)});
  if (needed > bytes) variable.fail(BAD_NUM_ELEMS);
}

}  // namespace TOLVEX::ambrix
