// The function that Octave calls.
#include <octave/oct.h>

#include <algorithm>
#include <new>
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

/// Whether a function of the package gives up a file of its own. No command has such a name.
bool givesUpFile(const octave_value_list& args) {
  return args.length() == 2 && args(0).is_string() && args(0).string_value() == "-abandon" &&
         args(1).is_uint64_type();
}

octave_value_list callModule(const octave_value_list& args, int nargout) {
  const CallFrame frame;
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
    if (givesUpFile(args)) {
      qvhAbandonFile(args(1).uint64_scalar_value().value());
      return {};
    }
    return callModule(args, nargout);
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
