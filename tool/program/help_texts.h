// What --help and the manual page say, apart from the options.
#pragma once

#include <array>

namespace ambrix::tool {

struct HelpText {
  const char* name;
  const char* synopsis;
  const char* brief;
  const char* details;
  const char* examples;
};

inline constexpr HelpText kToolHelp = {
    "ambrix", "[--version] [--help] COMMAND ...",
    "Shows, converts and edits files in the Common Data Format (CDF)",
    "Failures are told on standard error as \"ambrix: IDENTIFIER: message\". The exit\n"
    "status is 0, or 1 after a failure, or 2 when the arguments are not understood.\n"
    "\"check\" also has 3.\n",
    "  ambrix info data.cdf\n"
    "  ambrix dump data.cdf Epoch --records 0:9\n"
    "  ambrix COMMAND --help\n"};

inline constexpr HelpText kInfoHelp = {
    "info", "FILE [OPTION...]", "Shows the settings and the variables of a file",
    "Dimensions are listed as a host's arrays have them: the one that varies\n"
    "fastest comes first. \"Varies\" tells whether values differ from record to\n"
    "record and, after the slash, along each dimension. The percentage is what\n"
    "compression leaves of the size. A variable of an unknown datatype is listed as\n"
    "far as it is known.\n",
    "  ambrix info data.cdf\n"
    "  ambrix info --attributes data.cdf\n"
    "  ambrix info --json data.cdf | jq '.variables[].name'\n"};

inline constexpr HelpText kDumpHelp = {
    "dump", "FILE VARIABLE [OPTION...]", "Prints the values of a variable",
    "Record numbers and indices begin at 0, and the first index varies fastest.\n"
    "Epochs and TT2000 times are printed as times of UTC, the latter with leap\n"
    "seconds. What is no time, such as a fill value, is printed as a number.\n"
    "--raw-times prints the numbers of all: milliseconds of CDF_EPOCH, seconds and\n"
    "picoseconds of CDF_EPOCH16, nanoseconds of CDF_TIME_TT2000. In JSON, the data\n"
    "are nested with the first index innermost.\n",
    "  ambrix dump data.cdf Epoch\n"
    "  ambrix dump data.cdf Epoch --raw-times\n"
    "  ambrix dump data.cdf 3 --records 10:19\n"
    "  ambrix dump data.cdf B_GSE --output b_gse.csv\n"};

inline constexpr HelpText kCheckHelp = {
    "check", "FILE... [OPTION...]", "Tells whether files are sound",
    "The CDF library validates each file, with its checksum if it has one. Then\n"
    "every attribute, entry and value is read. What cannot be read is listed. If\n"
    "the library crashes or gets nowhere, that is listed too, and does no harm.\n"
    "\n"
    "A file is sound, not sound or undecided. It is undecided when nothing wrong\n"
    "was found, but something was not read: memory, time or descriptors ran out, or\n"
    "a datatype is not known.\n"
    "\n"
    "The exit status is 0 if all files are sound, 1 if one is not sound, and 3\n"
    "otherwise. In JSON, \"sound\" is true, false or null.\n",
    "  ambrix check data.cdf\n"
    "  ambrix check --quiet archive/*.cdf\n"
    "  ambrix check --json data.cdf | jq '.[].problems'\n"};

inline constexpr HelpText kCallHelp = {
    "call", "[--file FILE] [--extended] COMMAND [ARGUMENT...]",
    "Calls one command of the module, with JSON results",
    "Arguments are JSON: numbers, true, false, null, lists of numbers or logicals,\n"
    "and arrays as {\"class\":..., \"size\":[...], \"data\":[...]}. Whatever is not JSON\n"
    "is a text. docs/commands.md describes the commands. \"getConstantNames\" lists\n"
    "the constants.\n",
    "  ambrix call getLibraryVersion\n"
    "  ambrix call getConstantValue GZIP_COMPRESSION\n"
    "  ambrix call --file data.cdf getVarName 0\n"
    "  ambrix call --file data.cdf renameVar 0 Epoch\n"};

inline constexpr HelpText kSessionHelp = {
    "session", "[OPTION...]", "Answers calls of the module through a pipe",
    "Each line of standard input is a request. Each line of standard output is its\n"
    "answer. Both are JSON. docs/session-protocol.md describes them.\n",
    "  printf '{\"command\":\"getLibraryVersion\"}\\n' | ambrix session\n"};

inline constexpr HelpText kConvertHelp = {
    "convert", "IN OUT [OPTION...]", "Writes a copy of a file with other settings",
    "Everything that no option names stays as it is, except:\n"
    "- The encoding becomes that of this computer.\n"
    "- A file in several parts becomes one file.\n"
    "- rVariables become zVariables and lose the dimensions that do not vary.\n"
    "- Texts of attributes keep their length, but not what is behind a zero byte.\n"
    "- A small file may grow or shrink, as the library reserves room anew.\n"
    "\n"
    "One line on standard error tells of rVariables, of texts that have lost\n"
    "something, and of a file that has grown by more than half although\n"
    "--compression was not given. If IN is compressed as a whole, rVariables are\n"
    "not told of, and texts are told of even if only zeros were behind the zero\n"
    "byte.\n"
    "\n"
    "OUT gets the extension .cdf if it has none. An existing file is never\n"
    "overwritten. Nothing is left behind when the conversion fails.\n"
    "\n"
    "The conversion fails if a datatype is not known, and lists the variables and\n"
    "entries that have it. --skip-unsupported leaves them out. It also fails if a\n"
    "variable claims more records than the file has room for.\n",
    "  ambrix convert old.cdf new.cdf --compression gzip:6\n"
    "  ambrix convert rows.cdf columns.cdf --majority column --checksum md5\n"};

inline constexpr std::array kCommandHelp = {kInfoHelp, kDumpHelp,    kCheckHelp,
                                            kCallHelp, kConvertHelp, kSessionHelp};

}  // namespace ambrix::tool
