#include "src/open_file.h"

#include <nanobind/stl/string.h>
#include <nanobind/stl/vector.h>
#include <unistd.h>

#include <optional>
#include <utility>

#include "src/description.h"
#include "src/library.h"
#include "src/numpy.h"
#include "src/results.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

Slab slabOf(const Block& block) {
  return {.firstRecord = block.firstRecord,
          .records = block.records,
          .start = block.start,
          .count = block.count,
          .recordStep = block.recordStep,
          .step = block.step};
}

}  // namespace

OpenFile::OpenFile(const std::string& path) : process_(getpid()) {
  try {
    withExtendedModule(
        [&](Module& module) { file_ = std::make_unique<File>(File::open(module, path)); });
  } catch (...) {
    closeSilently();  // when a warning has become an exception, the file is open
    throw;
  }
}

OpenFile::~OpenFile() {
  closeSilently();
}

/// In the module's turn, which the file itself would not wait for.
void OpenFile::closeSilently() noexcept {
  if (process_ != getpid() || file_ == nullptr || !file_->isOpen()) return;
  try {
    close();
  } catch (...) {
    // It was open for reading: nothing is lost.
  }
}

void OpenFile::close() {
  withExtendedModule([&](Module&) { file_->close(); });
}

nb::object OpenFile::describe() {
  FileDescription description;
  withExtendedModule([&](Module&) { description = file_->describe(); });
  return describedInPython(std::move(description));
}

nb::object OpenFile::read(std::size_t variable, const Block& block) {
  Array values;
  std::size_t dimensions = block.count.size() + 1;
  withExtendedModule([&](Module&) {
    const Variable definition = file_->variable(variable);
    if (isCharacterType(definition.datatype) || definition.valueElements() > 1) ++dimensions;
    values = file_->read(definition, slabOf(block));
  });
  return convertResult(ResultKind::kBlock, std::move(values), dimensions);
}

void OpenFile::readInto(std::size_t variable, const Block& block, nb::handle array) {
  PyArrayObject* const target = arrayOf(array);
  const std::span memory(static_cast<std::byte*>(PyArray_DATA(target)),
                         static_cast<std::size_t>(PyArray_NBYTES(target)));
  withExtendedModule(
      [&](Module&) { file_->readInto(file_->variable(variable), slabOf(block), memory); });
}

std::size_t OpenFile::blockingFactor(std::size_t variable) {
  std::size_t records = 0;
  withExtendedModule([&](Module&) { records = file_->blockingFactor(file_->variable(variable)); });
  return records;
}

void bindOpenFile(nb::module_& module) {
  nb::class_<Block>(module, "Block", "A block of a variable's values.")
      .def(nb::init<std::size_t, std::size_t, std::size_t, std::vector<std::size_t>,
                    std::vector<std::size_t>, std::vector<std::size_t>>(),
           nb::arg("first_record"), nb::arg("records"), nb::arg("record_step"), nb::arg("start"),
           nb::arg("count"), nb::arg("step"));
  nb::class_<OpenFile>(module, "OpenFile", "A file that is open for reading.")
      .def(nb::init<const std::string&>(), nb::arg("path"))
      .def("close", &OpenFile::close)
      .def("describe", &OpenFile::describe)
      .def("read", &OpenFile::read, nb::arg("variable"), nb::arg("block"))
      .def("read_into", &OpenFile::readInto, nb::arg("variable"), nb::arg("block"),
           nb::arg("array"))
      .def("blocking_factor", &OpenFile::blockingFactor, nb::arg("variable"));
}

}  // namespace ambrix::python
