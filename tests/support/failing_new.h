// Memory from operator new that runs out when a test wants it to. Programs that link this have all
// of their memory from it, that of the standard library included.
#pragma once

#include <cstdint>

namespace ambrix_test {

/// The n-th allocation of this thread from now fails, once; 0 takes it back.
void failNew(std::uint64_t n) noexcept;
/// Whether the failure asked for is still to come.
bool newFailurePending() noexcept;

}  // namespace ambrix_test
