#include "ambrix/array_view.h"

#include <stdexcept>

#include "adapters/catalogue/unicode.h"
#include "adapters/common/class_names.h"
#include "adapters/embedded/array_object.h"

namespace ambrix {
namespace {

constexpr bool isSame(ClassId ours, qvClassID theirs) {
  return static_cast<int>(ours) == theirs;
}

static_assert(isSame(ClassId::kUnknown, qvUNKNOWN_CLASS) && isSame(ClassId::kCell, qvCELL_CLASS) &&
              isSame(ClassId::kLogical, qvLOGICAL_CLASS) && isSame(ClassId::kChar, qvCHAR_CLASS) &&
              isSame(ClassId::kDouble, qvDOUBLE_CLASS) &&
              isSame(ClassId::kSingle, qvSINGLE_CLASS) && isSame(ClassId::kInt8, qvINT8_CLASS) &&
              isSame(ClassId::kUint8, qvUINT8_CLASS) && isSame(ClassId::kInt16, qvINT16_CLASS) &&
              isSame(ClassId::kUint16, qvUINT16_CLASS) && isSame(ClassId::kInt32, qvINT32_CLASS) &&
              isSame(ClassId::kUint32, qvUINT32_CLASS) && isSame(ClassId::kInt64, qvINT64_CLASS) &&
              isSame(ClassId::kUint64, qvUINT64_CLASS));

}  // namespace

const char* className(ClassId classId) noexcept {
  return nameOfClass(static_cast<qvClassID>(classId));
}

ClassId ArrayView::classId() const noexcept {
  return static_cast<ClassId>(array_->classId);
}
const char* ArrayView::className() const noexcept {
  return ambrix::className(classId());
}
std::size_t ArrayView::elementCount() const noexcept {
  return array_->elementCount;
}

std::span<const std::size_t> ArrayView::size() const noexcept {
  return {array_->sizes(), array_->dimensionCount};
}

std::span<const std::byte> ArrayView::bytes() const noexcept {
  if (array_->classId == qvCELL_CLASS) return {};
  return {static_cast<const std::byte*>(array_->elements),
          array_->elementCount * elementBytes(array_->classId)};
}

std::u16string_view ArrayView::chars() const {
  const std::span<const char16_t> units = data<char16_t>();
  return {units.data(), units.size()};
}

std::string ArrayView::utf8() const {
  return catalogue::toUtf8(chars());
}

ArrayView ArrayView::element(std::size_t index) const {
  (void)elementsOf(ClassId::kCell);
  return ArrayView(cellAt(*array_, index));
}

const void* ArrayView::elementsOf(ClassId classId) const {
  if (array_ == nullptr) throw std::logic_error("there is no array");
  if (this->classId() == classId) return array_->elements;
  throw std::logic_error(std::string("the array is of class ") + className() + ", not " +
                         ambrix::className(classId));
}

}  // namespace ambrix
