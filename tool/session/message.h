// Errors and warnings in the answers of a session.
#pragma once

#include <exception>
#include <string>
#include <vector>

#include "ambrix/error.h"

namespace ambrix::tool {

/// Appends the exception as a message of the protocol.
void appendError(std::string& json, std::exception_ptr error);

/// Appends the list of warnings.
void appendWarnings(std::string& json, const std::vector<MessageId>& warnings);

}  // namespace ambrix::tool
