// Watches the host's function that makes narrow copies of texts.
#pragma once

#include <cstddef>

namespace ambrix_test {

/// How many copies were made since this was asked last.
std::size_t narrowCopiesMade();

}  // namespace ambrix_test
