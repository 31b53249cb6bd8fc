// A module: loaded, called and unloaded.
#pragma once

#include <cstddef>
#include <filesystem>
#include <functional>
#include <initializer_list>
#include <limits>
#include <memory>
#include <span>
#include <string_view>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/error.h"
#include "ambrix/export.h"
#include "ambrix/memory.h"

namespace ambrix {

/// Where the module is installed: ambrix_module.so in the folder of this library.
AMBRIX_EXPORT std::filesystem::path defaultModulePath();

/// All results of a call.
inline constexpr std::size_t kAllOutputs = std::numeric_limits<std::size_t>::max();

/// A module and the calls of its entry point. Neither the module nor the CDF library behind it may
/// be entered from two threads at a time; arrays may be made and destroyed on any thread.
class AMBRIX_EXPORT Module {
 public:
  using EntryPoint = void (*)(int, qvArray**, int, const qvArray**);
  using WarningHandler = std::function<void(const MessageId&)>;

  /// Loads a module. Throws `LoadError` when the file cannot be loaded, is no module, was built for
  /// another release of the host or is loaded already.
  explicit Module(const std::filesystem::path& path = defaultModulePath());
  /// A module whose entry point is part of the program.
  explicit Module(EntryPoint entryPoint);
  Module(Module&& other) noexcept;
  Module& operator=(Module&& other) noexcept;
  /// Unloads the module.
  ~Module();

  /// Calls a command and returns the results that it filled, at most `outputs` of them. Any array
  /// may stand for the command, even one that is no text.
  ///
  /// Throws `Error` for what the module raises and for the errors of the host; memory exhaustion in
  /// the module becomes "TOLVEX:host:outOfMemory". Other exceptions pass unchanged, those of the
  /// warning handler among them. Whatever a call leaves behind is reclaimed. Arguments without an
  /// array are a std::invalid_argument, a call after `unload` a std::logic_error.
  std::vector<Array> call(ArrayView command, std::span<const ArrayView> arguments = {},
                          std::size_t outputs = kAllOutputs);
  std::vector<Array> call(ArrayView command, std::span<const Array> arguments,
                          std::size_t outputs = kAllOutputs);
  std::vector<Array> call(ArrayView command, std::initializer_list<ArrayView> arguments,
                          std::size_t outputs = kAllOutputs);

  /// The same for a command named in ASCII.
  std::vector<Array> call(std::string_view command, std::span<const ArrayView> arguments = {},
                          std::size_t outputs = kAllOutputs);
  std::vector<Array> call(std::string_view command, std::span<const Array> arguments,
                          std::size_t outputs = kAllOutputs);
  std::vector<Array> call(std::string_view command, std::initializer_list<ArrayView> arguments,
                          std::size_t outputs = kAllOutputs);

  /// Where warnings go as they are issued. Without a handler they are kept for `lastWarnings`.
  /// A handler may throw, which ends the call; what it throws during unloading is dropped.
  void setWarningHandler(WarningHandler handler);
  /// The warnings of the last call, failed or not, or of unloading, that no handler has taken.
  [[nodiscard]] const std::vector<MessageId>& lastWarnings() const noexcept;

  /// Whether calls from now on may use the extended datatypes, CDF_INT8 and CDF_TIME_TT2000, and
  /// their commands. Off in a new module.
  void setExtended(bool extended);
  [[nodiscard]] bool extended() const noexcept;

  /// What successful calls have left behind until now: always none for a module without leaks.
  [[nodiscard]] LiveCounts leaks() const noexcept;

  /// Runs the module's unload handler, once, and lets the module go; further calls are refused.
  /// Whatever the handler throws is dropped. Throws std::logic_error only when it is asked for from
  /// inside a call of this module. Doing it again does nothing.
  void unload();
  [[nodiscard]] bool loaded() const noexcept;

 private:
  struct State;
  std::unique_ptr<State> state_;
};

}  // namespace ambrix
