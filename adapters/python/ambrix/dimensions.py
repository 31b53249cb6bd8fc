"""Names of dimensions, from DEPEND_i and LABL_PTR_i.

They follow from the definitions of variables and their attributes alone, so that all files of a
kind have the same names.
"""
from collections.abc import Mapping

from ambrix.variable import Variable


class Dimensions:
    """The dimensions of the variables of a file.

    Attributes:
        coordinates: the names of the variables that others depend on or take their labels from.
    """

    def __init__(self, variables: Mapping[str, Variable]) -> None:
        self._variables = variables
        self.coordinates: set[str] = set()
        self._labels: dict[str, str] = {}  # the dimension that a variable of labels lies over
        for variable in variables.values():
            self._note(variable)

    def _note(self, variable: Variable) -> None:
        records = self._named(variable, "DEPEND_0")
        if records is not None:
            self.coordinates.add(records.name)
        for place in range(len(variable.sizes)):
            axis = self._named(variable, f"DEPEND_{place + 1}")
            labels = self._named(variable, f"LABL_PTR_{place + 1}")
            self.coordinates |= {named.name for named in (axis, labels) if named is not None}
            both = [named for named in (axis, labels)
                    if named is not None and self._lies_along(named, variable, place)]
            if len(both) == 2:
                self._labels.setdefault(both[1].name, both[0].name)

    def _named(self, variable: Variable, attribute: str) -> Variable | None:
        """The other variable that an attribute names."""
        name = variable.attrs.get(attribute)
        if not isinstance(name, str):
            return None
        found = self._variables.get(name)
        if found is None:  # blanks at the end may differ
            found = next((v for v in self._variables.values()
                          if v.name.rstrip() == name.rstrip()), None)
        return None if found is None or found.name == variable.name else found

    @staticmethod
    def _lies_along(axis: Variable, variable: Variable, place: int) -> bool:
        """Whether it has one fixed value for each index along a dimension."""
        return not axis.record_varies and axis.sizes == (variable.sizes[place],)

    def of(self, variable: Variable) -> tuple[str, ...]:
        """The names of the dimensions of a variable."""
        names: list[str] = [self._records(variable)] if variable.record_varies else []
        for place in range(len(variable.sizes)):
            name = self._dimension(variable, place)
            names.append(f"{variable.name}_dim_{place + 1}" if name in names else name)
        return tuple(names)

    def _records(self, variable: Variable) -> str:
        times = self._named(variable, "DEPEND_0")
        if times is not None and times.record_varies and times.records == variable.records \
                and not times.sizes:
            return times.name
        if not variable.sizes and variable.name in self.coordinates:
            return variable.name
        return f"{variable.name}_record"

    def _dimension(self, variable: Variable, place: int) -> str:
        fixed = self._fixed_name(variable, place)
        if fixed:
            return fixed
        axis = self._named(variable, f"DEPEND_{place + 1}")
        if axis is not None and axis.record_varies and axis.sizes == (variable.sizes[place],):
            # Values change with the records: both lie over the same dimension, without an index.
            return self._fixed_name(axis, 0) or f"{axis.name}_dim_1"
        return f"{variable.name}_dim_{place + 1}"

    def _fixed_name(self, variable: Variable, place: int) -> str:
        """The name of a dimension with fixed values or labels; empty if there are none."""
        for attribute in (f"DEPEND_{place + 1}", f"LABL_PTR_{place + 1}"):
            axis = self._named(variable, attribute)
            if axis is not None and self._lies_along(axis, variable, place):
                return self._labels.get(axis.name, axis.name)
        if not variable.record_varies and len(variable.sizes) == 1:
            return self._labels.get(variable.name, variable.name)
        return ""
