"""Real CDF files: those of the CDF distribution, always there, and a folder of others."""

import os
import unittest
from pathlib import Path

DISTRIBUTION = Path(os.environ["AMBRIX_CDF_SAMPLES"])
FOLDER = Path(os.environ.get("AMBRIX_SAMPLES")
              or Path(__file__).resolve().parents[3] / "shared" / "samples")

# The CDF library refuses these.
UNREADABLE = ("not_a_cdf.cdf",  # a text
              "nasajava_cdfml_testnew.cdf")  # its times are of before the last leap second

needs_folder = unittest.skipUnless(
    FOLDER.is_dir(), f"no sample files in {FOLDER}; set AMBRIX_SAMPLES to a folder of CDF files")


def _in(folder):
    return {path.name: path for path in sorted(folder.glob("*.cdf"))}


def distribution_files():
    """Name to path."""
    return _in(DISTRIBUTION)


def folder_files():
    """Name to path, with the files in other encodings, without those that nobody can read."""
    files = _in(FOLDER)
    files.update(_in(FOLDER / "encodings"))
    return {name: path for name, path in files.items() if name not in UNREADABLE}


def readable_files():
    """All of them."""
    return {**distribution_files(), **(folder_files() if FOLDER.is_dir() else {})}
