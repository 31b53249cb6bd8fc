// What must be true after every call, whatever it was given.
#pragma once

#include <ambrix/embedded.h>

#include <cstddef>
#include <string_view>
#include <vector>

#include "fuzz/calls/world.h"
#include "tests/support/command_signatures.h"

namespace ambrix_fuzz {

/// The errors and warnings that hosts know, and "not text" for the exception without identifier.
std::size_t knownErrors();
const char* errorName(std::size_t place);

/// The place of an error in the table. It is a violation when the error is not there or does not
/// carry exactly the values that it should.
std::size_t requireKnown(const ambrix::MessageId& error);
std::size_t placeOfNotText();

/// The number, the classes and the sizes of results are those of the command.
void requireSane(const ambrix_test::Command& command, const std::vector<ambrix::Array>& results,
                 std::size_t outputs);

/// A value that a reader of variables returns has the class and the number of elements that the
/// variable and the arguments ask for.
void requireFitting(std::string_view command, const std::vector<ambrix::Array>& arguments,
                    ambrix::ArrayView value, const Variable& variable);

/// Nothing is alive but what was before and the results.
void requireNothingLeft(const ambrix::LiveCounts& before,
                        const std::vector<ambrix::Array>& results);

/// The module holds open exactly what it should.
void requireOpen(const World& world);

}  // namespace ambrix_fuzz
