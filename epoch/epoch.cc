#include "epoch/epoch.h"

#include <cdf.h>

#include <algorithm>
#include <cstddef>
#include <span>
#include <vector>

#include "epoch/time_components.h"
#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

constexpr std::size_t kEpochComponents = 7;
constexpr std::size_t kEpoch16Components = 10;

qvArray* createDoubles(const std::vector<std::size_t>& sizes) {
  return qvCreateUninitNumericArray(sizes.size(), sizes.data(), qvDOUBLE_CLASS, qvREAL);
}

double* doublesOf(qvArray* array) {
  return static_cast<double*>(qvGetData(array));
}

const double* doublesOf(const qvArray* array) {
  return static_cast<const double*>(qvGetReadOnlyData(array));
}

/// 10, then the further dimensions of a 2-by-... input, else the number of pairs.
std::vector<std::size_t> epoch16BreakdownSizes(const qvArray* epochs) {
  std::vector<std::size_t> sizes{kEpoch16Components};
  const std::size_t* given = qvGetDimensions(epochs);
  if (given[0] == 2) {
    sizes.insert(sizes.end(), given + 1, given + qvGetNumberOfDimensions(epochs));
  } else {
    sizes.push_back(qvGetNumberOfElements(epochs) / 2);
  }
  return sizes;
}

}  // namespace

void computeEpoch(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*) {
  const std::size_t count = requireGroups(arguments[0], kEpochComponents);
  qvArray* epochs = createDoubles({1, count});
  std::span<const double> components = componentsOf(arguments[0]);
  double* epoch = doublesOf(epochs);
  for (; !components.empty(); components = components.subspan(kEpochComponents), ++epoch) {
    long c[kEpochComponents];
    std::ranges::transform(components.first<kEpochComponents>(), c, truncateToLong);
    *epoch = computeEPOCH(c[0], c[1], c[2], c[3], c[4], c[5], c[6]);
    if (*epoch == ILLEGAL_EPOCH_VALUE) raiseIllegalTime(components);
  }
  outputs[0] = epochs;
}

void computeEpoch16(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const std::size_t count = requireGroups(arguments[0], kEpoch16Components);
  qvArray* epochs = createDoubles({2, count});
  std::span<const double> components = componentsOf(arguments[0]);
  double* epoch = doublesOf(epochs);
  for (; !components.empty(); components = components.subspan(kEpoch16Components), epoch += 2) {
    long c[kEpoch16Components];
    std::ranges::transform(components.first<kEpoch16Components>(), c, truncateToLong);
    const double status =
        computeEPOCH16(c[0], c[1], c[2], c[3], c[4], c[5], c[6], c[7], c[8], c[9], epoch);
    if (status == ILLEGAL_EPOCH_VALUE) raiseIllegalTime(components);
  }
  outputs[0] = epochs;
}

void epochBreakdown(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  if (qvGetClassID(arguments[0]) != qvDOUBLE_CLASS) {
    raiseError(validate::argumentNotDoublePrecision("EPOCHTIME"));
  }
  const std::size_t count = qvGetNumberOfElements(arguments[0]);
  qvArray* times = createDoubles({kEpochComponents, count});
  const double* epoch = doublesOf(arguments[0]);
  double* time = doublesOf(times);
  for (std::size_t k = 0; k < count; ++k, ++epoch) {
    long c[kEpochComponents] = {};
    EPOCHbreakdown(*epoch, &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6]);
    for (const long component : c)
      *time++ = static_cast<double>(component);
  }
  outputs[0] = times;
}

void epoch16Breakdown(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  const std::size_t elements = qvGetNumberOfElements(arguments[0]);
  if (elements % 2 != 0) raiseError(cdflib::badEpoch16Modulus());
  if (qvGetClassID(arguments[0]) != qvDOUBLE_CLASS) {
    raiseError(validate::argumentNotDoublePrecision("EPOCH16TIME"));
  }
  qvArray* times = createDoubles(epoch16BreakdownSizes(arguments[0]));
  const double* epoch = doublesOf(arguments[0]);
  double* time = doublesOf(times);
  for (std::size_t k = 0; k < elements; k += 2) {
    double pair[] = {epoch[k], epoch[k + 1]};
    long c[kEpoch16Components] = {};
    EPOCH16breakdown(pair, &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6], &c[7], &c[8], &c[9]);
    for (const long component : c)
      *time++ = static_cast<double>(component);
  }
  outputs[0] = times;
}

}  // namespace TOLVEX::ambrix
