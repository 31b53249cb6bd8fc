// The class of a value of Octave's.
#pragma once

#include <octave/oct.h>

#include "host/qv.h"

namespace ambrix::octave_host {

/// `qvUNKNOWN_CLASS` for what the module has no class for.
qvClassID classOf(const octave_value& value);

}  // namespace ambrix::octave_host
