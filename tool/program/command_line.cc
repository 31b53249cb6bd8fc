#include "tool/program/command_line.h"

#include <fmt/format.h>

#include <algorithm>
#include <charconv>
#include <memory>

#include "tool/program/help_texts.h"

namespace ambrix::tool {
namespace {

/// Help whose usage line is the synopsis written for it.
class HelpFormatter : public CLI::Formatter {
 public:
  explicit HelpFormatter(std::string usage) : usage_("Usage: " + std::move(usage) + "\n") {}
  std::string make_usage(const CLI::App*, std::string) const override { return usage_; }

 private:
  std::string usage_;
};

void describe(CLI::App& app, const HelpText& help, const std::string& usage) {
  app.description(help.brief);
  app.footer(std::string(help.details) + "\nExamples:\n" + help.examples);
  const auto formatter = std::make_shared<HelpFormatter>(usage);
  formatter->column_width(28);
  formatter->label("Positionals", "Arguments");
  app.formatter(formatter);
  app.set_help_flag("-h,--help", "Print this help and exit");
}

CLI::App& addCommand(CLI::App& app, const HelpText& help) {
  CLI::App& command = *app.add_subcommand(help.name)->group("Commands");
  describe(command, help, std::string("ambrix ") + help.name + " " + help.synopsis);
  return command;
}

/// What is wrong with the name, or nothing: a shell's empty variable is not to mean "no option".
std::string requireName(const std::string& name) {
  return name.empty() ? "the name is empty" : "";
}

std::string requireSeconds(const std::string& text) {
  double seconds = -1;
  const auto end = std::from_chars(text.data(), text.data() + text.size(), seconds).ptr;
  const bool understood = end == text.data() + text.size() && seconds >= 0;
  return understood ? "" : "'" + text + "' is not a number of seconds";
}

std::string requireBytes(const std::string& text) {
  return text.starts_with('-') ? "'" + text + "' is not a number of bytes" : "";
}

/// A number of bytes, also as "512MB" or "4GiB".
void addBytes(CLI::App& command, const char* name, std::size_t& bytes, const char* help) {
  CLI::AsSizeValue size(false);
  size.description("");
  command.add_option(name, bytes, help)
      ->type_name("BYTES")
      ->transform(size)
      ->transform(CLI::Validator(requireBytes, ""));  // the last one is the first to be asked
}

void addLimits(CLI::App& command, Arguments& arguments) {
  command
      .add_option("--time-limit", arguments.limits.seconds,
                  fmt::format("Stop when nothing was read for this time (default:\n{}; 0: never)",
                              kTimeLimit))
      ->type_name("SECONDS")
      ->check(requireSeconds);
  addBytes(command, "--memory-limit", arguments.limits.memory,
           "Stop when reading takes more memory, as in 2GB\n"
           "(default: three quarters of the machine's; 0: none)");
}

void addInfo(CLI::App& app, Arguments& arguments) {
  CLI::App& info = addCommand(app, kInfoHelp);
  info.add_option("FILE", arguments.info.file, "The file")->required()->type_name("");
  info.add_flag("--attributes", arguments.info.attributes, "Also list the attributes and entries");
  info.add_flag("--json", arguments.info.json, "Print a JSON object");
  addLimits(info, arguments);
}

void addDump(CLI::App& app, Arguments& arguments) {
  CLI::App& dump = addCommand(app, kDumpHelp);
  dump.add_option("FILE", arguments.dump.file, "The file")->required()->type_name("");
  dump.add_option("VARIABLE", arguments.dump.variable, "The variable's name or number")
      ->required()
      ->type_name("");
  dump.add_option("--records", arguments.dump.records,
                  "Only records A to B; one may be left out, and A\nalone is one record")
      ->type_name("A:B");
  dump.add_option("--format", arguments.dump.format,
                  "table, csv or json (default: by the extension\nof OUT, or a table)")
      ->type_name("FORMAT")
      ->transform(CLI::IsMember({"table", "csv", "json"}));
  dump.add_option("--output", arguments.dump.output,
                  "Write to a new file, which appears when complete")
      ->type_name("OUT")
      ->check(requireName);
  dump.add_flag("--defuse-formulas", arguments.dump.defuseFormulas,
                "In CSV, put an apostrophe before texts that begin\n"
                "with = + - @ tab or carriage return, which a\n"
                "spreadsheet would take for formulas");
  dump.add_flag("--raw-times", arguments.dump.rawTimes,
                "Print times as the numbers that the file has");
  addLimits(dump, arguments);
}

void addCheck(CLI::App& app, Arguments& arguments) {
  CLI::App& check = addCommand(app, kCheckHelp);
  check.add_option("FILE", arguments.check.files, "The files")->required()->type_name("");
  check.add_flag("--json", arguments.check.json, "Print a JSON list with an object for each file");
  check.add_flag("--quiet", arguments.check.quiet, "List only files that are not sound");
  addLimits(check, arguments);
}

void addConvert(CLI::App& app, Arguments& arguments) {
  CLI::App& convert = addCommand(app, kConvertHelp);
  ConvertOptions& options = arguments.convert;
  convert.add_option("IN", options.input, "The file to copy")->required()->type_name("");
  convert.add_option("OUT", options.output, "The file to write")
      ->required()
      ->type_name("")
      ->check(requireName);
  convert
      .add_option("--compression", options.compression,
                  "Compress the file as a whole: none, rle, huff, ahuff\n"
                  "or gzip, which may have a level from 1 to 9\n"
                  "(default: 6); variables keep their own compression")
      ->type_name("TYPE[:LEVEL]");
  convert.add_option("--majority", options.majority, "row or column")
      ->type_name("MAJORITY")
      ->transform(CLI::IsMember({"row", "column"}));
  convert.add_option("--checksum", options.checksum, "md5 or none")
      ->type_name("CHECKSUM")
      ->transform(CLI::IsMember({"md5", "none"}));
  convert.add_flag("--skip-unsupported", options.skipUnsupported,
                   "Leave out data of unknown datatypes, and list them");
  addLimits(convert, arguments);
}

void addExtended(CLI::App& command, bool& extended) {
  command.add_flag("--extended", extended,
                   "Support CDF_INT8 and CDF_TIME_TT2000, too\n(docs/extended.md)");
}

void addCall(CLI::App& app, Arguments& arguments) {
  CLI::App& call = addCommand(app, kCallHelp);
  call.add_option("--file", arguments.call.file,
                  "Open this file, pass it as the first argument, and\nclose it afterwards")
      ->type_name("FILE");
  addExtended(call, arguments.call.extended);
  call.prefix_command();  // what follows may begin with a minus sign
  call.callback([&call, &arguments] { arguments.call.words = call.remaining(); });
}

void addSession(CLI::App& app, Arguments& arguments) {
  CLI::App& session = addCommand(app, kSessionHelp);
  addExtended(session, arguments.session.extended);
  addBytes(session, "--max-array-bytes", arguments.session.arrayBytes,
           "The limit for one array or scratch buffer, in bytes\n(default: 4 GiB)");
  addBytes(session, "--max-line-bytes", arguments.session.lineBytes,
           "The limit for a request line, in bytes\n(default: 256 MiB)");
}

}  // namespace

std::unique_ptr<CLI::App> makeParser(Arguments& arguments) {
  auto app = std::make_unique<CLI::App>("", "ambrix");
  describe(*app, kToolHelp, std::string("ambrix ") + kToolHelp.synopsis);
  app->add_flag("--version", arguments.version, "Print the versions of ambrix and the CDF library");
  app->add_flag("--man", arguments.manual)->group("");
  addInfo(*app, arguments);
  addDump(*app, arguments);
  addCheck(*app, arguments);
  addConvert(*app, arguments);
  addCall(*app, arguments);
  addSession(*app, arguments);
  return app;
}

}  // namespace ambrix::tool
