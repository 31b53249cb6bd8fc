// Verdicts on their way from the worker, and to people and programs.
#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <sstream>

#include "tool/check.h"
#include "tool/steps.h"
#include "tool/text.h"

namespace ambrix::tool {
namespace {

using OrderedJson = nlohmann::ordered_json;

OrderedJson problemAsJson(const Problem& problem) {
  return {{"place", toUtf8(problem.place)},
          {"identifier", problem.identifier},
          {"message", toUtf8(problem.message)}};
}

}  // namespace

void tellProblem(const Problem& problem) {
  tell(problemAsJson(problem).dump());
}

void tellUnsupported(const std::string& what) {
  tell(OrderedJson(toUtf8(what)).dump(), kRoomToTell / 2);  // problems always find room
}

void takeFindings(std::string_view told, Verdict& verdict) {
  std::istringstream lines{std::string(told)};
  for (std::string line; std::getline(lines, line);) {
    const OrderedJson finding = OrderedJson::parse(line);
    if (finding.is_string()) {
      verdict.unsupported.push_back(finding);
    } else {
      verdict.problems.push_back(
          {finding.at("place"), finding.at("identifier"), finding.at("message")});
    }
  }
}

std::string verdictAsText(const Verdict& verdict) {
  const std::string file = printable(verdict.file);
  std::string text = fmt::format("{}: {}\n", file, verdict.sound() ? "sound" : "not sound");
  for (const Problem& problem : verdict.problems) {
    text += fmt::format("    {}{}{}: {}\n", problem.place, problem.place.empty() ? "" : ": ",
                        problem.identifier, printable(problem.message));
  }
  for (const std::string& what : verdict.unsupported)
    text += fmt::format("    not supported, so not read: {}\n", what);
  if (verdict.unlisted > 0) text += fmt::format("    and {} more\n", verdict.unlisted);
  return text;
}

std::string verdictsAsJson(const std::vector<Verdict>& verdicts) {
  OrderedJson list = OrderedJson::array();
  for (const Verdict& verdict : verdicts) {
    OrderedJson problems = OrderedJson::array();
    for (const Problem& problem : verdict.problems)
      problems.push_back(problemAsJson(problem));
    list.push_back({{"file", toUtf8(verdict.file)},
                    {"sound", verdict.sound()},
                    {"problems", problems},
                    {"unsupported", verdict.unsupported},
                    {"unlisted", verdict.unlisted}});
  }
  return list.dump(2) + '\n';
}

}  // namespace ambrix::tool
