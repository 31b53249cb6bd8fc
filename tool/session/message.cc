#include "tool/session/message.h"

#include <new>
#include <variant>

#include "tool/json/value.h"

namespace ambrix::tool {
namespace {

void appendArgument(std::string& json, const MessageArg& value) {
  if (const auto* integer = std::get_if<std::int64_t>(&value)) {
    json += std::to_string(*integer);
  } else if (const auto* narrow = std::get_if<std::string>(&value)) {
    appendBytes(json, *narrow);
  } else {
    appendString(json, std::get<std::u16string>(value));
  }
}

void appendParts(std::string& json, std::string_view identifier,
                 const std::vector<MessageArg>& values, std::string_view text) {
  json += R"({"identifier":)";
  appendMessage(json, identifier);
  json += R"(,"values":[)";
  for (std::size_t index = 0; index < values.size(); ++index) {
    if (index > 0) json += ',';
    appendArgument(json, values[index]);
  }
  json += R"(],"message":)";
  appendMessage(json, text);
  json += '}';
}

void appendId(std::string& json, const MessageId& id) {
  appendParts(json, id.fullIdentifier(), id.values, messageText(id));
}

}  // namespace

void appendError(std::string& json, std::exception_ptr error) {
  try {
    std::rethrow_exception(std::move(error));
  } catch (const JsonError& failure) {
    appendParts(json, "ambrix:session:badRequest", {}, failure.what());
  } catch (const Error& failure) {
    appendId(json, failure.id());
  } catch (const std::bad_alloc&) {
    appendId(json, MessageId("TOLVEX:host", "outOfMemory"));
  } catch (const std::exception& failure) {
    appendParts(json, "", {}, failure.what());
  }
}

void appendWarnings(std::string& json, const std::vector<MessageId>& warnings) {
  json += R"("warnings":[)";
  for (std::size_t index = 0; index < warnings.size(); ++index) {
    if (index > 0) json += ',';
    appendId(json, warnings[index]);
  }
  json += ']';
}

}  // namespace ambrix::tool
