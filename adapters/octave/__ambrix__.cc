// The function that Octave calls.
#include <octave/oct.h>

#include <algorithm>
#include <array>
#include <new>
#include <vector>

#include "adapters/octave/call_frame.h"
#include "adapters/octave/host_errors.h"
#include "adapters/octave/octave_array.h"
#include "host/qvh.h"

namespace {

using ambrix::octave_host::CallFrame;

/// Room for the results of any command: the module fills its slots without asking how many are
/// wanted.
constexpr std::size_t kSlots = 8;
using Slots = std::array<qvArray*, kSlots>;

/// The results up to the first slot that is empty, and no more than were asked for.
octave_value_list takeResults(const Slots& slots, int nargout) {
  const auto wanted = static_cast<std::ptrdiff_t>(std::clamp<int>(nargout, 1, kSlots));
  const auto end = std::find(slots.begin(), slots.begin() + wanted, nullptr);
  octave_value_list results;
  std::for_each(slots.begin(), end,
                [&](const qvArray* result) { results.append(result->toOctave()); });
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
    ambrix::octave_host::raiseOutOfMemory();
  } catch (const std::exception& failure) {
    ambrix::octave_host::raiseUnexpected(failure.what());
  } catch (...) {
    ambrix::octave_host::raiseUnexpected("an exception of an unknown kind");
  }
}
