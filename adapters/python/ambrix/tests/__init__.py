"""The tests of the package: `pytest --pyargs ambrix` runs them."""
