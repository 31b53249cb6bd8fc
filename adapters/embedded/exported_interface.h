// The interface that the module calls, as this library exports it. Include this in place of
// "host/qvh.h": symbols are hidden here unless declared otherwise.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "host/message_id.h"

#pragma GCC visibility push(default)
#include "host/qvh.h"
#pragma GCC visibility pop
