"""Runs the examples of docs/octave.md in Octave, and compares or records what they print.

usage: tutorial.py record    writes what the examples print, and the pictures, into docs/

Examples are blocks of the language "octave"; in them, lines after `>> ` are typed. AMBRIX_OCTAVE is
the folder with the package, AMBRIX_OCTAVE_CLI Octave, AMBRIX_CDF_SAMPLES the folder of the files.
"""

import os
import re
import shutil
import subprocess
import sys
import tempfile
from pathlib import Path

DOCS = Path(__file__).resolve().parents[2] / "docs"
DOCUMENT = DOCS / "octave.md"
PICTURES = ("octave-plasma.png", "octave-sea.png")
BLOCK = re.compile(r"(?<=^```octave\n).*?(?=^```$)", re.S | re.M)
PROMPT = ">> "
RUNNER = Path(__file__).with_name("run_tutorial.m")


def inputs(block):
    return [line[len(PROMPT):] for line in block.splitlines() if line.startswith(PROMPT)]


def printed(folder, lines):
    """What each line prints, run one after the other in a folder with the files."""
    for name in ("geocpi0.cdf", "cacsst2.cdf"):
        shutil.copy(Path(os.environ["AMBRIX_CDF_SAMPLES"]) / name, folder)
    script = Path(folder) / "lines.txt"
    script.write_text("\n".join(lines) + "\n")
    done = subprocess.run(
        [os.environ["AMBRIX_OCTAVE_CLI"], "--norc", "--no-history", "--path",
         os.environ["AMBRIX_OCTAVE"], str(RUNNER), script.name],
        cwd=folder, stdout=subprocess.PIPE, stderr=subprocess.PIPE, check=False)
    if done.returncode != 0:
        raise RuntimeError(done.stderr.decode())
    return done.stdout.decode().split("\0")[1:]


def run(document, folder):
    """The text of the document with what its examples print now."""
    outputs = iter(printed(folder, [line for block in BLOCK.findall(document)
                                    for line in inputs(block)]))

    def shown(line):
        text = "\n".join(row.rstrip() for row in next(outputs).rstrip().split("\n"))
        return f"{PROMPT}{line}\n" + (text + "\n" if text else "")

    return BLOCK.sub(lambda block: "".join(map(shown, inputs(block.group()))), document)


def record():
    with tempfile.TemporaryDirectory() as folder:
        DOCUMENT.write_text(run(DOCUMENT.read_text(), folder))
        for picture in PICTURES:
            shutil.copy(Path(folder) / picture, DOCS)


if __name__ == "__main__":
    if sys.argv[1:] != ["record"]:
        sys.exit(__doc__)
    record()
