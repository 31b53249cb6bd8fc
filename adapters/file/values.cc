// Reading and writing values.
#include <cstring>
#include <utility>

#include "adapters/file/extended_calls.h"
#include "adapters/file/numbers.h"
#include "ambrix/file.h"

namespace ambrix {
namespace {

/// Which variable and which of its values: all that the hyperslab commands need but the data.
std::vector<Array> slabArguments(const Variable& variable, const Slab& slab) {
  const std::vector<std::size_t> ones(slab.count.size(), 1);
  std::vector<Array> arguments;
  for (const std::size_t number :
       {variable.number, slab.firstRecord, slab.records, slab.recordStep})
    arguments.push_back(Array::scalar(static_cast<double>(number)));
  arguments.push_back(rowOf(slab.start));
  arguments.push_back(rowOf(slab.count));
  arguments.push_back(rowOf(slab.step.empty() ? ones : slab.step));
  return arguments;
}

/// What commands do not read: no records.
Array noRecords(const Variable& variable, const Slab& slab) {
  std::vector<std::size_t> sizes;
  const bool isPlain = !isCharacterType(variable.datatype) && variable.valueElements() == 1;
  if (!isPlain) sizes.push_back(variable.valueElements());
  sizes.insert(sizes.end(), slab.count.begin(), slab.count.end());
  sizes.push_back(0);
  return Array::zeros(findDatatype(variable.datatype)->classId, sizes);
}

/// A part of a slab, as its own slab of the variable. The part counts from the slab's first value.
Slab within(const Slab& slab, Slab part) {
  part.firstRecord = slab.firstRecord + part.firstRecord * slab.recordStep;
  part.recordStep = slab.recordStep;
  part.step = slab.step;
  for (std::size_t i = 0; i < part.start.size(); ++i) {
    const std::size_t step = slab.step.empty() ? 1 : slab.step[i];
    part.start[i] = slab.start[i] + part.start[i] * step;
  }
  return part;
}

}  // namespace

void File::requireSupported(const Variable& variable) const {
  if (variable.supported && findDatatype(variable.datatype) != nullptr) return;
  throw FileError(path(), "unsupportedDatatype",
                  "variable \"" + variable.name + "\" has the datatype " +
                      datatypeName(variable.datatype) + ", which is not supported");
}

Array File::read(const Variable& variable) {
  return read(variable,
              Slab::ofRecords(variable, 0, sizeOf(static_cast<double>(recordCount(variable)))));
}

Array File::read(const Variable& variable, const Slab& slab) {
  requireSupported(variable);
  announce(Step::Kind::kValues, variable.number, variable.name);
  if (slab.records == 0) return noRecords(variable, slab);
  const std::vector<Array> arguments = slabArguments(variable, slab);
  const std::vector<ArrayView> views(arguments.begin(), arguments.end());
  const ExtendedCalls extended(*module_);
  return std::move(call("hyperGetVarData", views).at(0));
}

void File::readInto(const Variable& variable, const Slab& slab, std::span<std::byte> memory) {
  Variable block = variable;
  block.sizes = slab.count;
  SlabPlan plan(block, 0, slab.records);
  while (const auto part = plan.next()) {
    const Array values = read(variable, within(slab, *part));
    const std::span<const std::byte> bytes = values.bytes();
    if (bytes.size() > memory.size()) throw wrongSize();
    std::memcpy(memory.data(), bytes.data(), bytes.size());
    memory = memory.subspan(bytes.size());
  }
  if (!memory.empty()) throw wrongSize();
}

FileError File::wrongSize() const {
  return {path(), "wrongSize", "the memory for values is of another size than the values"};
}

void File::write(const Variable& variable, ArrayView values, std::size_t firstRecord) {
  requireOpen();
  requireWritable();
  requireSupported(variable);
  const std::size_t elements = variable.recordElements();
  const std::size_t records = elements == 0 ? 0 : values.elementCount() / elements;
  if (records * elements != values.elementCount()) {
    throw FileError(path(), "partOfRecord",
                    std::to_string(values.elementCount()) + " elements for variable \"" +
                        variable.name + "\", whose records have " + std::to_string(elements));
  }
  if (records > 0) write(variable, Slab::ofRecords(variable, firstRecord, records), values);
}

void File::append(const Variable& variable, ArrayView values) {
  write(variable, values, sizeOf(static_cast<double>(recordCount(variable))));
}

void File::write(const Variable& variable, const Slab& slab, ArrayView values) {
  requireSupported(variable);
  const std::vector<Array> arguments = slabArguments(variable, slab);
  std::vector<ArrayView> views(arguments.begin(), arguments.end());
  views.push_back(values);
  change("hyperPutVarData", views);
}

void File::deleteRecords(const Variable& variable, std::size_t first, std::size_t records) {
  requireOpen();
  requireWritable();
  if (records == 0) return;
  const auto last = static_cast<double>(first + records - 1);
  change("deleteVarRecords", {numberOf(variable), static_cast<double>(first), last});
}

}  // namespace ambrix
