// The command-line tool.
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <sstream>

#include "ambrix/embedded.h"
#include "ambrix_version.h"
#include "tool/commands.h"
#include "tool/exit_status.h"
#include "tool/failure.h"
#include "tool/man_page.h"

namespace ambrix::tool {
namespace {

/// The library's settings in the environment would make results depend on the caller.
void forgetLibrarySettings() {
  for (const char* name : {"CDF_VALIDATE", "CDF_CHECKSUM", "CDF_FILEBACKWARD"})
    ::unsetenv(name);
}

void printVersions(StandardOutput& output) {
  Module module;
  std::string library;
  for (const Array& part : module.call("getLibraryVersion"))
    library += (library.empty() ? "" : ".") + std::to_string(std::lround(part.data<double>()[0]));
  output.write("ambrix " + std::string(kAmbrixVersion) + "\nCDF library " + library + "\n");
}

int run(const CLI::App& parser, const Arguments& arguments, StandardOutput& output) {
  const bool answered = arguments.version || arguments.manual;
  if (arguments.version) printVersions(output);
  if (arguments.manual) output.write(manualPage(parser));
  if (answered) return EXIT_SUCCESS;
  if (parser.get_subcommands().empty()) throw UsageError("which command?");
  return runCommand(parser, arguments, output);
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
    throw UsageError(error.what());
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
  return ambrix::tool::guardedMain(count, words);
}
