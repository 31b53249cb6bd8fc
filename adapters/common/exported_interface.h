// The interface that the module calls, as a host's library exports it. Include this in place of
// "host/qvh.h": a host's symbols are hidden unless declared otherwise.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "host/message_id.h"

#pragma GCC visibility push(default)
#include "host/qvh.h"
#pragma GCC visibility pop
