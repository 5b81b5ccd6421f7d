"""Models of chord sequences, and scores."""

from __future__ import annotations

import os
from collections.abc import Iterable
from pathlib import Path
from typing import Union

from brindle import _native
from brindle._native import Song
from brindle._songs import Source, bytes_of, read, refuse_missing_file


class MarkovModel:
    """What songs have in common, as sequences of chords of variable length.

    A model may be used by several threads, which wait for each other.

    >>> import brindle
    >>> model = brindle.MarkovModel.learn(["C F G C", "C Am F G"])
    >>> model.order
    3
    """

    def __init__(self, order: int = 3) -> None:
        self._model = _native._Model.new(order)

    @classmethod
    def learn(cls, songs: Iterable[Song | Source], *, order: int = 3) -> MarkovModel:
        """A model of songs, with histories of up to `order` chords.

        >>> import brindle
        >>> brindle.MarkovModel.learn([brindle.read("C F | G C")], order=2).order
        2
        """
        if isinstance(songs, (str, bytes, os.PathLike)):
            raise TypeError("songs are many songs; for a single one, [song]")
        model = cls(order)
        for song in songs:
            model.add(song)
        return model

    def add(self, song: Song | Source) -> None:
        """Learns one more song; a song with faults or without chords is a `SongError`.

        >>> import brindle
        >>> model = brindle.MarkovModel()
        >>> model.add("C F G C")
        >>> model.symbol_count > 3
        True
        """
        self._model.learn(song if isinstance(song, Song) else read(song))

    @property
    def order(self) -> int:
        """The longest history.

        >>> import brindle
        >>> brindle.MarkovModel(order=4).order
        4
        """
        return self._model.order

    @property
    def symbol_count(self) -> int:
        """Different chords with their lengths, and marks of begin and end.

        >>> import brindle
        >>> brindle.MarkovModel.learn(["C F C F"]).symbol_count >= 2
        True
        """
        return self._model.symbol_count

    def generate(
        self, *, seed: int = 0, beats: float = 32.0, order: int = 0, samples: int = 10
    ) -> str:
        """A new sequence in the manner of what was learned, as a chord string that `read` reads.

        The same seed and model give the same sequence. `order` 0 is that of the model; the best of
        so many `samples` is taken.

        >>> import brindle
        >>> model = brindle.MarkovModel.learn(["C F G C | C Am F G", "C F Am G | C F G C"])
        >>> chords = model.generate(seed=7, beats=8)
        >>> chords == model.generate(seed=7, beats=8)
        True
        >>> sum(chord.length for chord in brindle.read(chords))
        8.0
        """
        if not 0 <= seed < 2**64:
            raise ValueError("a seed is 0 to 2**64 - 1")
        if order < 0 or samples < 0:
            raise ValueError("orders and samples are not below 0")
        return self._model.generate(seed, beats, order, samples)

    def dumps(self) -> str:
        """The text of a model file.

        >>> import brindle
        >>> model = brindle.MarkovModel.learn(["C F G C"])
        >>> brindle.MarkovModel.loads(model.dumps()).dumps() == model.dumps()
        True
        """
        return self._model.text()

    @classmethod
    def loads(cls, text: str) -> MarkovModel:
        """The model of such a text.

        >>> import brindle
        >>> brindle.MarkovModel.loads(brindle.MarkovModel(2).dumps()).order
        2
        """
        model = cls.__new__(cls)
        model._model = _native._Model.of_text(text)
        return model

    def save(self, path: Union[str, "os.PathLike[str]"]) -> None:
        """Writes a model file, which the program reads, too.

        >>> import brindle, os, tempfile
        >>> with tempfile.TemporaryDirectory() as folder:
        ...     path = os.path.join(folder, "songs.model")
        ...     brindle.MarkovModel.learn(["C F G C"]).save(path)
        ...     brindle.MarkovModel.load(path).order
        3
        """
        Path(path).write_text(self.dumps(), encoding="utf-8")

    @classmethod
    def load(cls, path: Union[str, "os.PathLike[str]"]) -> MarkovModel:
        """Reads a model file. See `save`."""
        return cls.loads(Path(path).read_text(encoding="utf-8", errors="replace"))

    def __repr__(self) -> str:
        return f"<MarkovModel of order {self.order} with {self.symbol_count} symbols>"

    def __reduce__(self) -> tuple[object, tuple[str]]:
        return (MarkovModel.loads, (self.dumps(),))


def score_json_lines(source: Source) -> str:
    """The notes of a score in MusicXML and what stands between them, a JSON object a line.

    >>> import brindle
    >>> brindle.score_json_lines(b"")
    Traceback (most recent call last):
    ...
    brindle.ScoreError: ...
    """
    return _native._score_json_lines(_score_bytes(source))


def score_midi(source: Source) -> bytes:
    """The notes of a score in MusicXML as a Standard MIDI File.

    >>> import brindle
    >>> brindle.score_midi(b"<score-partwise/>")[:4]
    b'MThd'
    """
    return _native._score_midi(_score_bytes(source))


def _score_bytes(source: Source) -> bytes:
    refuse_missing_file(source)  # no score looks like one
    return bytes_of(source)
