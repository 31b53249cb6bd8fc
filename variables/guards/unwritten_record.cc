#include "variables/guards/unwritten_record.h"

#include <cdf.h>

#include <cstddef>
#include <cstring>
#include <span>

#include "gateway/library_faults.h"
#include "gateway/sizes.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

void fillWithPadValue(const VariableOperation& variable, const VariableDescription& description,
                      long values, void* result) {
  if (values < 1) return;
  const std::size_t bytes =
      saturatedProduct({description.elements, datatypeSize(description.datatype)});
  auto* const first = static_cast<char*>(result);
  const long status = variable.status(GET_, zVAR_PADVALUE_, result);
  variable.check(status);
  // Of a text that has no pad value in its file the library gives the first character only.
  const bool oneCharacter =
      status == NO_PADVALUE_SPECIFIED && isCharacterDatatype(description.datatype);
  if (oneCharacter) std::memset(first, *first, bytes);
  for (long i = 1; i < values; ++i)
    std::memcpy(first + static_cast<std::size_t>(i) * bytes, first, bytes);
}

}  // namespace

bool mustFillUnwrittenRecord(const VariableOperation& variable,
                             const VariableDescription& description) {
  if (!libraryFaults().leavesUnwrittenRecords || description.recordVariance != NOVARY) return false;
  constexpr long kVersionThatPads = 3;
  long last = 0;
  long version = kVersionThatPads;
  const long status = variable.status(GET_, zVAR_MAXREC_, &last, CDF_VERSION_, &version);
  return status >= CDF_OK && last < 0 && version < kVersionThatPads;
}

void fillRecord(const VariableOperation& variable, const VariableDescription& description,
                void* result) {
  long values = 1;
  for (std::size_t i = 0; i < description.sizes().size(); ++i) {
    if (description.variances()[i] == NOVARY) continue;
    values = multiplySaturated(values, description.sizes()[i]);
  }
  fillWithPadValue(variable, description, values, result);
}

void fillValue(const VariableOperation& variable, const VariableDescription& description,
               long record, const DimensionVector& indices, void* result) {
  variable.call(zVAR_RECNUMBER_, libraryNumber(record, kBadNumber),  //
                zVAR_DIMINDICES_, indices.data());
  fillWithPadValue(variable, description, 1, result);
}

void fillHyperslab(const VariableOperation& variable, const VariableDescription& description,
                   const LibraryHyperslab& slab, void* result) {
  selectHyperslab(variable, slab);
  for (std::size_t i = 0; i < description.sizes().size(); ++i) {
    const long last = slab.start[i] + (slab.count[i] - 1) * slab.interval[i];
    if (last >= description.sizes()[i]) variable.fail(BAD_DIM_INDEX);
  }
  const std::span<const long> counts{slab.count.data(), description.sizes().size()};
  const long values = multiplySaturated(productOf(counts), slab.recordCount);
  fillWithPadValue(variable, description, values, result);
}

}  // namespace TOLVEX::ambrix
