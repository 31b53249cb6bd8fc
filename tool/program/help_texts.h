// The texts of --help and the manual page, without the options.
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
    "Failures print \"ambrix: IDENTIFIER: message\" on standard error. The exit status\n"
    "is 0, 1 after a failure, or 2 if the arguments are wrong. \"check\" also has 3.\n",
    "  ambrix info data.cdf\n"
    "  ambrix dump data.cdf Epoch --records 0:9\n"
    "  ambrix COMMAND --help\n"};

inline constexpr HelpText kInfoHelp = {
    "info", "FILE [OPTION...]", "Shows the settings and the variables of a file",
    "The dimension that varies fastest is listed first. \"Varies\" shows whether\n"
    "values differ from record to record and, after the slash, along each\n"
    "dimension. The percentage is the compressed size in percent of the uncompressed\n"
    "size. For a variable with an unknown datatype, only the known properties are\n"
    "listed.\n",
    "  ambrix info data.cdf\n"
    "  ambrix info --attributes data.cdf\n"
    "  ambrix info --json data.cdf | jq '.variables[].name'\n"};

inline constexpr HelpText kDumpHelp = {
    "dump", "FILE VARIABLE [OPTION...]", "Prints the values of a variable",
    "Record numbers and indices start at 0, and the first index varies fastest.\n"
    "Epochs and TT2000 times are printed as times of UTC, TT2000 times with leap\n"
    "seconds. Values that are not times, such as fill values, are printed as\n"
    "numbers. --raw-times prints all as numbers: milliseconds of CDF_EPOCH, seconds\n"
    "and picoseconds of CDF_EPOCH16, nanoseconds of CDF_TIME_TT2000. In JSON, the\n"
    "data are nested with the first index innermost.\n",
    "  ambrix dump data.cdf Epoch\n"
    "  ambrix dump data.cdf Epoch --raw-times\n"
    "  ambrix dump data.cdf 3 --records 10:19\n"
    "  ambrix dump data.cdf B_GSE --output b_gse.csv\n"};

inline constexpr HelpText kCheckHelp = {
    "check", "FILE... [OPTION...]", "Checks whether files are sound",
    "The CDF library validates each file, with its checksum if it has one. Then\n"
    "every attribute, entry and value is read. Failures to read are listed. A crash\n"
    "or an endless loop of the library does no harm and is listed, too.\n"
    "\n"
    "A file is sound, not sound or undecided. It is undecided if nothing wrong was\n"
    "found, but something was not read: memory, time or descriptors ran out, or a\n"
    "datatype is not known.\n"
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
    "and arrays as {\"class\":..., \"size\":[...], \"data\":[...]}. Anything else is a\n"
    "text. docs/commands.md describes the commands. \"getConstantNames\" lists\n"
    "the constants.\n",
    "  ambrix call getLibraryVersion\n"
    "  ambrix call getConstantValue GZIP_COMPRESSION\n"
    "  ambrix call --file data.cdf getVarName 0\n"
    "  ambrix call --file data.cdf renameVar 0 Epoch\n"};

inline constexpr HelpText kSessionHelp = {
    "session", "[OPTION...]", "Answers calls of the module through a pipe",
    "Each line of standard input is a request, and each line of standard output is\n"
    "its answer, in JSON. docs/session-protocol.md describes them.\n",
    "  printf '{\"command\":\"getLibraryVersion\"}\\n' | ambrix session\n"};

inline constexpr HelpText kConvertHelp = {
    "convert", "IN OUT [OPTION...]", "Writes a copy of a file with other settings",
    "Everything that no option changes stays the same, except:\n"
    "- The encoding becomes that of this computer.\n"
    "- A file in several parts becomes one file.\n"
    "- rVariables become zVariables and lose the dimensions that do not vary.\n"
    "- Texts of attributes keep their length, but lose characters after a zero byte.\n"
    "- A small file can grow or shrink, because the library allocates space again.\n"
    "\n"
    "One line on standard error reports rVariables, texts that lost characters, and\n"
    "a file that has grown by more than half without --compression. If IN is\n"
    "compressed as a whole, rVariables are not reported, and texts are reported even\n"
    "if only zeros followed the zero byte.\n"
    "\n"
    "OUT gets the extension .cdf if it has none. An existing file is never\n"
    "overwritten. A failed conversion leaves nothing behind.\n"
    "\n"
    "The conversion fails if a datatype is not known, and lists the variables and\n"
    "entries that have it. --skip-unsupported leaves them out. It also fails if a\n"
    "variable claims more records than the file has room for.\n",
    "  ambrix convert old.cdf new.cdf --compression gzip:6\n"
    "  ambrix convert rows.cdf columns.cdf --majority column --checksum md5\n"};

inline constexpr std::array kCommandHelp = {kInfoHelp, kDumpHelp,    kCheckHelp,
                                            kCallHelp, kConvertHelp, kSessionHelp};

}  // namespace ambrix::tool
