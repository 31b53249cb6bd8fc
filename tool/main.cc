// The command-line tool.
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <sstream>

#include "ambrix/embedded.h"
#include "ambrix_version.h"
#include "tool/cdf_file.h"
#include "tool/command_line.h"
#include "tool/failure.h"
#include "tool/man_page.h"
#include "tool/warnings.h"

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

void runCommand(const std::string& command, const Arguments& arguments, StandardOutput& output) {
  if (command == "session") return runSession(arguments.maxArrayBytes, output);
  Module module;
  module.setWarningHandler(printWarning);
  if (command == "info") return runInfo(module, arguments.info, output);
  if (command == "dump") return runDump(module, arguments.dump, output);
  if (command == "convert") return runConvert(module, arguments.convert);
  if (command == "call") return runCall(module, arguments.call, output);
}

void run(const CLI::App& parser, const Arguments& arguments, StandardOutput& output) {
  const auto commands = parser.get_subcommands();
  if (arguments.version) return printVersions(output);
  if (arguments.manual) return output.write(manualPage(parser));
  if (commands.empty()) throw UsageError("which command?");
  runCommand(commands.front()->get_name(), arguments, output);
}

int failUsage(const std::string& message, const CLI::App& parser) {
  const auto commands = parser.get_subcommands();
  const std::string topic = commands.empty() ? "" : " " + commands.front()->get_name();
  std::fprintf(stderr, "ambrix: %s\nTry 'ambrix%s --help'.\n", message.c_str(), topic.c_str());
  return kExitUsage;
}

int fail(const std::string& identifier, const char* message) {
  std::fprintf(stderr, "ambrix: %s: %s\n", identifier.c_str(), message);
  return kExitFailure;
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
  try {
    StandardOutput output;
    if (parse(*parser, count, words, output)) run(*parser, arguments, output);
    output.flush();
    return EXIT_SUCCESS;
  } catch (const OutputClosed&) {
    return EXIT_SUCCESS;  // the reader has seen enough
  } catch (const UsageError& error) {
    return failUsage(error.what(), *parser);
  } catch (const Error& error) {
    return fail(error.identifier(), error.what());
  } catch (const ToolError& error) {
    return fail(error.identifier(), error.what());
  } catch (const LoadError& error) {
    return fail("ambrix:moduleNotLoaded", error.what());
  } catch (const std::exception& error) {
    return fail("ambrix:failure", error.what());
  }
}

}  // namespace
}  // namespace ambrix::tool

int main(int count, char** words) {
  ambrix::tool::forgetLibrarySettings();
  return ambrix::tool::guardedMain(count, words);
}
