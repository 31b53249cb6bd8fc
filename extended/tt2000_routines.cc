#include "extended/tt2000_routines.h"

#include "gateway/library_calls.h"

// CDF 3.6 has the routines under the second names only, and later versions under the first. Headers
// rename one of each pair by macro, and not always as the library does that they are used with. So
// both are declared here, and those are called that the library has. A static library's are always
// linked, because the library itself uses them to open files.
#undef computeTT2000
#undef CDF_TT2000_from_UTC_parts
#undef breakdownTT2000
#undef CDF_TT2000_to_UTC_parts

// NOLINTBEGIN(readability-redundant-declaration)
extern "C" {
[[gnu::weak]] long long computeTT2000(double year, double month, double day, ...);
[[gnu::weak]] long long CDF_TT2000_from_UTC_parts(double year, double month, double day, ...);
[[gnu::weak]] void breakdownTT2000(long long time, double* year, double* month, double* day, ...);
[[gnu::weak]] void CDF_TT2000_to_UTC_parts(long long time, double* year, double* month, double* day,
                                           ...);
}
// NOLINTEND(readability-redundant-declaration)

namespace TOLVEX::ambrix {
namespace {

/// The routine under the name that the library has; no library before version 3.4 has either.
template <typename Routine>
Routine* presentRoutine(Routine* first, Routine* second, const char* name) {
  Routine* const present = first != nullptr ? first : second;
  if (present == nullptr) raiseLibraryFailure(BAD_FNC_OR_ITEM, name);
  return present;
}

}  // namespace

std::int64_t tt2000OfComponents(const Tt2000Components& c) {
  auto* const compute = presentRoutine(computeTT2000, CDF_TT2000_from_UTC_parts, "computeTT2000");
  return compute(c[0], c[1], c[2], c[3], c[4], c[5], c[6], c[7], c[8]);
}

Tt2000Components componentsOfTt2000(std::int64_t time) {
  auto* const breakDown =
      presentRoutine(breakdownTT2000, CDF_TT2000_to_UTC_parts, "breakdownTT2000");
  Tt2000Components c{};
  breakDown(time, &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6], &c[7], &c[8]);
  return c;
}

}  // namespace TOLVEX::ambrix
