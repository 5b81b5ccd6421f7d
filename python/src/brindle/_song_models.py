"""Models of songs: what may come next, and new songs."""

from __future__ import annotations

import os
from collections.abc import Iterable
from pathlib import Path
from typing import Literal, Union

from brindle import _native
from brindle._native import Chord, Key, Song
from brindle._records import ModelSong, NextChord, OrderScore, WrittenSong
from brindle._songs import Source, read

Place = Literal["bar 1", "bar 2", "bar 3", "bar 4", "middle", "weak"]


def _taught(songs: Iterable[Song | Source]) -> list[_native._TaughtSong]:
    if isinstance(songs, (str, bytes, bytearray, memoryview, os.PathLike)):
        raise TypeError("songs are many songs; for a single one, [song]")
    return [_native._teach(song if isinstance(song, Song) else read(song)) for song in songs]


class SongModel:
    """What songs have in common: which chord follows which in a key, where in the bar, how long.

    A model never changes and may be used by several threads.

    >>> import brindle
    >>> model = brindle.SongModel.built_in()
    >>> model
    <SongModel of 81 songs>
    >>> [str(next.chord) for next in model.next_chords(["C", "Am", "Dm"], key="C", limit=2)]
    ['G7', 'G']
    """

    _model: _native._SongModel

    def __init__(self) -> None:
        raise TypeError("a SongModel is made by built_in, learn, loads or load")

    @classmethod
    def _of(cls, model: _native._SongModel) -> SongModel:
        made = cls.__new__(cls)
        made._model = model
        return made

    @classmethod
    def built_in(cls, style: str | None = None) -> SongModel:
        """The model of the songs that come with the library, all or those of a style.

        >>> import brindle
        >>> brindle.SongModel.built_in("hymn")
        <SongModel of 22 songs>
        """
        made = cls._of(_native._SongModel.built_in())
        return made if style is None else made.of_style(style)

    @classmethod
    def learn(cls, songs: Iterable[Song | Source], *, built_in: bool = False) -> SongModel:
        """The model of these songs, and of those that come with the library if they are wanted, too.

        A song with faults or without chords is a `SongError`.

        >>> import brindle
        >>> brindle.SongModel.learn(["C F | G7 C", brindle.read("Am E7 | Am")])
        <SongModel of 2 songs>
        """
        taught = _taught(songs)
        if not taught and not built_in:
            raise ValueError("there is no song to learn")
        made = cls._of(_native._SongModel.learned(taught))
        return made.join(cls.built_in()) if built_in else made

    def join(self, other: SongModel) -> SongModel:
        """The model of the songs of both.

        >>> import brindle
        >>> one = brindle.SongModel.learn(["C F | G7 C"])
        >>> one.join(brindle.SongModel.built_in("blues"))
        <SongModel of 12 songs>
        """
        return self._of(self._model.joined(other._model))

    def of_style(self, style: str) -> SongModel:
        """The model of its songs of a style, a `ModelError` if there is none.

        >>> import brindle
        >>> brindle.SongModel.built_in().of_style("Ragtime")
        <SongModel of 7 songs>
        """
        return self._of(self._model.of_style(style))

    @property
    def songs(self) -> tuple[ModelSong, ...]:
        """The songs that it was made of.

        >>> import brindle
        >>> sorted({song.style for song in brindle.SongModel.built_in().songs})
        ['blues', 'early jazz', 'folk', 'hymn', 'ragtime']
        """
        return self._model.songs

    @property
    def chord_count(self) -> int:
        """The chords of all its songs together.

        >>> import brindle
        >>> brindle.SongModel.learn(["C F | G7 C"]).chord_count
        4
        """
        return self._model.chord_count

    def next_chords(
        self,
        chords: Iterable[Chord | str] = (),
        *,
        key: Key | str | None = None,
        limit: int = 10,
        place: Place = "bar 1",
        order: int = 5,
    ) -> tuple[NextChord, ...]:
        """What may come behind chords, the likeliest first; without chords what songs in `key` begin with.

        Without a `key` it is found; without chords and key there is nothing to tell. `place` is where
        the next chord begins: on the first beat of which of four bars, in the middle of a bar, or
        elsewhere. So many chords before are looked at, 1 to 5, as `order` says.

        >>> import brindle
        >>> model = brindle.SongModel.built_in()
        >>> [next.numeral for next in model.next_chords(["Dm7", "G7"], key="C", limit=3)][0]
        'I'
        >>> round(sum(next.probability for next in model.next_chords(["C"], limit=1000)), 6)
        1.0
        """
        if isinstance(chords, str):
            raise TypeError('chords are several chords: ["Dm7", "G7"]')
        if limit < 0 or order < 0:
            raise ValueError("limits and orders are not below 0")
        return self._model.next_chords(list(chords), key, limit, place, order)

    def write_song(
        self,
        *,
        key: Key | str = "C",
        form: str = "",
        bars: int = 0,
        beats_per_bar: int = 4,
        sheet: str = "",
        begins: str = "",
        ends: str = "",
        contains: str | Iterable[str] = (),
        never: str | Iterable[str] = (),
        most_quoted_bars: float = 4.0,
        order: int = 5,
        seed: int = 0,
    ) -> WrittenSong:
        """Writes a new song; the same seed, model and wishes give the same song.

        `form` has a letter for each part, "AABA", or is "blues", which is written after the songs of
        that style if there are any. `bars` 0 are those of the sheet or the usual ones. `sheet` has chords
        that are fixed, and _ for gaps: "C . Am . | _ | G7". `begins` and `ends` are a chord or its numeral,
        `contains` are rows of chords that stand somewhere ("ii-V-I of F"), `never` chords that do not
        occur. A passage of more than `most_quoted_bars` does not stand just so in a song of the model; 0
        allows any. Wishes that are not understood, and those that cannot be met, are a `ModelError`,
        which names a smallest set that contradicts itself.

        >>> import brindle
        >>> model = brindle.SongModel.built_in("hymn")
        >>> written = model.write_song(key="Eb", bars=8, begins="I", contains=["ii V"], seed=1)
        >>> written.song[0].symbol, written.song.stated_key
        ('Eb', Key('Eb Major'))
        >>> model.write_song(begins="C", never="C")
        Traceback (most recent call last):
        ...
        brindle.ModelError: these wishes cannot be met together: begins C; never C
        """
        if not 0 <= seed < 2**64:
            raise ValueError("a seed is 0 to 2**64 - 1")
        if not 0 <= bars <= 256 or not 0 <= beats_per_bar <= 24 or not 0 <= order <= 5:
            raise ValueError("a song has 1 to 256 bars of 1 to 24 beats, histories have 1 to 5 chords")
        rows = contains if isinstance(contains, str) else ";".join(contains)
        banned = never if isinstance(never, str) else " ".join(never)
        wishes = [form, sheet, begins, ends, rows, banned]
        return self._model.write_song(
            key, bars, beats_per_bar, wishes, most_quoted_bars, order, seed
        )

    def scores(self, songs: Iterable[Song | Source] = ()) -> tuple[OrderScore, ...]:
        """How well it foretells songs, for histories of each length; its own songs without any.

        Songs that it has learned are foretold by a model without them.

        >>> import brindle
        >>> model = brindle.SongModel.built_in("blues")
        >>> scores = model.scores(["C . . . | F7 . . . | C . . . | G7 . . ."])
        >>> scores[0].bits > 0
        True
        """
        return self._model.scores(_taught(songs))

    def dumps(self) -> str:
        """The text of a model file.

        >>> import brindle
        >>> model = brindle.SongModel.learn(["C F | G7 C"])
        >>> brindle.SongModel.loads(model.dumps()) == model
        True
        """
        return self._model.text()

    @classmethod
    def loads(cls, text: str) -> SongModel:
        """The model of such a text; a `ModelError` for any other one, and for a damaged one.

        >>> import brindle
        >>> brindle.SongModel.loads("{}")
        Traceback (most recent call last):
        ...
        brindle.ModelError: the text is no song model
        """
        return cls._of(_native._SongModel.of_text(text))

    def save(self, path: Union[str, "os.PathLike[str]"]) -> None:
        """Writes a model file, which the program reads, too.

        >>> import brindle, os, tempfile
        >>> with tempfile.TemporaryDirectory() as folder:
        ...     path = os.path.join(folder, "songs.json")
        ...     brindle.SongModel.learn(["C F G C"]).save(path)
        ...     brindle.SongModel.load(path)
        <SongModel of 1 song>
        """
        Path(path).write_text(self.dumps(), encoding="utf-8")

    @classmethod
    def load(cls, path: Union[str, "os.PathLike[str]"]) -> SongModel:
        """Reads a model file. See `save`.

        >>> import brindle
        >>> brindle.SongModel.load("nowhere/songs.json")
        Traceback (most recent call last):
        ...
        FileNotFoundError: ...
        """
        return cls.loads(Path(path).read_text(encoding="utf-8", errors="replace"))

    def __eq__(self, other: object) -> bool:
        if not isinstance(other, SongModel):
            return NotImplemented
        return self.dumps() == other.dumps()

    def __hash__(self) -> int:
        return hash((len(self.songs), self.chord_count))

    def __repr__(self) -> str:
        count = len(self.songs)
        return f"<SongModel of {count} {'song' if count == 1 else 'songs'}>"

    def __reduce__(self) -> tuple[object, tuple[str]]:
        return (SongModel.loads, (self.dumps(),))
