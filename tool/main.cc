// The command-line tool.
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <span>
#include <sstream>
#include <string_view>

#include "ambrix/embedded.h"
#include "tool/content/failure.h"
#include "tool/output/text.h"
#include "tool/program/commands.h"
#include "tool/program/exit_status.h"
#include "tool/program/man_page.h"
#include "tool/program/versions.h"

namespace ambrix::tool {
namespace {

/// The library's settings in the environment would make results depend on the caller.
void forgetLibrarySettings() {
  for (const char* name : {"CDF_VALIDATE", "CDF_CHECKSUM", "CDF_FILEBACKWARD"})
    ::unsetenv(name);
}

int run(const CLI::App& parser, const Arguments& arguments, StandardOutput& output) {
  const bool answered = arguments.version || arguments.manual;
  if (arguments.version) output.write(versions());
  if (arguments.manual) output.write(manualPage(parser));
  if (answered) return EXIT_SUCCESS;
  if (parser.get_subcommands().empty()) throw UsageError("which command?");
  return runCommand(parser, arguments, output);
}

/// What to say when the first word that is no option is no command either.
std::optional<std::string> misusedCommand(const CLI::App& parser, int count,
                                          const char* const* words) {
  if (!parser.get_subcommands().empty()) return std::nullopt;
  const std::span<const char* const> all(words, static_cast<std::size_t>(count));
  const auto word = std::ranges::find_if(
      all.subspan(1), [](std::string_view text) { return !text.starts_with('-'); });
  if (word == all.end()) return std::nullopt;
  return "there is no command \"" + printable(*word) + "\"";
}

/// Parses the command line; help that was asked for is printed, and the tool is done.
bool parse(CLI::App& parser, int count, const char* const* words, StandardOutput& output) {
  try {
    parser.parse(count, words);
    return true;
  } catch (const CLI::Success& help) {
    std::ostringstream text;
    parser.exit(help, text, text);
    output.write(text.str());
    return false;
  } catch (const CLI::ParseError& error) {
    throw UsageError(misusedCommand(parser, count, words).value_or(error.what()));
  }
}

int guardedMain(int count, const char* const* words) {
  Arguments arguments;
  const auto parser = makeParser(arguments);
  return exitStatusOf(*parser, [&] {
    StandardOutput output;
    const bool wanted = parse(*parser, count, words, output);
    const int status = wanted ? run(*parser, arguments, output) : EXIT_SUCCESS;
    output.flush();
    return status;
  });
}

}  // namespace
}  // namespace ambrix::tool

int main(int count, char** words) {
  ambrix::tool::forgetLibrarySettings();
  ambrix::keepFreedMemory();
  return ambrix::tool::guardedMain(count, words);
}
