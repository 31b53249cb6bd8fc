#include "gateway/arguments.h"

#include <boost/numeric/conversion/cast.hpp>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <stdexcept>

#include "gateway/errors.h"
#include "gateway/raise_error.h"
#include "gateway/scratch.h"

namespace TOLVEX::ambrix {
namespace {

// Users and hosts know this text; standard libraries word it differently.
[[noreturn]] void throwNotText() {
  throw std::logic_error("basic_string::_M_construct null not valid");
}

template <typename Element>
std::vector<long> convertAll(const qvArray* argument) {
  const auto* elements = static_cast<const Element*>(qvGetReadOnlyData(argument));
  std::vector<long> values(qvGetNumberOfElements(argument));
  for (std::size_t i = 0; i < values.size(); ++i)
    values[i] = truncateToLong(static_cast<double>(elements[i]));
  return values;
}

}  // namespace

long truncateUnusual(double value) {
  if (std::isnan(value)) return std::numeric_limits<long>::min();
  return boost::numeric_cast<long>(value);
}

void requireInRange(std::span<const double> values) {
  for (const double value : values)
    truncateToLong(value);
}

long getLongScalarArg(const qvArray* argument, const char* label) {
  if (qvGetClassID(argument) != qvDOUBLE_CLASS || qvGetNumberOfElements(argument) != 1) {
    raiseError(validate::argumentNotDoubleScalar(label));
  }
  return truncateToLong(*static_cast<const double*>(qvGetReadOnlyData(argument)));
}

std::vector<long> getLongVectorArg(const qvArray* argument, const char* label) {
  if (qvGetNumberOfElements(argument) == 0) return {};
  switch (qvGetClassID(argument)) {
    case qvDOUBLE_CLASS:
      return convertAll<double>(argument);
    case qvSINGLE_CLASS:
      return convertAll<float>(argument);
    case qvINT8_CLASS:
      return convertAll<std::int8_t>(argument);
    case qvUINT8_CLASS:
      return convertAll<std::uint8_t>(argument);
    case qvINT16_CLASS:
      return convertAll<std::int16_t>(argument);
    case qvUINT16_CLASS:
      return convertAll<std::uint16_t>(argument);
    case qvINT32_CLASS:
      return convertAll<std::int32_t>(argument);
    case qvUINT32_CLASS:
      return convertAll<std::uint32_t>(argument);
    case qvINT64_CLASS:
      return convertAll<std::int64_t>(argument);
    case qvUINT64_CLASS:
      return convertAll<std::uint64_t>(argument);
    case qvLOGICAL_CLASS:
      return convertAll<bool>(argument);
    case qvCHAR_CLASS:
      return convertAll<char16_t>(argument);
    default:
      raiseError(validate::argumentNotDoublePrecision(label));
  }
}

std::string getStringArg(const qvArray* argument) {
  const HostString text(qvArrayToString(argument));
  if (!text) throwNotText();
  return text.get();
}

std::string getFilenameArg(const qvArray* argument) {
  if (qvGetClassID(argument) != qvCHAR_CLASS) throwNotText();
  const std::size_t length = qvGetNumberOfElements(argument);
  if (length == 0) return {};
  const HostString name(qvUtf16ToNarrow(qvGetReadOnlyChars(argument), length));
  if (!name) raiseError(cdflib::invalidCharError());
  return name.get();
}

}  // namespace TOLVEX::ambrix
