// Calls that may use the extended datatypes, CDF_INT8 and CDF_TIME_TT2000.
#pragma once

#include "ambrix/module.h"

namespace ambrix {

/// Turns the extended datatypes on for as long as it lives, and leaves the module as it was: a
/// program's own calls stay as strict as it wants them.
class ExtendedCalls {
 public:
  explicit ExtendedCalls(Module& module) : module_(module), before_(module.extended()) {
    module_.setExtended(true);
  }
  ExtendedCalls(const ExtendedCalls&) = delete;
  ExtendedCalls& operator=(const ExtendedCalls&) = delete;
  ~ExtendedCalls() { module_.setExtended(before_); }

 private:
  Module& module_;
  bool before_;
};

}  // namespace ambrix
