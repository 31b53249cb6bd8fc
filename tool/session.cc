#include "tool/session.h"

#include <iostream>
#include <optional>
#include <utility>
#include <vector>

#include "ambrix/memory.h"
#include "tool/json_value.h"
#include "tool/session_message.h"

namespace ambrix::tool {
namespace {

struct Request {
  Array command;
  std::vector<Array> arguments;
  std::size_t outputs = kAllOutputs;
};

std::size_t readOutputs(JsonView value) {
  if (!value.isCount()) throw JsonError("\"outputs\" is no count");
  constexpr std::size_t kMoreThanAny = 4;  // digits: no command has that many results
  return value.source().size() > kMoreThanAny ? kAllOutputs : value.toUint64();
}

Request readRequest(JsonView object) {
  Request request;
  const auto command = findMember(object, u"command");
  if (!command) throw JsonError("a request needs a \"command\"");
  request.command = readValue(*command);
  if (const auto outputs = findMember(object, u"outputs")) request.outputs = readOutputs(*outputs);
  const auto arguments = findMember(object, u"arguments");
  if (!arguments) return request;
  JsonItems items(*arguments);
  while (const auto item = items.next())
    request.arguments.push_back(readValue(*item));
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

/// The parsed line; also its tag, as far as there is one, when it is no good request.
JsonView parseLine(std::string_view line, std::string& tag) {
  bool numbersInRange = true;
  const JsonView object = JsonView::check(line, numbersInRange);
  JsonMembers members(object);
  while (const auto member = members.next()) {
    if (member->key == u"tag") tag = member->value.source();
  }
  if (!numbersInRange) throw JsonError("a number beyond the range of double");
  findMember(object, u"tag");  // only one, please
  return object;
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

}  // namespace

std::string answerRequest(Module& module, std::string_view line) {
  std::string tag;
  bool called = false;
  std::string answer = '{' + describeCall(module, line, tag, called) + ',';
  static const std::vector<MessageId> kNoWarnings;
  appendWarnings(answer, called ? module.lastWarnings() : kNoWarnings);
  if (!tag.empty()) {
    answer += R"(,"tag":)";
    appendAscii(answer, tag);
  }
  return answer += "}\n";
}

void runSession(std::size_t maxArrayBytes, StandardOutput& output) {
  Module module;
  setByteLimit(maxArrayBytes);
  std::ios::sync_with_stdio(false);
  std::string line;
  while (std::getline(std::cin, line)) {
    output.write(answerRequest(module, line));
    output.flush();
  }
  module.unload();
  std::string last = R"({"unload":{)";
  appendWarnings(last, module.lastWarnings());
  output.write(last + "}}\n");
  output.flush();
}

}  // namespace ambrix::tool
