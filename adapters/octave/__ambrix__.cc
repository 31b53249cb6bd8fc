// The function that Octave calls.
#include <octave/oct.h>

#include <algorithm>
#include <new>
#include <string_view>
#include <vector>

#include "adapters/common/call_frame.h"
#include "adapters/common/host_errors.h"
#include "adapters/common/slots.h"
#include "adapters/octave/array_object.h"
#include "host/qvh.h"

namespace {

using ambrix::CallFrame;
using ambrix::Slots;

/// The results, and no more than were asked for.
octave_value_list takeResults(const Slots& slots, int nargout) {
  const auto filled = ambrix::resultsIn(slots);
  const auto wanted = static_cast<std::size_t>(std::max(nargout, 1));
  octave_value_list results;
  for (const qvArray* const result : filled.first(std::min(filled.size(), wanted)))
    results.append(result->toOctave());
  return results;
}

// What else the functions of the package ask for has names that no command has.

/// Whether a text is exactly this name. The module decides about a text of any other shape: Octave
/// converts only single rows without a warning.
bool isName(const octave_value& text, std::string_view name) {
  return text.is_string() && text.ndims() == 2 && text.rows() == 1 &&
         text.columns() == static_cast<octave_idx_type>(name.size()) && text.string_value() == name;
}

/// Whether a function gives up a file of its own.
bool givesUpFile(const octave_value_list& args) {
  return args.length() == 2 && isName(args(0), "-abandon") && args(1).is_uint64_type();
}

octave_value_list callModule(const octave_value_list& args, int nargout, bool extended) {
  const CallFrame frame(extended);
  std::vector<qvArray> arguments;
  std::vector<const qvArray*> inputs;
  arguments.reserve(static_cast<std::size_t>(args.length()));
  inputs.reserve(arguments.capacity());
  for (octave_idx_type i = 0; i < args.length(); ++i)
    inputs.push_back(&arguments.emplace_back(args(i)));
  Slots slots{};
  qvhFunction(nargout, slots.data(), static_cast<int>(inputs.size()), inputs.data());
  return takeResults(slots, nargout);
}

/// Whether every call may use the extended datatypes.
bool allExtended = false;

bool concernsExtension(const octave_value_list& args) {
  return isName(args(0), "-extended");
}

/// ("-extended") tells whether every call may use the extended datatypes, ("-extended", logical)
/// sets it, and ("-extended", command, arguments...) is a call that may.
octave_value_list useExtension(const octave_value_list& args, int nargout) {
  if (args.length() == 1) return octave_value(allExtended);
  if (!args(1).is_bool_scalar()) return callModule(args.slice(1, args.length() - 1), nargout, true);
  allExtended = args(1).bool_value();
  return {};
}

octave_value_list run(const octave_value_list& args, int nargout) {
  if (concernsExtension(args)) return useExtension(args, nargout);
  if (!givesUpFile(args)) return callModule(args, nargout, allExtended);
  qvhAbandonFile(args(1).uint64_scalar_value().value());
  return {};
}

}  // namespace

DEFUN_DLD(__ambrix__, args, nargout,
          "-*- texinfo -*-\n"
          "@deftypefn {} {[@var{results}, @dots{}] =} __ambrix__ (@var{command}, @var{arguments}, "
          "@dots{})\n"
          "Undocumented internal function: runs the command of this name.\n"
          "@end deftypefn") {
  if (args.length() == 0) print_usage();
  // Octave knows how to go on after exceptions of its own; any other would end the process.
  try {
    return run(args, nargout);
  } catch (const octave::execution_exception&) {
    throw;
  } catch (const octave::interrupt_exception&) {
    throw;
  } catch (const octave::exit_exception&) {
    throw;
  } catch (const std::bad_alloc&) {
    ambrix::raiseOutOfMemory();
  } catch (const std::exception& failure) {
    ambrix::raiseUnexpected(failure.what());
  } catch (...) {
    ambrix::raiseUnexpected("an exception of an unknown kind");
  }
}
