// Octave's names for the classes.
#pragma once

#include <octave/oct.h>

#include "host/qv.h"

namespace ambrix::octave_host {

/// The name of any class but `qvUNKNOWN_CLASS`, under which the host's numbers put all others.
const char* nameOfClass(qvClassID classId) noexcept;

qvClassID classOf(const octave_value& value);

}  // namespace ambrix::octave_host
