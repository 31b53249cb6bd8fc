#include "tool/session/session.h"

#include <fmt/format.h>

#include <iostream>
#include <optional>
#include <utility>
#include <vector>

#include "ambrix/memory.h"
#include "tool/json/value.h"
#include "tool/session/line_reader.h"
#include "tool/session/message.h"

namespace ambrix::tool {
namespace {

struct Request {
  Array command;
  std::vector<Array> arguments;
  std::size_t outputs = kAllOutputs;
};

Request readRequest(const Json& object) {
  if (!object.is_object()) throw JsonError("a request is an object");
  Request request;
  if (!object.contains("command")) throw JsonError("a request needs a \"command\"");
  request.command = readValue(object["command"]);
  if (object.contains("outputs")) request.outputs = readCount(object["outputs"]);
  const Json arguments = object.value("arguments", Json::array());
  if (!arguments.is_array()) throw JsonError("\"arguments\" is not a list");
  for (const Json& argument : arguments)
    request.arguments.push_back(readValue(argument));
  return request;
}

std::string describeOutputs(const std::vector<Array>& outputs) {
  std::string json = R"("outputs":[)";
  for (std::size_t index = 0; index < outputs.size(); ++index) {
    if (index > 0) json += ',';
    appendValue(json, outputs[index]);
  }
  return json += ']';
}

/// The parsed line; also its tag, if it has one, even when it turns out to be no good request.
Json parseLine(std::string_view line, std::string& tag) try {
  Json object = parseJson(line);
  if (object.is_object() && object.contains("tag")) tag = memberText(line, "tag");
  return object;
} catch (const JsonRangeError&) {
  tag = memberText(line, "tag");
  throw;
}

/// What the line asks for is done, or not, and told; `called` says whether the module was asked.
std::string describeCall(Module& module, std::string_view line, std::string& tag, bool& called) {
  try {
    const Request request = readRequest(parseLine(line, tag));
    called = true;
    return describeOutputs(module.call(request.command, request.arguments, request.outputs));
  } catch (...) {
    std::string json = R"("error":)";
    appendError(json, std::current_exception());
    return json;
  }
}

/// The answer to a line of which no more is known than that it is too long.
std::string refuseLine(std::size_t limit) {
  const JsonError error(
      fmt::format("the line has more than {} bytes; --max-line-bytes sets another limit", limit));
  std::string answer = R"({"error":)";
  appendError(answer, std::make_exception_ptr(error));
  answer += ',';
  appendWarnings(answer, {});
  return answer += "}\n";
}

}  // namespace

std::string answerRequest(Module& module, std::string_view line) {
  std::string tag;
  bool called = false;
  std::string answer = '{' + describeCall(module, line, tag, called) + ',';
  static const std::vector<MessageId> kNoWarnings;
  appendWarnings(answer, called ? module.lastWarnings() : kNoWarnings);
  if (!tag.empty()) {
    answer += R"(,"tag":)";
    answer += tag;
  }
  return answer += "}\n";
}

void runSession(const SessionOptions& options, StandardOutput& output) {
  Module module;
  module.setExtended(options.extended);
  setByteLimit(options.arrayBytes);
  std::ios::sync_with_stdio(false);
  Line line;
  while (readLine(std::cin, options.lineBytes, line)) {
    output.write(line.whole ? answerRequest(module, line.text) : refuseLine(options.lineBytes));
    output.flush();
  }
  module.unload();
  std::string last = R"({"unload":{)";
  appendWarnings(last, module.lastWarnings());
  output.write(last + "}}\n");
  output.flush();
}

}  // namespace ambrix::tool
