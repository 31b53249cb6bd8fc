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
    "Failures are told on standard error as \"ambrix: IDENTIFIER: message\".\n"
    "The exit status is 0, 1 after a failure, or 2 when the arguments are not understood; check "
    "has\n"
    "3, too.\n",
    "  ambrix info data.cdf\n"
    "  ambrix dump data.cdf Epoch --records 0:9\n"
    "  ambrix COMMAND --help\n"};

inline constexpr HelpText kInfoHelp = {
    "info", "FILE [OPTION...]", "Shows what a file is made of: its settings and its variables",
    "Dimensions are listed as a host's arrays have them: the one that varies fastest comes first.\n"
    "\"Varies\" tells whether values differ from record to record and, after the slash, along\n"
    "each dimension. The percentage is what compression leaves of the size.\n"
    "A variable of a datatype that is not supported is listed as far as it is known.\n",
    "  ambrix info data.cdf\n"
    "  ambrix info --attributes data.cdf\n"
    "  ambrix info --json data.cdf | jq '.variables[].name'\n"};

inline constexpr HelpText kDumpHelp = {
    "dump", "FILE VARIABLE [OPTION...]",
    "Prints the values of a variable, given by its name or its number",
    "Record numbers and indices begin at 0, and the first index varies fastest. Epochs are "
    "printed\n"
    "as times; those that are no times, fill values for example, as numbers. In JSON, the data "
    "are\n"
    "nested with the first index innermost.\n",
    "  ambrix dump data.cdf Epoch\n"
    "  ambrix dump data.cdf 3 --records 10:19\n"
    "  ambrix dump data.cdf B_GSE --output b_gse.csv\n"};

inline constexpr HelpText kCheckHelp = {
    "check", "FILE... [OPTION...]", "Tells whether files are sound, by reading all that is in them",
    "The CDF library validates each file, its checksum included if it has one; then every "
    "attribute,\n"
    "entry and value is read. What cannot be read is listed, and so is where the library crashed "
    "or got\n"
    "nowhere, which does no harm here. A file is sound, not sound, or undecided: then nothing "
    "wrong\n"
    "was found, but something was not read, because memory, time or descriptors ran out or its\n"
    "datatype is not supported. The exit status is 0 if all files are sound, 1 if one is not, and "
    "else\n"
    "3. In JSON, \"sound\" is true, false or null.\n",
    "  ambrix check data.cdf\n"
    "  ambrix check --quiet archive/*.cdf\n"
    "  ambrix check --json data.cdf | jq '.[].problems'\n"};

inline constexpr HelpText kCallHelp = {
    "call", "[--file FILE] COMMAND [ARGUMENT...]",
    "Calls one command of the module and prints each result as a line of JSON",
    "Arguments are JSON: numbers, true, false, null, lists of numbers or logicals, and arrays as\n"
    "{\"class\":..., \"size\":[...], \"data\":[...]}. Whatever is not JSON is a text.\n"
    "docs/commands.md describes the commands; \"getConstantNames\" lists the constants.\n",
    "  ambrix call getLibraryVersion\n"
    "  ambrix call getConstantValue GZIP_COMPRESSION\n"
    "  ambrix call --file data.cdf getVarName 0\n"
    "  ambrix call --file data.cdf renameVar 0 Epoch\n"};

inline constexpr HelpText kSessionHelp = {
    "session", "[--max-array-bytes BYTES] [--max-line-bytes BYTES]",
    "Answers calls of the module through a pipe",
    "Each line of standard input is a request and each line of standard output its answer, both "
    "in\n"
    "JSON. docs/session-protocol.md describes them.\n",
    "  printf '{\"command\":\"getLibraryVersion\"}\\n' | ambrix session\n"};

inline constexpr HelpText kConvertHelp = {
    "convert", "IN OUT [OPTION...]", "Writes a copy of a file with other settings",
    "What no option names stays as it is. But the encoding becomes that of this computer, a file "
    "in\n"
    "several parts becomes one, and a small file may grow or shrink, as the library reserves room\n"
    "anew. rVariables become zVariables and lose the dimensions along which they do not vary, and\n"
    "texts of attributes keep their length but nothing behind a zero byte; where that happened, a\n"
    "line on standard error says so, for rVariables only if IN is not compressed as a whole.\n"
    "OUT gets the extension .cdf when it has none. An existing file is never overwritten, and\n"
    "nothing is left behind when the conversion fails. Variables and entries of a datatype that "
    "is\n"
    "not supported are listed, and stop the conversion unless they are to be skipped. So does a\n"
    "variable that claims more records than the file has room for.\n",
    "  ambrix convert old.cdf new.cdf --compression gzip:6\n"
    "  ambrix convert rows.cdf columns.cdf --majority column --checksum md5\n"};

inline constexpr std::array kCommandHelp = {kInfoHelp, kDumpHelp,    kCheckHelp,
                                            kCallHelp, kConvertHelp, kSessionHelp};

}  // namespace ambrix::tool
