// The one module of this process and the lock around it.
#pragma once

#include <functional>
#include <span>
#include <vector>

#include "ambrix/embedded.h"

namespace ambrix::python {

/// Makes the module, and keeps forks apart from calls. Once, when the extension is loaded.
void startLibrary();

/// Does work with the module while no other thread of this process does. The GIL is not held
/// meanwhile, so the work must not touch Python's objects. Then issues warnings, which may raise,
/// and rethrows what the work has thrown.
void withModule(const std::function<void(Module&)>& work);

/// The same with the datatypes and commands of the module's extension, which commands do not have.
void withExtendedModule(const std::function<void(Module&)>& work);

/// Calls a command.
std::vector<Array> callCommand(ArrayView command, std::span<const ArrayView> arguments);

/// Closes the files that are still open, and lets the module go. In a child of the process that
/// loaded the extension, files are those of the parent: they are left alone.
void unloadLibrary();

/// What calls have left behind: none for a module without leaks.
LiveCounts leaks();

}  // namespace ambrix::python
