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

    `texts` are the songs themselves, in any form that `read` knows: strings or bytes, a list or a
    column of pyarrow, pandas or NumPy. A row of None is null. A song that is not understood gives a
    row with its faults and without chords. The work is shared by `threads`, as many as there are processors without it.

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
    if isinstance(texts, (str, bytes, bytearray)):
        raise TypeError("texts are many songs; for a single one, [text]")
    column = _column(arrow, texts)
    if column is None:
        capsules = _analyse_list(list(texts), count, lenient)
    else:
        binary = _large_binary(arrow, column)
        capsules = _native._analyse_arrow(binary.__arrow_c_array__()[1], count, lenient)
    return arrow.record_batch(_Capsules(capsules))


def _column(arrow: Any, texts: Any) -> Any:
    """Texts as a column of pyarrow, if they are one of any package; else None."""
    if isinstance(texts, (arrow.Array, arrow.ChunkedArray)):
        return texts
    if hasattr(texts, "__arrow_c_stream__"):
        return arrow.chunked_array(texts)
    if hasattr(texts, "__array__"):  # of NumPy, or of pandas with its missing values
        return arrow.array(texts, from_pandas=True)
    return None


def _analyse_list(texts: list[Any], threads: int, lenient: bool) -> tuple[Any, Any]:
    try:
        return _native._analyse_list(texts, threads, lenient)
    except UnicodeEncodeError:  # half a character is a fault of its song, as in `read`
        encoded = [t.encode("utf-8", "surrogatepass") if isinstance(t, str) else t for t in texts]
        return _native._analyse_list(encoded, threads, lenient)


def _large_binary(arrow: Any, texts: Any) -> Any:
    if isinstance(texts, arrow.ChunkedArray):
        chunks = [_large_binary(arrow, chunk) for chunk in texts.chunks]
        return arrow.concat_arrays(chunks) if chunks else arrow.array([], arrow.large_binary())
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
