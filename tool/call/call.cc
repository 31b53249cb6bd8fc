#include "tool/call/call.h"

#include "tool/content/failure.h"
#include "tool/content/open_file.h"
#include "tool/json/value.h"

namespace ambrix::tool {
namespace {

/// JSON that stands for an array, and else the text itself; an object is never meant as a text.
Array readWord(const std::string& word) {
  try {
    return readValue(parseJson(word));
  } catch (const JsonError& error) {
    if (word.starts_with('{')) throw UsageError(word + ": " + error.what());
    return Array::fromUtf8(word);
  }
}

std::vector<Array> readWords(std::span<const std::string> words) {
  std::vector<Array> arrays;
  for (const std::string& word : words) {
    try {
      arrays.push_back(readWord(word));
    } catch (const std::invalid_argument&) {
      throw UsageError("an argument is not valid UTF-8");
    }
  }
  return arrays;
}

std::vector<Array> callOnFile(File file, const std::string& command,
                              const std::vector<Array>& arguments) {
  const std::vector<ArrayView> views(arguments.begin(), arguments.end());
  std::vector<Array> results = file.call(command, views);
  file.close();
  return results;
}

}  // namespace

void runCall(Module& module, const CallOptions& options, StandardOutput& output) {
  if (options.words.empty()) throw UsageError("call: which command?");
  module.setExtended(options.extended);
  const std::string& command = options.words.front();
  const std::vector<Array> arguments = readWords(std::span(options.words).subspan(1));
  const std::vector<Array> results =
      options.file.empty()
          ? module.call(Array::fromUtf8(command), arguments)
          : callOnFile(openFile(module, options.file, Access::kWrite), command, arguments);
  for (const Array& result : results) {
    std::string line;
    appendValue(line, result);
    output.write(line + '\n');
  }
}

}  // namespace ambrix::tool
