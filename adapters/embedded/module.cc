#include "ambrix/module.h"

#include <algorithm>
#include <array>
#include <climits>
#include <new>
#include <optional>
#include <stdexcept>
#include <utility>

#include "adapters/common/host_errors.h"
#include "adapters/common/slots.h"
#include "adapters/embedded/array_object.h"
#include "adapters/embedded/loaded_module.h"
#include "adapters/embedded/module_frame.h"

namespace ambrix {
namespace {

/// The inputs of a call as the module takes them: the command, then the arguments.
class Inputs {
 public:
  Inputs(ArrayView command, std::span<const ArrayView> arguments) : count_(arguments.size() + 1) {
    if (count_ > INT_MAX) throw std::invalid_argument("too many arguments");
    if (count_ > few_.size()) many_.resize(count_);
    const qvArray** next = data();
    *next = handleOf(command);
    for (const ArrayView argument : arguments)
      *++next = handleOf(argument);
  }

  [[nodiscard]] int count() const noexcept { return static_cast<int>(count_); }
  [[nodiscard]] const qvArray** data() noexcept {
    return many_.empty() ? few_.data() : many_.data();
  }

 private:
  static const qvArray* handleOf(ArrayView array) {
    if (!array) throw std::invalid_argument("an input of the call is no array");
    return array.handle();
  }

  std::size_t count_;
  std::array<const qvArray*, 16> few_;
  std::vector<const qvArray*> many_;
};

/// Takes over the results; those beyond the wanted ones go.
std::vector<Array> takeResults(const Slots& slots, std::size_t wanted) {
  const auto filled = resultsIn(slots);
  std::vector<Array> results;
  results.reserve(std::min(filled.size(), wanted));
  for (qvArray* const result : filled) {
    if (!result->is_linked()) {
      throw std::logic_error("the module has returned an array that is not its own");
    }
    Array array = Array::adopt(result);
    if (results.size() < wanted) results.push_back(std::move(array));
  }
  return results;
}

}  // namespace

struct Module::State {
  ModuleRecord record;
  std::optional<LoadedModule> library;
  EntryPoint entryPoint = nullptr;  // null when unloaded
  LiveCounts leaks;

  ~State() { unload(); }

  void load(const std::filesystem::path& path) {
    const ModuleFrame frame(record);  // for what the module does while it is loaded
    library.emplace(path);
    entryPoint = library->entryPoint();
  }

  std::vector<Array> call(Inputs& inputs, std::size_t outputs) {
    ModuleFrame frame(record);
    Slots slots{};
    entryPoint(static_cast<int>(std::min(outputs, kSlots)), slots.data(), inputs.count(),
               inputs.data());
    std::vector<Array> results = takeResults(slots, outputs);
    const LiveCounts left = frame.remaining();
    leaks.arrays += left.arrays;
    leaks.scratch += left.scratch;
    return results;
  }

  void unload() noexcept {
    if (std::exchange(entryPoint, nullptr) == nullptr) return;
    record.warnings.clear();
    record.unloading = true;
    runExitHandler();
    library.reset();
  }

  void runExitHandler() noexcept {
    const ModuleFrame frame(record);
    try {
      if (record.exitHandler != nullptr) std::exchange(record.exitHandler, nullptr)();
    } catch (...) {
      // There is nobody left to tell: the module goes either way.
    }
  }
};

Module::Module(const std::filesystem::path& path) : state_(std::make_unique<State>()) {
  state_->load(path);
}

Module::Module(EntryPoint entryPoint) : state_(std::make_unique<State>()) {
  if (entryPoint == nullptr) throw std::invalid_argument("a module needs an entry point");
  state_->entryPoint = entryPoint;
}

Module::Module(Module&& other) noexcept = default;
Module& Module::operator=(Module&& other) noexcept = default;
Module::~Module() = default;

std::vector<Array> Module::call(ArrayView command, std::span<const ArrayView> arguments,
                                std::size_t outputs) {
  if (!loaded()) throw std::logic_error("the module is not loaded");
  state_->record.warnings.clear();
  try {
    Inputs inputs(command, arguments);
    return state_->call(inputs, outputs);
  } catch (const std::bad_alloc&) {
    raiseOutOfMemory();
  }
}

std::vector<Array> Module::call(ArrayView command, std::span<const Array> arguments,
                                std::size_t outputs) {
  const std::vector<ArrayView> views(arguments.begin(), arguments.end());
  return call(command, std::span<const ArrayView>(views), outputs);
}

std::vector<Array> Module::call(ArrayView command, std::initializer_list<ArrayView> arguments,
                                std::size_t outputs) {
  return call(command, std::span(std::data(arguments), arguments.size()), outputs);
}

std::vector<Array> Module::call(std::string_view command, std::span<const ArrayView> arguments,
                                std::size_t outputs) {
  return call(Array::fromNarrow(command), arguments, outputs);
}

std::vector<Array> Module::call(std::string_view command, std::span<const Array> arguments,
                                std::size_t outputs) {
  return call(Array::fromNarrow(command), arguments, outputs);
}

std::vector<Array> Module::call(std::string_view command,
                                std::initializer_list<ArrayView> arguments, std::size_t outputs) {
  return call(Array::fromNarrow(command), arguments, outputs);
}

void Module::setWarningHandler(WarningHandler handler) {
  if (state_) state_->record.warningHandler = std::move(handler);
}

const std::vector<MessageId>& Module::lastWarnings() const noexcept {
  static const std::vector<MessageId> kNone;
  return state_ ? state_->record.warnings : kNone;
}

void Module::setExtended(bool extended) {
  if (state_) state_->record.extended = extended;
}

bool Module::extended() const noexcept {
  return state_ && state_->record.extended;
}

LiveCounts Module::leaks() const noexcept {
  return state_ ? state_->leaks : LiveCounts{};
}

void Module::unload() {
  if (!loaded()) return;
  if (state_->record.depth > 0) throw std::logic_error("the module is being called");
  state_->unload();
}

bool Module::loaded() const noexcept {
  return state_ && state_->entryPoint != nullptr;
}

}  // namespace ambrix
