"""Reading songs from files and texts."""

from __future__ import annotations

import errno
import os
from pathlib import Path
from typing import Any, Literal, Union

from brindle import _native
from brindle._native import Analysis, Song

# What pickles call: functions of Python have names that they can be found by.
def read_again(*arguments: Any) -> Song:
    return _native._read(*arguments)


def transpose_again(song: Song, steps: tuple[int, ...]) -> Song:
    for semitones in steps:
        song = song.transpose(semitones)
    return song


def written_again(source: bytes, repeats: list[tuple[float, float, int]]) -> Song:
    return _native._written(source, repeats)


def analyse_again(song: Song, *arguments: Any) -> Analysis:
    return song.analyse(*arguments)


Source = Union[str, bytes, bytearray, memoryview, "os.PathLike[str]"]
Format = Literal[
    "auto",
    "chord-text",
    "even-text",
    "chords-above-lyrics",
    "chord-pro",
    "chart",
    "chart-link",
    "chart-page",
    "chord-strings",
    "musicxml",
    "compressed-musicxml",
    "roman-text",
]


def _names_file(text: str) -> bool:
    # A chord text is no name of a file: nobody has a file of that name where he looks for a song.
    try:
        return "\n" not in text and Path(text).is_file()
    except (OSError, ValueError):
        return False


def bytes_of(source: Source) -> bytes:
    """The bytes of a file or of a text."""
    if isinstance(source, (bytes, bytearray, memoryview)):
        return bytes(source)
    if isinstance(source, str) and not _names_file(source):
        return source.encode("utf-8", "surrogatepass")
    return Path(source).read_bytes()


def refuse_missing_file(source: object) -> None:
    """FileNotFoundError for a string that is no music, but looks like the name of a file."""
    if isinstance(source, str) and not _names_file(source):
        try:
            is_name = _native._looks_like_file_name(source)
        except TypeError:  # of half characters
            return
        if is_name:
            raise FileNotFoundError(errno.ENOENT, os.strerror(errno.ENOENT), source)


def read(
    source: Source,
    *,
    format: Format = "auto",
    beats_per_bar: float = 4.0,
    beats_per_chord: float = 1.0,
    even: bool = False,
    lenient: bool = False,
) -> Song:
    """Reads a song in any form: chord text, ChordPro, charts, Roman numerals, MusicXML.

    `source` is a path, the bytes of a song or its text; a string that is the name of a file is read
    as that file. What is wrong in a song is in its `faults` and not raised before the song is used; a
    file that cannot be read is an `OSError`, and so is a string that is no song and looks like the name
    of a file. `beats_per_bar` and `beats_per_chord` are of a text that does not tell;
    `even` lets the chords of a bar without holds share it; a `lenient` reading leaves out what is not
    understood.

    >>> import brindle
    >>> song = brindle.read("| Dm7 G7 | C . . . |", even=True)
    >>> [chord.length for chord in song]
    [2.0, 2.0, 4.0]
    >>> brindle.read("C what G", lenient=True).chords[2].symbol
    'G'
    """
    song = _native._read(
        bytes_of(source), format, beats_per_bar, beats_per_chord, even, lenient
    )
    if song.has_fault:
        refuse_missing_file(source)
    return song
