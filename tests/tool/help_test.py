"""Help, versions, the manual page, completion and what all commands share."""

import os
import re
import subprocess
import unittest

from tool.support import TOOL, ToolCase

COMMANDS = ("info", "dump", "check", "call", "convert", "session")
COMPLETION = os.path.join(os.path.dirname(__file__), "..", "..", "tool", "ambrix.bash")


class HelpTest(ToolCase):
    def test_overview(self):
        text = self.output("--help")
        self.assertTrue(text.startswith("Shows, converts and edits"))
        for command in COMMANDS:
            self.assertRegex(text, rf"\n  {command} +\S")
        self.assertEqual(self.output("-h"), text)

    def test_each_command_has_help_with_examples(self):
        for command in COMMANDS:
            text = self.output(command, "--help")
            self.assertIn(f"Usage: ambrix {command} ", text)
            self.assertRegex(text.partition("Examples:\n")[2], rf"ambrix {command}")

    def test_version(self):
        self.assertRegex(self.output("--version"),
                         r"\Aambrix \d+\.\d+\.\d+\nCDF library 3\.\d+\.\d+\n"
                         r"Inflater (ISA-L|CDF library)\n\Z")

    def test_wrong_usage(self):
        for arguments in ((), ("nonsense",), ("--nonsense",), ("session", "--max-array-bytes"),
                          ("session", "--max-array-bytes", "x"), ("session", "more")):
            self.assert_misused(*arguments)
        for arguments in (("nonsense",), ("nonsense", "--json")):
            self.assertIn('there is no command "nonsense"', self.assert_misused(*arguments))

    def test_help_fits_a_terminal(self):
        for command in ("", *COMMANDS):
            for line in self.output(*command.split(), "--help").splitlines():
                self.assertLessEqual(len(line), 80, line)

    def test_library_settings_of_the_environment_do_not_count(self):
        environment = dict(os.environ, CDF_VALIDATE="no")
        done = self.run_tool("call", "getValidate", env=environment)
        self.assertIn(b"VALIDATEFILEon", done.stdout)

    def test_output_that_cannot_be_written(self):
        with open("/dev/full", "w") as full:
            done = subprocess.run([TOOL, "--version"], stdout=full, stderr=subprocess.PIPE)
        self.assertEqual(done.returncode, 1)
        self.assertIn(b"No space left", done.stderr)

    def test_standard_output_that_is_closed(self):
        done = subprocess.run(f"'{TOOL}' --version >&-", shell=True, capture_output=True)
        self.assertEqual((done.returncode, done.stderr), (0, b""))


class ManualTest(ToolCase):
    def test_it_tells_what_help_tells(self):
        page = self.output("--man").replace("\\-", "-").replace("\\e", "\\")
        for section in ("NAME", "SYNOPSIS", "OPTIONS", "COMMANDS", "EXIT STATUS", "EXAMPLES"):
            self.assertRegex(page, rf'\n\.SH "?{section}"?\n')
        for command in COMMANDS:
            self.assertIn(f"\n.SS ambrix {command} ", page)
            for option in re.findall(r"-h|--[a-z-]+", self.output(command, "--help")):
                self.assertIn(option, page)


class CompletionTest(ToolCase):
    def complete(self, *words):
        script = (f"source '{COMPLETION}'; COMP_WORDS=(\"$@\"); COMP_CWORD=$(($# - 1)); "
                  "_ambrix ambrix \"${!#}\" \"${@: -2:1}\"; printf '%s\\n' \"${COMPREPLY[@]}\"")
        done = subprocess.run(["bash", "-c", script, "bash", *words], capture_output=True,
                              check=True)
        return done.stdout.decode().split()

    def test_commands_and_values(self):
        self.assertEqual(self.complete("ambrix", "c"), ["check", "call", "convert"])
        self.assertEqual(self.complete("ambrix", "dump", "a.cdf", "v", "--format", "c"), ["csv"])

    def test_options_are_those_of_the_help(self):
        for command in COMMANDS:
            options = set(re.findall(r"^  (?:-h,)?(--[a-z-]+)", self.output(command, "--help"),
                                     re.M))
            self.assertEqual(set(self.complete("ambrix", command, "--")), options, command)


if __name__ == "__main__":
    unittest.main()
