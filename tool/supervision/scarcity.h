// Whether this process has too little of something to read files with.
#pragma once

#include "tool/check/check.h"

namespace ambrix::tool {

/// A want, as an identifier and a sentence.
struct Scarcity {
  const char* identifier;
  const char* message;
};

/// What there is too little of for the CDF library, which says of a failure seldom whether the file
/// or the machine is its cause; nullptr if there is enough. May be called by signal handlers.
const Scarcity* findScarcity() noexcept;

/// The same as a finding of a check.
Problem problemOf(const Scarcity& scarcity);

/// From now on, a crash of this process while memory or space is scarce is reported as caused by
/// it.
void reportScarcityInCrashes();

}  // namespace ambrix::tool
