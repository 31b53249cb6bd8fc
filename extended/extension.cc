#include "gateway/extension.h"

#include "extended/tt2000.h"
#include "gateway/datatype_table.h"

namespace TOLVEX::ambrix {
namespace {

// Older headers of the library do not have the numbers.
constexpr Datatype kDatatypeRows[] = {
    {8, "CDF_INT8", qvINT64_CLASS, 8},
    {33, "CDF_TIME_TT2000", qvINT64_CLASS, 8},
};

constexpr NamedConstant kConstantRows[] = {
    {"CDF_INT8", 8},
    {"CDF_TIME_TT2000", 33},
};

constexpr CommandEntry kCommandRows[] = {
    {93, "computeTT2000", 1, 1, computeTt2000},
    {94, "tt2000Breakdown", 1, 1, tt2000Breakdown},
};

constexpr Extension kNone;
constexpr Extension kOffered{kDatatypeRows, kConstantRows, kCommandRows};

bool isOffered() {
  return qvOffersExtendedDatatypes != nullptr && qvOffersExtendedDatatypes();
}

}  // namespace

const Extension& extension() {
  return isOffered() ? kOffered : kNone;
}

}  // namespace TOLVEX::ambrix
