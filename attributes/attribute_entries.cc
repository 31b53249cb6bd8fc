#include "attributes/attribute_entries.h"

#include <optional>

#include "attributes/attribute_arguments.h"
#include "gateway/errors.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"
#include "gateway/raise_error.h"
#include "gateway/value_buffer.h"
#include "variables/bytes_to_write.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

struct EntryAddress {
  CdfId file;
  long attributeNumber;
  long entryNumber;
};

EntryAddress getEntryAddressArgs(const qvArray* arguments[], const char* attributeLabel) {
  // Braces convert from left to right.
  return {getCdfIdArg(arguments[0]), getAttributeArg(arguments[1], attributeLabel),
          getEntryArg(arguments[2])};
}

struct EntryDescription {
  long datatype = 0;
  long elements = 0;
};

EntryDescription inquire(const EntryKind& kind, const EntryAddress& at) {
  EntryDescription found;
  checkLibraryStatus(
      CDFinquireAttrEntry(libraryHandle(at.file, kind.inquireRoutine), kind.kind,
                          at.attributeNumber, at.entryNumber, &found.datatype, &found.elements),
      kind.inquireRoutine);
  return found;
}

const EntryKind& kindForScope(long scope) {
  switch (scope) {
    case GLOBAL_SCOPE:
      return kGEntry;
    case VARIABLE_SCOPE:
      return kZEntry;
    default:
      raiseError(cdflib::unrecognizedValue(scope, "SCOPE"));
  }
}

/// What the library reads of a value: of `CDF_CHAR` the host's narrow copy of the text, which is
/// left to the host if the entry cannot be put.
class EntryData {
 public:
  EntryData(const qvArray* value, long datatype)
      : text_(datatype == CDF_CHAR ? qvArrayToString(value) : nullptr) {
    if (text_ == nullptr) data_.emplace(value);
  }
  [[nodiscard]] void* bytes() const { return data_ ? data_->bytes() : text_; }
  void release() const {
    if (text_ != nullptr) qvFree(text_);
  }

 private:
  char* text_;
  std::optional<BytesToWrite> data_;
};

}  // namespace

void getEntry(const EntryKind& kind, qvArray* outputs[], const qvArray* arguments[]) {
  const EntryAddress at = getEntryAddressArgs(arguments, "ATTRNUM");
  const EntryDescription description = inquire(kind, at);
  validateDatatype(description.datatype);  // before the library is given a buffer for its values
  if (description.elements < 0) raiseLibraryFailure(BAD_NUM_ELEMS, kind.getRoutine);
  ValueBuffer buffer;
  resizeValueBuffer(buffer, description.datatype, description.elements);
  unsigned char nothing = 0;
  checkLibraryStatus(
      CDFgetAttrEntry(libraryHandle(at.file, kind.getRoutine), kind.kind, at.attributeNumber,
                      at.entryNumber, buffer.empty() ? &nothing : buffer.data()),
      kind.getRoutine);
  outputs[0] = createArrayFromBuffer(buffer, description.datatype);
}

void inquireEntry(const EntryKind& kind, qvArray* outputs[], const qvArray* arguments[]) {
  const EntryAddress at = getEntryAddressArgs(arguments, "ATTRNUM");
  const EntryDescription description = inquire(kind, at);
  setOutputs(outputs,
             {datatypeNameArray(description.datatype), makeDoubleScalar(description.elements)});
}

void deleteEntry(const EntryKind& kind, const qvArray* arguments[]) {
  const EntryAddress at = getEntryAddressArgs(arguments, kind.deleteLabel);
  checkLibraryStatus(CDFdeleteAttrEntry(libraryHandle(at.file, kind.deleteRoutine), kind.kind,
                                        at.attributeNumber, at.entryNumber),
                     kind.deleteRoutine);
}

void putAttrEntry(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const EntryAddress at = getEntryAddressArgs(arguments, "ATTRNUM");
  const long datatype = getLongScalarArg(arguments[3], "DATATYPE");
  const qvArray* value = arguments[4];
  validateDatatype(datatype);
  if (qvGetClassID(value) != classIdForDatatype(datatype)) {
    raiseError(cdflib::badPutAttrEntryDatatype(qvGetClassName(value), datatypeName(datatype)));
  }
  auto elements = static_cast<long>(qvGetNumberOfElements(value));
  if (datatype == CDF_EPOCH16) elements /= 2;  // each value is a pair of doubles
  const EntryData data(value, datatype);
  long scope = 0;
  callOnFile("CDFgetAttrScope", at.file, ATTR_, at.attributeNumber, GET_, ATTR_SCOPE_, &scope);
  const EntryKind& kind = kindForScope(scope);
  checkLibraryStatus(
      CDFputAttrEntry(libraryHandle(at.file, kind.putRoutine), kind.kind, at.attributeNumber,
                      at.entryNumber, datatype, libraryNumber(elements, kBadNumber), data.bytes()),
      kind.putRoutine);
  data.release();
}

}  // namespace TOLVEX::ambrix
