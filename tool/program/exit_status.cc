#include "tool/program/exit_status.h"

#include <cstdio>
#include <cstdlib>
#include <string>

#include "ambrix/embedded.h"
#include "tool/content/failure.h"
#include "tool/output/standard_output.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

int failUsage(const std::string& message, const CLI::App& parser) {
  const auto commands = parser.get_subcommands();
  const std::string topic = commands.empty() ? "" : " " + commands.front()->get_name();
  std::fprintf(stderr, "ambrix: %s\nTry 'ambrix%s --help'.\n", printable(message).c_str(),
               topic.c_str());
  return kExitUsage;
}

int fail(const std::string& identifier, const char* message) {
  std::fprintf(stderr, "ambrix: %s: %s\n", identifier.c_str(), printable(message).c_str());
  return kExitFailure;
}

}  // namespace

int exitStatusOf(const CLI::App& parser, const std::function<int()>& work) try {
  return work();
} catch (const OutputClosed&) {
  return EXIT_SUCCESS;  // the reader has seen enough
} catch (const UsageError& error) {
  return failUsage(error.what(), parser);
} catch (const Error& error) {
  return fail(error.identifier(), error.what());
} catch (const ToolError& error) {
  return fail(error.identifier(), error.what());
} catch (const LoadError& error) {
  return fail("ambrix:moduleNotLoaded", error.what());
} catch (const std::exception& error) {
  return fail("ambrix:failure", error.what());
}

}  // namespace ambrix::tool
