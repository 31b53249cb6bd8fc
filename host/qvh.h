// The host's extension interface: how a module is entered, how it says what it was built against,
// and how it asks to be told of its unloading.
#pragma once

#include <cstdint>

#include "host/qv.h"

/// The host release that this header describes, and the version of the array interface in it.
inline constexpr std::uint32_t qvhReleaseCode = 0x01000000;
inline constexpr std::uint32_t qvhApiVersion = 0x00010000;

extern "C" {

using qvhExitHandler = void (*)();

/// Registers the function to run once before the module is unloaded. Registering it again is free.
void qvhAtExit(qvhExitHandler handler);

// The two functions that a module exports.

void qvhFunction(int outputCount, qvArray* outputs[], int inputCount, const qvArray* inputs[]);
void qvhfilerequiredapiversion(std::uint32_t* releaseCode, std::uint32_t* apiVersion);

/// For a host that is linked with the module and opens files for itself, not for its user: gives
/// one up by its identifier, whatever state it is in. "close" keeps the identifier when it fails.
void qvhAbandonFile(std::uint64_t file);

}  // extern "C"
