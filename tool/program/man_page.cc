#include "tool/program/man_page.h"

#include <fmt/format.h>

#include <boost/algorithm/string/replace.hpp>
#include <string_view>

#include "ambrix_version.h"
#include "tool/program/help_texts.h"

namespace ambrix::tool {
namespace {

/// Text in which nothing is taken for a request or an escape.
std::string escaped(std::string_view text) {
  std::string result;
  for (const char c : text) {
    const bool lineStart = result.empty() || result.back() == '\n';
    if (lineStart && (c == '.' || c == '\'')) result += "\\&";
    if (c == '\\') {
      result += "\\e";
    } else if (c == '-') {
      result += "\\-";
    } else {
      result += c;
    }
  }
  return result;
}

/// Details, in which the points of a list begin lines.
std::string details(const HelpText& help) {
  return boost::replace_all_copy(escaped(help.details), "\n\\- ", "\n.br\n\\- ");
}

std::string examples(const HelpText& help) {
  return fmt::format(".PP\n.nf\n.RS\n{}.RE\n.fi\n", escaped(help.examples));
}

/// Names and meanings of the arguments that --help lists.
std::string arguments(const CLI::App& app) {
  std::string page;
  for (const CLI::Option* option : app.get_options()) {
    if (option->get_group().empty()) continue;
    const std::string value = option->get_type_name();
    const bool named = option->nonpositional();
    page += fmt::format(".TP\n.B {}{}\n{}\n", escaped(option->get_name(false, true)),
                        named && !value.empty() ? " \\fI" + escaped(value) + "\\fR" : "",
                        escaped(option->get_description()));
  }
  return page;
}

std::string commandSection(const CLI::App& parser, const HelpText& help) {
  const CLI::App* const command = parser.get_subcommand(help.name);
  return fmt::format(".SS ambrix {} {}\n{}.\n.PP\n{}{}{}", help.name, escaped(help.synopsis),
                     escaped(help.brief), details(help), arguments(*command), examples(help));
}

}  // namespace

std::string manualPage(const CLI::App& parser) {
  std::string page = fmt::format(
      ".TH AMBRIX 1 \"\" \"ambrix {}\" \"User Commands\"\n.SH NAME\nambrix \\- {}\n.SH SYNOPSIS\n"
      ".B ambrix\n{}\n.SH DESCRIPTION\n{}.\n.SH OPTIONS\n{}.SH COMMANDS\n",
      kAmbrixVersion, "shows, converts and edits files in the Common Data Format",
      escaped(kToolHelp.synopsis), escaped(kToolHelp.brief), arguments(parser));
  for (const HelpText& help : kCommandHelp)
    page += commandSection(parser, help);
  page += fmt::format(".SH \"EXIT STATUS\"\n{}", escaped(kToolHelp.details));
  page += ".SH ENVIRONMENT\n.TP\n.B NO_COLOR\nWhen it is set, headings are not emphasised.\n";
  page += ".SH EXAMPLES\n" + examples(kToolHelp);
  return page;
}

}  // namespace ambrix::tool
