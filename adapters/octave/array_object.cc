#include "adapters/octave/array_object.h"

#include <octave/Cell.h>

#include <algorithm>
#include <cstdint>
#include <stdexcept>
#include <utility>

#include "adapters/common/class_names.h"
#include "adapters/common/host_errors.h"
#include "adapters/common/narrow_text.h"
#include "adapters/common/shape.h"
#include "adapters/octave/class_of.h"
#include "adapters/octave/fresh_array.h"

using ambrix::Content;
using ambrix::Shape;
using namespace ambrix::octave_host;

namespace {

dim_vector dimensionsOf(const Shape& shape) {
  dim_vector dims;
  dims.resize(static_cast<int>(shape.dimensionCount));
  for (std::size_t i = 0; i < shape.dimensionCount; ++i)
    dims.xelem(static_cast<int>(i)) = static_cast<octave_idx_type>(shape[i]);
  return dims;
}

NDArray realDoubles(const octave_value& value) {
  return value.iscomplex() ? real(value.complex_array_value()) : value.array_value();
}

FloatNDArray realSingles(const octave_value& value) {
  return value.iscomplex() ? real(value.float_complex_array_value()) : value.float_array_value();
}

boolNDArray logicals(const octave_value& value) {
  return value.issparse() ? value.full_value().bool_array_value() : value.bool_array_value();
}

octave_value narrowed(const Characters& characters, const dim_vector& dims) {
  auto bytes = makeUnsetArray<charNDArray>(dims);
  ambrix::narrow({characters.get(), static_cast<std::size_t>(bytes.numel())}, bytes.fortran_vec());
  return octave_value(bytes, '\'');
}

octave_value joined(const Cells& cells, const dim_vector& dims) {
  Cell values(dims);
  octave_idx_type index = 0;
  for (const qvArray* const cell : cells) {
    values.xelem(index++) = cell == nullptr ? octave_value(Matrix()) : cell->toOctave();
  }
  return values;
}

}  // namespace

qvArray::qvArray(const octave_value& argument) : classId_(classOf(argument)), argument_(argument) {}

qvArray::qvArray(qvClassID classId, std::span<const std::size_t> sizes, Content content)
    : classId_(classId), dims_(dimensionsOf(ambrix::shapeOf(sizes))) {
  create(*dims_, content);
}

charNDArray qvArray::bytes() const {
  return argument_.is_defined() ? argument_.char_array_value() : toOctave().char_array_value();
}

const char* qvArray::className() const {
  if (classId_ != qvUNKNOWN_CLASS) return ambrix::nameOfClass(classId_);
  if (className_.empty()) className_ = argument_.class_name();
  return className_.c_str();
}

std::size_t qvArray::elementCount() const {
  return static_cast<std::size_t>(dims_ ? dims_->numel() : argument_.numel());
}

std::span<const std::size_t> qvArray::sizes() const {
  if (!dims_) dims_ = argument_.dims();
  // Octave's signed sizes are never negative; the two types may alias.
  const auto* const first = reinterpret_cast<const std::size_t*>(&dims_->xelem(0));
  return {first, static_cast<std::size_t>(dims_->ndims())};
}

void* qvArray::data() const {
  takeOut();
  return data_;
}

Cells* qvArray::cells() const {
  takeOut();
  return std::get_if<Cells>(&elements_);
}

template <typename OctaveArray>
void qvArray::hold(const OctaveArray& array) const {
  data_ = const_cast<void*>(static_cast<const void*>(array.data()));  // shared, only read
  elements_ = array;
}

void qvArray::widenArgument() const {
  const charNDArray source = bytes();
  const auto count = static_cast<std::size_t>(source.numel());
  auto units = std::make_unique_for_overwrite<char16_t[]>(count);
  ambrix::widen({source.data(), count}, units.get());
  data_ = units.get();
  elements_ = std::move(units);
}

void qvArray::takeOutCells() const {
  const Cell values = argument_.cell_value();
  children_.reserve(static_cast<std::size_t>(values.numel()));
  auto& cells = elements_.emplace<Cells>();
  for (octave_idx_type i = 0; i < values.numel(); ++i)
    cells.push_back(&children_.emplace_back(values.xelem(i)));
}

void qvArray::takeOut() const {
  if (argument_.is_undefined() || !std::holds_alternative<std::monostate>(elements_)) return;
  switch (classId_) {
    case qvDOUBLE_CLASS:
      if (!argument_.is_real_scalar()) return hold(realDoubles(argument_));
      data_ = &elements_.emplace<double>(argument_.double_value());
      return;
    case qvUINT64_CLASS:
      if (!argument_.is_real_scalar()) return hold(argument_.uint64_array_value());
      data_ = &elements_.emplace<octave_uint64>(argument_.uint64_scalar_value());
      return;
    case qvSINGLE_CLASS:
      return hold(realSingles(argument_));
    case qvINT8_CLASS:
      return hold(argument_.int8_array_value());
    case qvUINT8_CLASS:
      return hold(argument_.uint8_array_value());
    case qvINT16_CLASS:
      return hold(argument_.int16_array_value());
    case qvUINT16_CLASS:
      return hold(argument_.uint16_array_value());
    case qvINT32_CLASS:
      return hold(argument_.int32_array_value());
    case qvUINT32_CLASS:
      return hold(argument_.uint32_array_value());
    case qvINT64_CLASS:
      return hold(argument_.int64_array_value());
    case qvLOGICAL_CLASS:
      return hold(logicals(argument_));
    case qvCHAR_CLASS:
      return widenArgument();
    case qvCELL_CLASS:
      return takeOutCells();
    case qvUNKNOWN_CLASS:
    case qvSTRUCT_CLASS:
      return;
  }
}

template <typename OctaveArray>
void qvArray::make(const dim_vector& dims, Content content) {
  auto& array = elements_.emplace<OctaveArray>(makeUnsetArray<OctaveArray>(dims));
  auto* const first = array.fortran_vec();
  if (content == Content::kZero) std::fill_n(first, array.numel(), 0);
  data_ = first;
}

void qvArray::create(const dim_vector& dims, Content content) {
  const auto count = static_cast<std::size_t>(dims.safe_numel());
  switch (classId_) {
    case qvDOUBLE_CLASS:
      return make<NDArray>(dims, content);
    case qvSINGLE_CLASS:
      return make<FloatNDArray>(dims, content);
    case qvINT8_CLASS:
      return make<int8NDArray>(dims, content);
    case qvUINT8_CLASS:
      return make<uint8NDArray>(dims, content);
    case qvINT16_CLASS:
      return make<int16NDArray>(dims, content);
    case qvUINT16_CLASS:
      return make<uint16NDArray>(dims, content);
    case qvINT32_CLASS:
      return make<int32NDArray>(dims, content);
    case qvUINT32_CLASS:
      return make<uint32NDArray>(dims, content);
    case qvINT64_CLASS:
      return make<int64NDArray>(dims, content);
    case qvUINT64_CLASS:
      return make<uint64NDArray>(dims, content);
    case qvLOGICAL_CLASS:
      return make<boolNDArray>(dims, content);
    case qvCHAR_CLASS:
      data_ =
          elements_.emplace<Characters>(std::make_unique_for_overwrite<char16_t[]>(count)).get();
      return;
    case qvCELL_CLASS:
      if (count > Cells().max_size()) ambrix::raiseOutOfMemory();  // which a vector tells otherwise
      elements_.emplace<Cells>(count);
      return;
    case qvUNKNOWN_CLASS:
    case qvSTRUCT_CLASS:
      break;
  }
  throw std::logic_error("no result can have this class");
}

octave_value qvArray::toOctave() const {
  if (argument_.is_defined()) return argument_;
  return std::visit(
      [this](const auto& elements) -> octave_value {
        using Kind = std::decay_t<decltype(elements)>;
        if constexpr (std::is_same_v<Kind, std::monostate>) {
          return {};
        } else if constexpr (std::is_same_v<Kind, Characters>) {
          return narrowed(elements, *dims_);
        } else if constexpr (std::is_same_v<Kind, Cells>) {
          return joined(elements, *dims_);
        } else {
          return elements;
        }
      },
      elements_);
}
