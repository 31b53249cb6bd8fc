#include "ambrix/array.h"

#include <cstring>
#include <optional>
#include <stdexcept>

#include "adapters/catalogue/unicode.h"
#include "adapters/embedded/array_object.h"

namespace ambrix {
namespace {

/// The handle of an array that the caller owns and may change.
qvArray* owned(const qvArray* array) {
  return const_cast<qvArray*>(array);
}

void requireOwnElements(const qvArray& array) {
  if (array.storage == Storage::kBorrowed) {
    throw std::logic_error("the elements of the array are borrowed");
  }
}

qvArray* make(ClassId classId, Sizes sizes, Content content) {
  return makeArray(static_cast<qvClassID>(classId), sizes, content);
}

}  // namespace

Array& Array::operator=(Array&& other) noexcept {
  if (this != &other) destroyArray(owned(std::exchange(array_, other.release())));
  return *this;
}

Array::~Array() {
  destroyArray(owned(array_));
}

Array Array::zeros(ClassId classId, Sizes sizes) {
  return Array(make(classId, sizes, Content::kZero));
}

Array Array::uninitialized(ClassId classId, Sizes sizes) {
  return Array(make(classId, sizes, Content::kUnset));
}

Array Array::fromBytes(ClassId classId, Sizes sizes, std::span<const std::byte> elements) {
  Array array = uninitialized(classId, sizes);
  if (array.bytes().size() != elements.size()) {
    throw std::invalid_argument("the data do not fill the array");
  }
  if (!elements.empty())
    std::memcpy(owned(array.array_)->elements, elements.data(), elements.size());
  return array;
}

Array Array::borrowed(ClassId classId, Sizes sizes, std::span<const std::byte> elements,
                      std::shared_ptr<const void> keeper) {
  return Array(borrowElements(static_cast<qvClassID>(classId), sizes, elements, std::move(keeper)));
}

Array Array::text(std::u16string_view units) {
  return Array(makeText(units));
}

Array Array::fromUtf8(std::string_view utf8) {
  const std::optional<std::u16string> units = catalogue::toUtf16(utf8);
  if (!units) throw std::invalid_argument("the text is not valid UTF-8");
  return text(*units);
}

Array Array::fromNarrow(std::string_view bytes) {
  return Array(makeNarrowText(bytes));
}

void Array::setElement(std::size_t index, Array value) {
  (void)element(index);  // refuses what cannot be set while the value still has its owner
  setCell(*array_, index, value.release());
}

Array Array::copyOf(ArrayView array) {
  return array ? Array(copyArray(*array.handle())) : Array();
}

Array Array::adopt(qvArray* array) noexcept {
  if (array != nullptr) array->unlink();
  return Array(array);
}

qvArray* Array::release() noexcept {
  return owned(std::exchange(array_, nullptr));
}

void* Array::mutableElementsOf(ClassId classId) {
  const void* const elements = elementsOf(classId);
  requireOwnElements(*array_);
  return const_cast<void*>(elements);
}

OwnedElements Array::releaseElements() {
  if (array_ == nullptr) throw std::logic_error("there is no array");
  if (array_->classId == qvCELL_CLASS) throw std::logic_error("a cell array keeps its elements");
  requireOwnElements(*array_);
  OwnedElements elements(array_->elements, FreeElements(owned(array_)));
  if (!elements) *this = Array();  // nobody would free what is left of it
  (void)release();
  return elements;
}

void FreeElements::operator()(void*) const noexcept {
  destroyArray(array_);
}

}  // namespace ambrix
