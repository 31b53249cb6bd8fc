"""A tree of installed files, and what must be true of it wherever it lies."""

import os
import shlex
import shutil
import subprocess
from pathlib import Path

BUILD = Path(os.environ["AMBRIX_BUILD"])
SOURCE = Path(os.environ["AMBRIX_SOURCE"])
CMAKE = os.environ["AMBRIX_CMAKE"]
CPACK = os.environ["AMBRIX_CPACK"]
VERSION = os.environ["AMBRIX_VERSION"]
SAMPLES = Path(os.environ["AMBRIX_CDF_SAMPLES"])

FILES = """
    bin/ambrix
    include/ambrix/embedded.h include/ambrix/module.h include/ambrix/file.h include/ambrix/host/message_id.h
    lib/ambrix/libambrix_embedded.so lib/pkgconfig/ambrix.pc lib/ambrix/ambrix_module.so
    lib/cmake/ambrix/ambrixConfig.cmake lib/cmake/ambrix/ambrixConfigVersion.cmake
    share/man/man1/ambrix.1 share/bash-completion/completions/ambrix
    share/doc/ambrix/LICENSE share/doc/ambrix/NOTICE share/doc/ambrix/CHANGELOG.md
    share/doc/ambrix/docs/embedding.md share/doc/ambrix/docs/commands.md
    share/doc/ambrix/docs/octave.md share/doc/ambrix/docs/octave-plasma.png
    share/doc/ambrix/examples/CMakeLists.txt share/doc/ambrix/examples/list_variables.cc
    share/doc/ambrix/examples/show_times.cc share/doc/ambrix/examples/write_file.cc
    """.split()

# What other readers of CDF files see in the sample.
LISTED = """\
Time: cdf_int4, 24 records: 0
Longitude: cdf_real4, 1 record of 2: -165 -150
Latitude: cdf_real4, 1 record of 2: 40 30
Temperature: cdf_real4, 24 records of 2x2: 20 21.7 19.2 20.7
"""

# What the examples that write and read a file have in it.
SHOWN = """\
2024-05-10T12:00:00.000: 1.5 2.5 3.5
2024-05-10T12:00:01.000: 4.5 5.5 6.5
2024-05-10T12:00:02.000: 7.5 8.5 9.5
"""


def run(*command, env=None, folder=None):
    """The standard output of a program, which must succeed."""
    done = subprocess.run([str(word) for word in command], stdout=subprocess.PIPE,
                          stderr=subprocess.STDOUT, text=True, env=env, cwd=folder)
    if done.returncode != 0:
        raise AssertionError(f"{command[0]} failed:\n{done.stdout}")
    return done.stdout


def configure_example(tree, folder):
    """Lets CMake find ambrix in the tree for the example that lies in it."""
    return run(CMAKE, "-S", tree / "share/doc/ambrix/examples", "-B", folder,
               "-G", os.environ["AMBRIX_GENERATOR"],
               f"-DCMAKE_CXX_COMPILER={os.environ['AMBRIX_CXX']}",
               "-DCMAKE_CXX_FLAGS=-Wall -Wextra -Wpedantic -Werror",
               f"-DCMAKE_PREFIX_PATH={tree}", "-DCMAKE_FIND_USE_PACKAGE_REGISTRY=OFF")


class TreeChecks:
    """For test cases: checks of a tree, with nothing in the environment to help it."""

    def check_files(self, tree, files=FILES):
        self.assertEqual([name for name in files if not (tree / name).is_file()], [])
        readme = "README.md"
        self.assertEqual((tree / "share/doc/ambrix" / readme).exists(), (SOURCE / readme).exists())
        bundled = (BUILD / "lib/ambrix/libcdf.so").exists()
        for library in ("libcdf.so", "libambrix_inflate.so"):
            self.assertEqual((tree / "lib/ambrix" / library).exists(),
                             (BUILD / "lib/ambrix" / library).exists())
        if bundled:
            self.assertTrue((tree / "share/doc/ambrix/CDF_copyright.txt").is_file())

    def check_libraries(self, tree):
        """None is missing, or found in the folders of the build."""
        for program in ("bin/ambrix", "lib/ambrix/ambrix_module.so"):
            found = run("ldd", tree / program, env={"PATH": os.defpath})
            self.assertNotIn("not found", found)
            self.assertNotIn(str(BUILD), found)

    def check_tool(self, tree):
        tool = tree / "bin/ambrix"
        versions = run(tool, "--version", env={})
        self.assertIn(f"ambrix {VERSION}\n", versions)
        self.assertEqual(versions, run(BUILD / "bin/ambrix", "--version", env={}))
        told = run(tool, "info", SAMPLES / "example2.cdf", env={})
        self.assertRegex(told, r"\bTemperature +cdf_real4 +1 +2x2 +24\b")

    def check_example(self, tree, folder):
        """It is built with nothing but the tree, and tells what is in a file."""
        configure_example(tree, folder)
        run(CMAKE, "--build", folder)
        program = folder / "list_variables"
        self.assertEqual(run(program, SAMPLES / "example2.cdf", env={}), LISTED)
        self.assertIn('\ncartesian: cdf_char, 1 record of 2: "x"\n',
                      run(program, SAMPLES / "geocpi1.cdf", env={}))
        self.check_file_examples(folder)

    def check_file_examples(self, folder):
        """What one of them writes, the other reads."""
        run(folder / "write_file", folder / "written.cdf", env={})
        self.assertEqual(run(folder / "show_times", folder / "written.cdf", "Flux", env={}), SHOWN)

    def check_soname(self, tree):
        """Programs ask for the version that they were built with."""
        version = ".".join(VERSION.split(".")[:2])  # another minor version may differ, before 1.0
        name = f"libambrix_embedded.so.{version}"
        self.assertTrue((tree / "lib/ambrix" / name).is_file())
        told = run("readelf", "-d", tree / "lib/ambrix/libambrix_embedded.so")
        self.assertIn(f"soname: [{name}]", told)
        self.assertIn(f"[{name}]", run("readelf", "-d", tree / "bin/ambrix"))

    def check_pkg_config(self, tree, folder):
        """A compiler with the flags that pkg-config tells builds a program that runs."""
        if shutil.which("pkg-config") is None:
            self.skipTest("there is no pkg-config")
        asking = {"PATH": os.environ["PATH"], "PKG_CONFIG_PATH": str(tree / "lib/pkgconfig")}
        self.assertEqual(run("pkg-config", "--modversion", "ambrix", env=asking).strip(), VERSION)
        flags = shlex.split(run("pkg-config", "--cflags", "--libs", "ambrix", env=asking))
        program = folder / "by_pkg_config"
        run(os.environ["AMBRIX_CXX"], "-std=c++20",
            tree / "share/doc/ambrix/examples/list_variables.cc", *flags, "-o", program)
        self.assertEqual(run(program, SAMPLES / "example2.cdf", env={}), LISTED)
