#include "tool/program/commands.h"

#include <cstdlib>
#include <filesystem>
#include <functional>
#include <new>
#include <optional>
#include <string>

#include "ambrix/file_error.h"
#include "tool/check/check.h"
#include "tool/content/failure.h"
#include "tool/format/open_failure.h"
#include "tool/output/output_file.h"
#include "tool/output/warnings.h"
#include "tool/program/exit_status.h"
#include "tool/supervision/scarcity.h"
#include "tool/supervision/supervision.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

/// The command line and what the commands have in common.
struct Context {
  const CLI::App& parser;
  const Arguments& arguments;
  StandardOutput& output;
};

constexpr char kOutOfMemory[] = "TOLVEX:host:outOfMemory";

[[noreturn]] void tellOutOfMemory(const std::string& file) {
  throw NamedError(file, kOutOfMemory, "there is not enough memory; --memory-limit may allow more");
}

/// Errors while the file is read are told of it; those that name a file already stay as they are.
void readNamed(const std::string& file, const std::function<void()>& read) try {
  requireOpenable(file);
  read();
} catch (const NamedError&) {
  throw;
} catch (const ToolError& error) {
  throw NamedError(file, error.identifier(), error.what());
} catch (const FileError& error) {
  throw NamedError(file, error.identifier(), error.reason());
} catch (const Error& error) {
  if (error.identifier() == kOutOfMemory) tellOutOfMemory(file);
  throw NamedError(file, error.identifier(), error.what());
} catch (const std::bad_alloc&) {
  tellOutOfMemory(file);
}

/// A worker that crashed for want of something says nothing of its file.
void requirePlenty(const WorkerEnd& end, const std::string& file) {
  Verdict found;
  takeFindings(end.reports, found);
  if (end.kind == WorkerEnd::Kind::kDone || found.unread.empty()) return;
  const Problem& want = found.unread.front();
  throw NamedError(file, want.identifier, want.message);
}

/// Reads the file in a worker, which writes to the output as this process would.
int readInWorker(const Context& context, const std::string& file,
                 const std::function<void(Module&)>& read) {
  const Limits& limits = context.arguments.limits;
  const auto work = [&] {
    reportScarcityInCrashes();
    Module module;
    module.setWarningHandler(printWarning);
    setByteLimit(kSessionArrayBytes);
    readNamed(file, [&] { read(module); });
    context.output.flush();
    return EXIT_SUCCESS;
  };
  const WorkerEnd end = supervise(limits, [&] { return exitStatusOf(context.parser, work); });
  requirePlenty(end, file);
  return statusOf(end, limits, file);
}

int info(const Context& context) {
  const InfoOptions& options = context.arguments.info;
  return readInWorker(context, options.file,
                      [&](Module& module) { runInfo(module, options, context.output); });
}

int dump(const Context& context) {
  const DumpOptions& options = context.arguments.dump;
  std::optional<OutputFile> output;
  if (!options.output.empty()) output.emplace(options.output);
  const int status = readInWorker(context, options.file, [&](Module& module) {
    if (output) {
      context.output.redirect(output->folder() / output->unfinishedName(), options.output);
    }
    runDump(module, options, context.output);
  });
  if (output && status == EXIT_SUCCESS) output->publish();
  return status;
}

/// Enters the folder of the output, because the library creates no file whose path has characters
/// outside ASCII. Returns a way to the input from there that is no longer than its name, because
/// the library takes no long ones.
std::string enterFolder(const OutputFile& output, const fs::path& input) {
  const char* const way = "input";
  fs::create_directory_symlink(fs::absolute(input).parent_path(), output.folder() / way);
  fs::current_path(output.folder());
  return fs::path(way) / input.filename();
}

int convert(const Context& context) {
  ConvertOptions options = context.arguments.convert;
  checkOptions(options);
  const std::string file = options.input;
  OutputFile output(chooseOutput(options.output), ".cdf");
  const int status = readInWorker(context, file, [&](Module& module) {
    options.input = enterFolder(output, file);
    runConvert(module, options, output.unfinishedName());
  });
  if (status == EXIT_SUCCESS) output.publish();
  return status;
}

int call(const Context& context) {
  Module module;
  module.setWarningHandler(printWarning);
  const CallOptions& options = context.arguments.call;
  const auto run = [&] { runCall(module, options, context.output); };
  options.file.empty() ? run() : readNamed(options.file, run);
  return EXIT_SUCCESS;
}

int session(const Context& context) {
  runSession(context.arguments.session, context.output);
  return EXIT_SUCCESS;
}

int check(const Context& context) {
  const CheckOptions& options = context.arguments.check;
  return runCheck(options, context.arguments.limits, context.output);
}

struct Command {
  const char* name;
  int (*run)(const Context&);
};

constexpr Command kCommands[] = {{"info", info},       {"dump", dump}, {"check", check},
                                 {"convert", convert}, {"call", call}, {"session", session}};

}  // namespace

int runCommand(const CLI::App& parser, const Arguments& arguments, StandardOutput& output) {
  const std::string name = parser.get_subcommands().front()->get_name();
  for (const Command& command : kCommands)
    if (name == command.name) return command.run({parser, arguments, output});
  return EXIT_FAILURE;  // the parser knows no other
}

}  // namespace ambrix::tool
