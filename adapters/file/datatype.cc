#include "ambrix/datatype.h"

#include <algorithm>
#include <array>

namespace ambrix {
namespace {

using D = Datatype;
using C = ClassId;

// clang-format off
constexpr std::array<DatatypeFacts, 17> kDatatypes = {{
    {D::kInt1,       "cdf_int1",        C::kInt8,    1},
    {D::kInt2,       "cdf_int2",        C::kInt16,   1},
    {D::kInt4,       "cdf_int4",        C::kInt32,   1},
    {D::kInt8,       "cdf_int8",        C::kInt64,   1},
    {D::kUint1,      "cdf_uint1",       C::kUint8,   1},
    {D::kUint2,      "cdf_uint2",       C::kUint16,  1},
    {D::kUint4,      "cdf_uint4",       C::kUint32,  1},
    {D::kReal4,      "cdf_real4",       C::kSingle,  1},
    {D::kReal8,      "cdf_real8",       C::kDouble,  1},
    {D::kEpoch,      "cdf_epoch",       C::kDouble,  1},
    {D::kEpoch16,    "cdf_epoch16",     C::kDouble,  2},
    {D::kTimeTt2000, "cdf_time_tt2000", C::kInt64,   1},
    {D::kByte,       "cdf_byte",        C::kInt8,    1},
    {D::kFloat,      "cdf_float",       C::kSingle,  1},
    {D::kDouble,     "cdf_double",      C::kDouble,  1},
    {D::kChar,       "cdf_char",        C::kChar,    0},
    {D::kUchar,      "cdf_uchar",       C::kChar,    0},
}};
// clang-format on

char lower(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

}  // namespace

std::span<const DatatypeFacts> datatypes() noexcept {
  return kDatatypes;
}

const DatatypeFacts* findDatatype(Datatype datatype) noexcept {
  const auto* const found = std::ranges::find(kDatatypes, datatype, &DatatypeFacts::datatype);
  return found == kDatatypes.end() ? nullptr : found;
}

std::optional<Datatype> datatypeNamed(std::string_view name) noexcept {
  const auto* const found = std::ranges::find_if(kDatatypes, [name](const DatatypeFacts& row) {
    return std::ranges::equal(row.name, name, {}, {}, lower);
  });
  if (found == kDatatypes.end()) return std::nullopt;
  return found->datatype;
}

std::string datatypeName(Datatype datatype) {
  const DatatypeFacts* const facts = findDatatype(datatype);
  if (facts != nullptr) return std::string(facts->name);
  return "datatype " + std::to_string(static_cast<int>(datatype));
}

bool isCharacterType(Datatype datatype) noexcept {
  return datatype == Datatype::kChar || datatype == Datatype::kUchar;
}

bool isTimeType(Datatype datatype) noexcept {
  return datatype == Datatype::kEpoch || datatype == Datatype::kEpoch16 ||
         datatype == Datatype::kTimeTt2000;
}

std::size_t elementsPerValue(Datatype datatype, std::size_t characters) noexcept {
  const DatatypeFacts* const facts = findDatatype(datatype);
  if (facts == nullptr) return 1;
  return facts->elements == 0 ? characters : facts->elements;
}

}  // namespace ambrix
