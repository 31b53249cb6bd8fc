// Verdicts on their way from the worker, and to people and programs.
#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <sstream>

#include "tool/check/check.h"
#include "tool/output/text.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

using OrderedJson = nlohmann::ordered_json;

constexpr char kUnread[] = "unread";

OrderedJson problemAsJson(const Problem& problem) {
  return {{"place", toUtf8(problem.place)},
          {"identifier", problem.identifier},
          {"message", toUtf8(problem.message)}};
}

OrderedJson problemsAsJson(const std::vector<Problem>& problems) {
  OrderedJson list = OrderedJson::array();
  for (const Problem& problem : problems)
    list.push_back(problemAsJson(problem));
  return list;
}

std::string problemsAsText(const std::vector<Problem>& problems) {
  std::string text;
  for (const Problem& problem : problems) {
    text += fmt::format("    {}{}{}: {}\n", problem.place, problem.place.empty() ? "" : ": ",
                        problem.identifier, printable(problem.message));
  }
  return text;
}

const char* wordFor(Soundness soundness) {
  if (soundness == Soundness::kUndecided) return "undecided";
  return soundness == Soundness::kSound ? "sound" : "not sound";
}

/// Nobody knows: null.
OrderedJson valueFor(Soundness soundness) {
  if (soundness == Soundness::kUndecided) return nullptr;
  return soundness == Soundness::kSound;
}

}  // namespace

Soundness Verdict::soundness() const {
  if (!problems.empty()) return Soundness::kNotSound;
  return unread.empty() && unsupported.empty() ? Soundness::kSound : Soundness::kUndecided;
}

void reportProblem(const Problem& problem) {
  report(problemAsJson(problem).dump());
}

std::string unreadFinding(const Problem& problem) {
  OrderedJson finding = problemAsJson(problem);
  finding[kUnread] = true;
  return finding.dump();
}

void reportUnread(const Problem& problem) {
  report(unreadFinding(problem), kRoomForReports / 2);  // problems always find room
}

void reportUnsupported(const std::string& what) {
  report(OrderedJson(toUtf8(what)).dump(), kRoomForReports / 2);
}

void takeFindings(std::string_view reports, Verdict& verdict) {
  std::istringstream lines{std::string(reports)};
  for (std::string line; std::getline(lines, line);) {
    const OrderedJson finding = OrderedJson::parse(line);
    if (finding.is_string()) {
      verdict.unsupported.push_back(finding);
    } else {
      auto& list = finding.contains(kUnread) ? verdict.unread : verdict.problems;
      list.push_back({finding.at("place"), finding.at("identifier"), finding.at("message")});
    }
  }
}

std::string verdictAsText(const Verdict& verdict) {
  const std::string file = printable(verdict.file);
  std::string text = fmt::format("{}: {}\n", file, wordFor(verdict.soundness()));
  text += problemsAsText(verdict.problems) + problemsAsText(verdict.unread);
  for (const std::string& what : verdict.unsupported)
    text += fmt::format("    not supported, so not read: {}\n", what);
  if (verdict.unlisted > 0) text += fmt::format("    and {} more\n", verdict.unlisted);
  return text;
}

std::string verdictsAsJson(const std::vector<Verdict>& verdicts) {
  OrderedJson list = OrderedJson::array();
  for (const Verdict& verdict : verdicts) {
    list.push_back({{"file", toUtf8(verdict.file)},
                    {"sound", valueFor(verdict.soundness())},
                    {"problems", problemsAsJson(verdict.problems)},
                    {"unread", problemsAsJson(verdict.unread)},
                    {"unsupported", verdict.unsupported},
                    {"unlisted", verdict.unlisted}});
  }
  return list.dump(2, ' ', true) + '\n';  // in ASCII, lest a terminal obey it
}

}  // namespace ambrix::tool
