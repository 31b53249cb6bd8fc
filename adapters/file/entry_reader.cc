#include "adapters/file/entry_reader.h"

#include <utility>

#include "adapters/file/extended_calls.h"
#include "adapters/file/numbers.h"
#include "ambrix/texts.h"

namespace ambrix {
namespace {

Entry found(std::size_t number, const std::vector<Array>& facts) {
  const auto datatype = datatypeNamed(bytesOf(facts.at(0)));
  const std::size_t elements = sizeOf(facts.at(1).data<double>().front());
  return {number, datatype.value_or(Datatype{}), datatype.has_value(), elements};
}

}  // namespace

EntryReader::EntryReader(File& file, const Attribute& attribute, FileObserver* observer)
    : file_(file),
      attribute_(attribute),
      observer_(observer),
      inquireCommand_(
          Array::fromNarrow(attribute.global ? "inquireAttrgEntry" : "inquireAttrEntry")),
      valueCommand_(Array::fromNarrow(attribute.global ? "getAttrgEntry" : "getAttrEntry")),
      attributeNumber_(Array::scalar(numberOf(attribute))),
      entryNumber_(Array::scalar(0.0)) {}

std::vector<Array> EntryReader::call(const Array& command, std::size_t number) {
  entryNumber_.mutableData<double>().front() = static_cast<double>(number);
  const ArrayView arguments[] = {file_.id(), attributeNumber_, entryNumber_};
  const ExtendedCalls extended(file_.module());
  return file_.module().call(command, arguments);
}

Entry EntryReader::inquire(std::size_t number) {
  std::exception_ptr failure;
  const auto entry = find(number, failure);
  if (!entry) rethrow(failure);
  return *entry;
}

Array EntryReader::value(std::size_t number) {
  try {
    return std::move(call(valueCommand_, number).at(0));
  } catch (const Error&) {
    rethrow(std::current_exception());
  }
}

void EntryReader::rethrow(const std::exception_ptr& failure) const {
  try {
    std::rethrow_exception(failure);
  } catch (const Error& error) {
    if (observer_ != nullptr) observer_->failed(error);
    throw;
  }
}

std::size_t EntryReader::count() {
  return sizeOf(file_.number(attribute_.global ? "getNumAttrgEntries" : "getNumAttrEntries",
                             {numberOf(attribute_)}));
}

std::optional<Entry> EntryReader::find(std::size_t number, std::exception_ptr& failure) try {
  return found(number, call(inquireCommand_, number));
} catch (const Error& error) {
  const auto datatype = unsupportedDatatype(error);
  if (datatype) return Entry{number, *datatype, false, 0};
  failure = std::current_exception();
  return std::nullopt;
}

}  // namespace ambrix
