"""Stands in for numpy while pip reads the metadata of a source package.

The setup.py that brings the CDF distribution imports numpy.distutils and would otherwise compile
the whole library merely to tell its name. Whatever it imports from here exists and does nothing.
"""
import importlib.abc
import importlib.machinery
import sys

import setuptools


def setup(**_):
    setuptools.setup(name="pysatCDF", version="0.3.2")


class _Submodules(importlib.abc.MetaPathFinder, importlib.abc.Loader):
    def find_spec(self, name, path=None, target=None):
        if name.startswith("numpy."):
            return importlib.machinery.ModuleSpec(name, self, is_package=True)
        return None

    def create_module(self, spec):
        return None

    def exec_module(self, module):
        module.setup = setup
        module.Extension = setuptools.Extension
        module.__getattr__ = lambda name: type(name, (), {})


sys.meta_path.insert(0, _Submodules())
