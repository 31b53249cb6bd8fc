"""Fetches the CDF library, which distributions do not package, from the Python package index.

usage: provision_cdf.py CACHE {source,library}

  source   CACHE/cdf-3.6.3-source: the official distribution's sources and samples
  library  CACHE/cdf-3.9.1: include/, lib/, samples/ and the copyright notice, laid out like an
           official installation: the shared library of 3.9.1 with the header of 3.6.3, which fits
           every version of the library from there on

Either way CACHE/samples leads to the sample files.
Both are pinned by checksum in the requirement files beside this script. A folder that is already
there is left alone, so only the first run needs the network.
"""
import fcntl
import hashlib
import os
import pathlib
import shutil
import subprocess
import sys
import tarfile
import tempfile
import venv
import zipfile

HERE = pathlib.Path(__file__).resolve().parent
LIBRARY_SHA256 = "6efe11bb8db8e96194cf4025002ddd656f5123c0dab8f894cee324a56f30a89d"
HEADERS = ("cdf.h", "cdfdist.h", "cdfconfig.h", "cdflib.h", "cdflib64.h")
README = """\
lib/libcdf.so is CDF 3.9.1 as the SpacePy 0.7.0 wheel carries it. include/ and samples/ come from
the CDF 3.6.3 distribution, as the pysatCDF 0.3.2 source package carries it; nothing was modified.
CDF_copyright.txt holds the conditions.
"""


class ProvisionError(Exception):
    """A reason for people, ready to be shown."""


def run(*command, **settings):
    """Runs a command quietly; what it printed becomes part of the error when it fails."""
    done = subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True,
                          check=False, **settings)
    if done.returncode != 0:
        raise ProvisionError(f"{' '.join(map(str, command))} failed:\n{done.stdout.strip()}")


def make_pip(folder):
    """A private environment, since distributions refuse pip outside of one; returns its python."""
    try:
        venv.create(folder, with_pip=True)
    except (subprocess.CalledProcessError, ImportError, SystemExit) as error:
        raise ProvisionError("python's venv module cannot make an environment with pip: install "
                             "python3-venv (Debian) or run script/bootstrap") from error
    return folder / "bin" / "python3"


def pip(python, *arguments, **environment):
    settings = {**os.environ, "PIP_USER": "0", "PIP_NO_INPUT": "1", **environment}
    for name in ("PIP_TARGET", "PIP_PREFIX", "PYTHONHOME"):
        settings.pop(name, None)
    run(python, "-m", "pip", "--quiet", *arguments, env=settings)


def download(python, requirements, folder, *options, **environment):
    """Downloads the one package of a requirement file, checked by its hash; returns its path."""
    pip(python, "download", "--no-deps", "--require-hashes", *options, "-r",
        HERE / requirements, "-d", folder, **environment)
    return next(folder.iterdir())


def fetch_source(python, work, target):
    pip(python, "install", "--require-hashes", "-r", HERE / "build-tools.txt")
    archive = download(python, "cdf-3.6.3-source.txt", work / "sdist", "--no-build-isolation",
                       "--no-binary", ":all:", PYTHONPATH=str(HERE))
    with tarfile.open(archive) as tar:
        members = [m for m in tar.getmembers() if "/cdf36_3-dist/" in m.name and m.isreg()]
        tar.extractall(work / "tree", members)
    (next((work / "tree").iterdir()) / "cdf36_3-dist").rename(target)


def fetch_library(python, source, work, target):
    wheel = download(python, "cdf-3.9.1-linux-x86_64.txt", work / "wheel", "--only-binary", ":all:")
    library = zipfile.ZipFile(wheel).read("spacepy/libcdf.so")
    if hashlib.sha256(library).hexdigest() != LIBRARY_SHA256:
        raise ProvisionError(f"{wheel.name} does not hold the expected CDF library")
    for folder in ("include", "lib"):
        (target / folder).mkdir(parents=True)
    (target / "lib" / "libcdf.so").write_bytes(library)
    (target / "lib" / "libcdf.so").chmod(0o755)
    for header in HEADERS:
        shutil.copy(source / "src" / "include" / header, target / "include")
    shutil.copytree(source / "samples", target / "samples")
    shutil.copy(source / "CDF_copyright.txt", target)
    (target / "README").write_text(README)


def provision(cache, part):
    """Makes the folders that the part needs and that are not there; each whole or not at all."""
    source, library = cache / "cdf-3.6.3-source", cache / "cdf-3.9.1"
    wanted = [source] if part == "source" else [source, library]
    if all(folder.is_dir() for folder in wanted):
        return
    with tempfile.TemporaryDirectory(dir=cache) as name:
        work = pathlib.Path(name)
        python = make_pip(work / "venv")
        if not source.is_dir():
            fetch_source(python, work, work / "source")
            (work / "source").rename(source)
        if library in wanted:
            fetch_library(python, source, work, work / "library")
            (work / "library").rename(library)


def main():
    if len(sys.argv) != 3 or sys.argv[2] not in ("source", "library"):
        sys.exit(__doc__)
    cache = pathlib.Path(sys.argv[1]).resolve()
    try:
        cache.mkdir(parents=True, exist_ok=True)
        with open(cache / ".lock", "w", encoding="ascii") as lock:
            fcntl.flock(lock, fcntl.LOCK_EX)  # builds that start together download once
            provision(cache, sys.argv[2])
            if not (cache / "samples").exists():
                (cache / "samples").symlink_to("cdf-3.6.3-source/samples")
    except (ProvisionError, OSError) as error:
        sys.exit(f"provision_cdf: {error}")


if __name__ == "__main__":
    main()
