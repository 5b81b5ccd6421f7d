"""Whole corpora in one call."""

from __future__ import annotations

import os
from collections.abc import Iterable
from typing import TYPE_CHECKING, Any, Union

from brindle import _native

if TYPE_CHECKING:
    import pyarrow

Texts = Union[Iterable[Union[str, bytes, None]], "pyarrow.Array[Any]", "pyarrow.ChunkedArray[Any]"]


class _Capsules:
    """What pyarrow takes a table from."""

    def __init__(self, capsules: tuple[Any, Any]) -> None:
        self._capsules = capsules

    def __arrow_c_array__(self, requested_schema: object = None) -> tuple[Any, Any]:
        return self._capsules


def _arrow() -> Any:
    try:
        import pyarrow
    except ImportError as error:
        raise ImportError("analyse_batch needs pyarrow: pip install 'brindle[arrow]'") from error
    return pyarrow


def batch_schema() -> pyarrow.Schema:
    """The schema of what `analyse_batch` gives.

    >>> import brindle
    >>> brindle.batch_schema().names
    ['title', 'key', 'confidence', 'chords', 'faults']
    """
    return analyse_batch([]).schema


def analyse_batch(
    texts: Texts, *, threads: int | None = None, lenient: bool = False
) -> pyarrow.RecordBatch:
    """Reads the harmony of many songs and gives a row for each.

    `texts` are the songs themselves, in any form that `read` knows: strings or bytes, a list or an
    array of pyarrow. A row of None is null. A song that is not understood gives a row with its faults
    and without chords. The work is shared by `threads`, as many as there are processors without it.

    Columns: `title`, `key` ("A Minor", null without chords), `confidence`, `chords` (a list of
    records: `position` and `length` in beats, `symbol`, `root` 0 to 11, `mask` of the semitones above
    it, `numeral`, `function`, `relation`, `key`) and `faults` (`line`, `column`, `text`, `is_note`).

    >>> import brindle
    >>> batch = brindle.analyse_batch(["Dm7 G7 | C", "what"])
    >>> batch.column("key").to_pylist()
    ['C Major', None]
    >>> [chord["numeral"] for chord in batch.column("chords")[0].as_py()]
    ['ii7', 'V7', 'I']
    """
    arrow = _arrow()
    count = _processors() if threads is None else threads
    if count < 1:
        raise ValueError("threads are at least 1")
    if isinstance(texts, arrow.ChunkedArray):
        texts = texts.combine_chunks()
    if isinstance(texts, arrow.Array):
        binary = _large_binary(arrow, texts)
        capsules = _native._analyse_arrow(binary.__arrow_c_array__()[1], count, lenient)
    else:
        capsules = _native._analyse_list(list(texts), count, lenient)
    return arrow.record_batch(_Capsules(capsules))


def _large_binary(arrow: Any, texts: Any) -> Any:
    if arrow.types.is_dictionary(texts.type):
        texts = texts.dictionary_decode()
    try:
        return texts.cast(arrow.large_binary())
    except arrow.ArrowNotImplementedError:
        raise TypeError(f"texts are an array of {texts.type}, not of strings") from None


def _processors() -> int:
    if hasattr(os, "sched_getaffinity"):
        return len(os.sched_getaffinity(0))
    return os.cpu_count() or 1
