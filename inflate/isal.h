// ISA-L, looked for when it is first needed: where it is not installed, the CDF library's own zlib
// serves, and nothing fails to load.
#pragma once

#include <isa-l/igzip_lib.h>

namespace ambrix::inflate {

struct Isal {
  decltype(&isal_inflate_init) init = nullptr;
  decltype(&isal_inflate) inflate = nullptr;

  /// Also false when AMBRIX_INFLATER in the environment names another inflater.
  [[nodiscard]] bool usable() const { return init && inflate; }
};

const Isal& isal();

}  // namespace ambrix::inflate
