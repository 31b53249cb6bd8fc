#include "fuzz/files/file_maker.h"

#include <array>
#include <cstddef>
#include <stdexcept>
#include <string_view>
#include <utility>

#include "tests/support/datatypes.h"

namespace ambrix::fuzz {
namespace {

using ambrix_test::CdfDatatype;

const CdfDatatype& datatypeNamed(std::string_view name) {
  for (const CdfDatatype& datatype : ambrix_test::kCdfDatatypes)
    if (datatype.name == name) return datatype;
  throw std::invalid_argument(std::string(name));
}

/// Values with runs of zeros and with others that repeat, so that every compression finds some.
Array someValues(const CdfDatatype& datatype, std::size_t count) {
  std::vector<std::byte> bytes(count * elementBytes(datatype));
  for (std::size_t i = 0; i < bytes.size(); ++i)
    if (i / 24 % 2 == 1) bytes[i] = static_cast<std::byte>(i * i / 7 % 100);
  if (datatype.classId == ClassId::kChar) {
    std::u16string text(count, u'a');
    for (std::size_t i = 0; i < count; ++i)
      text[i] = static_cast<char16_t>(u'a' + i % 7);
    return Array::text(text);
  }
  return Array::fromBytes(datatype.classId, {1, count}, bytes);
}

Array rowOf(const std::vector<double>& numbers) {
  return Array::row(std::span<const double>(numbers));
}

}  // namespace

FileMaker::FileMaker(Module& module, const std::string& path)
    : module_(module), id_(std::move(module.call("create", {Array::fromUtf8(path)}).at(0))) {}

std::vector<Array> FileMaker::call(const char* command, std::span<const Array> arguments) {
  std::vector<ArrayView> all = {id_};
  all.insert(all.end(), arguments.begin(), arguments.end());
  return module_.call(command, std::span<const ArrayView>(all));
}

double FileMaker::constant(const char* name) {
  return module_.call("getConstantValue", {Array::fromNarrow(name)}).at(0).data<double>().front();
}

void FileMaker::set(const char* command, const std::vector<double>& numbers) {
  std::vector<Array> arguments;
  for (const double number : numbers)
    arguments.push_back(Array::scalar(number));
  call(command, arguments);
}

double FileMaker::createVariable(const NewVariable& variable) {
  std::vector<Array> arguments;
  arguments.push_back(Array::fromNarrow(variable.name));
  arguments.push_back(Array::scalar(constant(variable.datatype)));
  arguments.push_back(Array::scalar(variable.elements));
  arguments.push_back(rowOf(variable.sizes));
  arguments.push_back(Array::scalar(true));
  arguments.push_back(rowOf(std::vector<double>(variable.sizes.size(), -1)));
  return call("createVar", arguments).at(0).data<double>().front();
}

void FileMaker::fill(double number, const NewVariable& variable, double first, double records) {
  const std::string_view datatype = variable.datatype;
  double count = variable.elements * records * (datatype == "CDF_EPOCH16" ? 2 : 1);
  for (const double size : variable.sizes)
    count *= size;
  const std::size_t dimensions = variable.sizes.size();
  std::vector<Array> arguments;
  for (const double argument : {number, first, records, 1.0})
    arguments.push_back(Array::scalar(argument));
  arguments.push_back(rowOf(std::vector<double>(dimensions, 0)));
  arguments.push_back(rowOf(variable.sizes));
  arguments.push_back(rowOf(std::vector<double>(dimensions, 1)));
  arguments.push_back(someValues(datatypeNamed(datatype), static_cast<std::size_t>(count)));
  call("hyperPutVarData", arguments);
}

void FileMaker::addVariable(const NewVariable& variable, double records) {
  fill(createVariable(variable), variable, 0, records);
}

void FileMaker::addAttribute(const std::string& name, const char* scope, double entries) {
  std::vector<Array> arguments;
  arguments.push_back(Array::fromNarrow(name));
  arguments.push_back(Array::scalar(constant(scope)));
  call("createAttr", arguments);
  for (double entry = 0; entry < entries; ++entry) {
    const char* datatype = static_cast<int>(entry) % 2 == 0 ? "CDF_CHAR" : "CDF_REAL8";
    arguments.clear();
    arguments.push_back(Array::scalar(attributes_));
    arguments.push_back(Array::scalar(entry));
    arguments.push_back(Array::scalar(constant(datatype)));
    arguments.push_back(someValues(datatypeNamed(datatype), 3 + static_cast<std::size_t>(entry)));
    call("putAttrEntry", arguments);
  }
  ++attributes_;
}

void FileMaker::close() {
  call("close", {});
}

}  // namespace ambrix::fuzz
