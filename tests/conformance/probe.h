// What the parts of the probe module share.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "host/qvh.h"

namespace probe {

struct Call {
  int outputCount;
  qvArray** outputs;
  std::span<const qvArray*> arguments;
};

/// The elements of an array of class double.
std::span<const double> doubles(const qvArray* array);
/// The first of them, as an index.
std::size_t indexIn(const qvArray* array);

/// A column of texts.
qvArray* textColumn(const std::vector<std::string>& texts);

/// How two arrays differ, in words; empty when they don't.
std::string difference(const qvArray* expected, const qvArray* found);

/// What every host must pass. Results: the names of the checks, and for each what was found wrong,
/// which is nothing in a host that conforms.
void runChecks(const Call& call);

/// What every host must refuse. Results: the names, and the identifier of the error of each.
void nameRefusals(const Call& call);
/// Argument: a number in these lists, from 0. Raises the error.
void refuse(const Call& call);

/// Arrays that must come back from a host's user as they went there. Result: the names.
void nameSamples(const Call& call);
/// Argument: a number in this list, from 0. Result: the array.
void makeSample(const Call& call);
/// Arguments: the number, and what the user got. Result: how it differs; an empty text if it does
/// not.
void recogniseSample(const Call& call);

}  // namespace probe
