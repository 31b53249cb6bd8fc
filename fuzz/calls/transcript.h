// What calls answered, so that two programs can be compared: a line for each call, with every bit
// of its results. Identifiers of files, which are never the same, are left out.
#pragma once

#include <ambrix/embedded.h>

#include <string>
#include <vector>

namespace ambrix_fuzz {

/// Lines go to this file from now on.
void openTranscript(const std::string& path);
bool isTranscribed();

void transcribe(const std::string& command, const std::vector<ambrix::Array>& results,
                const std::vector<ambrix::MessageId>& warnings);
void transcribe(const std::string& command, const std::string& error,
                const std::vector<ambrix::MessageId>& warnings);

}  // namespace ambrix_fuzz
