"""Fingerings that people wrote down."""

from __future__ import annotations

import os
from typing import Union

from brindle import _native
from brindle._native import Chord, Fingering


class GridPackage:
    """A package of fingerings; without a path the one that comes with this package.

    May be used by several threads, which wait for each other.

    >>> import brindle
    >>> package = brindle.GridPackage()
    >>> str(package.find("C")[0])
    'x32010'
    """

    def __init__(self, path: Union[str, "os.PathLike[str]", None] = None) -> None:
        self._path = None if path is None else os.fspath(path)
        self._package = _native._GridPackage(self._path or "")

    def find(
        self, chord: Chord | str, *, tuning: str | None = None, capo: int = 0
    ) -> list[Fingering]:
        """The fingerings of a chord; the best that can be searched if the package has none.

        >>> import brindle
        >>> brindle.GridPackage().find("Am")[0].name
        'Am'
        """
        return self._package.find(chord, tuning, capo)

    def __reduce__(self) -> tuple[type[GridPackage], tuple[str | None]]:
        return (GridPackage, (self._path,))


_own_package: GridPackage | None = None


def grids(chord: Chord | str, *, tuning: str | None = None, capo: int = 0) -> list[Fingering]:
    """The written fingerings of a chord, of the package that comes with the library.

    >>> import brindle
    >>> brindle.grids("Em")[0].library != ""
    True
    """
    global _own_package
    if _own_package is None:
        _own_package = GridPackage()
    return _own_package.find(chord, tuning=tuning, capo=capo)
