// Damage to a file, as failing disks, broken transfers and strangers do it.
#pragma once

#include <cstdint>
#include <string>

#include "fuzz/files/seed_files.h"

namespace ambrix::fuzz {

/// A seed file with damage done to one of its parts.
struct DamagedFile {
  SeedFile file;
  std::string description;  // what was done to which
};

/// The damaged file of a number: always the same for the same seeds.
DamagedFile damagedFile(const std::vector<SeedFile>& seeds, std::uint64_t seed,
                        std::uint64_t number);

}  // namespace ambrix::fuzz
