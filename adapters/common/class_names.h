// The classes by name, as people know them: "double", "cell" and so on.
#pragma once

#include <string_view>

#include "host/qv.h"

namespace ambrix {

/// "unknown" for a number that no class has.
const char* nameOfClass(qvClassID classId) noexcept;

/// `qvUNKNOWN_CLASS` for a name that no class has.
qvClassID classNamed(std::string_view name) noexcept;

}  // namespace ambrix
