"""What is raised for input that is not understood."""

from __future__ import annotations


class BrindleError(ValueError):
    """Input that cannot be understood; the base of all errors of this package.

    >>> import brindle
    >>> try:
    ...     brindle.Chord("Cmay7")
    ... except brindle.BrindleError as error:
    ...     error.text, error.position
    ('Cmay7', 4)
    """

    text: str
    """What was handed in."""
    position: int
    """The character of the text, from 1, that is not understood; 0 for no certain place."""

    def __init__(self, message: str, text: str = "", position: int = 0) -> None:
        super().__init__(message, text, position)
        self.text = text
        self.position = position

    def __str__(self) -> str:
        return str(self.args[0])


class ChordError(BrindleError):
    """A text that is no chord symbol.

    >>> import brindle
    >>> brindle.Chord("H7#")
    Traceback (most recent call last):
    ...
    brindle.ChordError: "#" at 3 needs a number behind it
    """


class NoteError(BrindleError):
    """A text that names no note, or a number that is none.

    >>> import brindle
    >>> brindle.Note("X")
    Traceback (most recent call last):
    ...
    brindle.NoteError: a note is a letter of A to H with # or b behind it
    """


class KeyNameError(BrindleError):
    """A text that names no key.

    >>> import brindle
    >>> brindle.Key("C mayor").tonic
    Traceback (most recent call last):
    ...
    brindle.KeyNameError: behind the key stands major or minor, or nothing
    """


class ScaleError(BrindleError):
    """A text that names no scale.

    >>> import brindle
    >>> brindle.Scale("D dorain")
    Traceback (most recent call last):
    ...
    brindle.ScaleError: ...
    """


class SongError(BrindleError):
    """A song that was not understood and is to be analysed or learned from.

    `text` is the line of its first fault, and `position` a character of it.

    >>> import brindle
    >>> brindle.read("C G | Amm").analyse()
    Traceback (most recent call last):
    ...
    brindle.SongError: line 1, column 9: Amm: "m" at 3 is not understood
    """


class FingeringError(BrindleError):
    """A tuning, frets or a package of fingerings that make no sense.

    >>> import brindle
    >>> brindle.fingerings("Am7", tuning="XYZ")
    Traceback (most recent call last):
    ...
    brindle.FingeringError: a tuning is a name, DADGAD or E2A2D3G3B3E4
    """


class ModelError(BrindleError):
    """A text that is no model, or a model that cannot give what was asked for.

    >>> import brindle
    >>> brindle.MarkovModel.loads("no model")
    Traceback (most recent call last):
    ...
    brindle.ModelError: this is no model file
    """


class ScoreError(BrindleError):
    """Bytes that are no score in MusicXML.

    >>> import brindle
    >>> brindle.score_midi(b"no score")
    Traceback (most recent call last):
    ...
    brindle.ScoreError: ...
    """
