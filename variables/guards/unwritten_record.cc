#include "variables/unwritten_record.h"

#include <cdf.h>

#include <cstddef>
#include <cstring>
#include <span>

#include "gateway/library.h"
#include "gateway/sizes.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

void fillWithPadValue(CdfId file, long number, const VariableDescription& variable, long values,
                      void* buffer, const char* routine) {
  if (values < 1) return;
  const std::size_t bytes = saturatedProduct({variable.elements, datatypeSize(variable.datatype)});
  auto* const first = static_cast<char*>(buffer);
  const long status = CDFlib(SELECT_, CDF_, libraryHandle(file, routine),  //
                             zVAR_, variableOrAttributeNumber(number),     //
                             GET_, zVAR_PADVALUE_, buffer, NULL_);
  checkLibraryStatus(status, routine);
  // Of a text that has no pad value in its file the library gives the first character only.
  const bool oneCharacter =
      status == NO_PADVALUE_SPECIFIED && isCharacterDatatype(variable.datatype);
  if (oneCharacter) std::memset(first, *first, bytes);
  for (long i = 1; i < values; ++i)
    std::memcpy(first + static_cast<std::size_t>(i) * bytes, first, bytes);
}

}  // namespace

bool lacksItsRecord(CdfId file, long number, const VariableDescription& variable,
                    const char* routine) {
  if (variable.recordVariance != NOVARY) return false;
  constexpr long kVersionThatPads = 3;
  long last = 0;
  long version = kVersionThatPads;
  callOnVariable(routine, file, number, GET_, zVAR_MAXREC_, &last, CDF_VERSION_, &version);
  return last < 0 && version < kVersionThatPads;
}

void fillRecord(CdfId file, long number, const VariableDescription& variable, void* buffer,
                const char* routine) {
  long values = 1;
  for (std::size_t i = 0; i < variable.sizes().size(); ++i)
    if (variable.variances()[i] != NOVARY) values = multiplySaturated(values, variable.sizes()[i]);
  fillWithPadValue(file, number, variable, values, buffer, routine);
}

void fillValue(CdfId file, long number, const VariableDescription& variable, long record,
               const DimensionVector& indices, void* buffer, const char* routine) {
  callOnVariable(routine, file, number, zVAR_RECNUMBER_, libraryNumber(record, kBadNumber),
                 zVAR_DIMINDICES_, indices.data());
  fillWithPadValue(file, number, variable, 1, buffer, routine);
}

void fillHyperslab(CdfId file, long number, const VariableDescription& variable,
                   const LibraryHyperslab& slab, void* buffer, const char* routine) {
  selectHyperslab(routine, file, number, slab);
  for (std::size_t i = 0; i < variable.sizes().size(); ++i) {
    const long last = slab.start[i] + (slab.count[i] - 1) * slab.interval[i];
    if (last >= variable.sizes()[i]) raiseLibraryFailure(BAD_DIM_INDEX, routine);
  }
  const std::span<const long> counts{slab.count.data(), variable.sizes().size()};
  const long values = multiplySaturated(productOf(counts), slab.recordCount);
  fillWithPadValue(file, number, variable, values, buffer, routine);
}

}  // namespace TOLVEX::ambrix
