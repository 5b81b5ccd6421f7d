"""What songs and analyses consist of: plain records that compare, print, pickle and unpack."""

from __future__ import annotations

from dataclasses import dataclass

from brindle._native import Chord, Key


@dataclass(frozen=True)
class NamedChord:
    """A name of some notes.

    >>> import brindle
    >>> brindle.names([60, 64, 70])[0]
    NamedChord(symbol='C7', exact_symbol='C7(no5)', chord=Chord('C7no5'), cost=35)
    """

    symbol: str
    """As players say it."""
    exact_symbol: str
    """The same with all that is left out."""
    chord: Chord
    """Exactly the notes."""
    cost: int
    """How unusual the name is, in tenths of a bit."""


@dataclass(frozen=True)
class SongChord:
    """A chord of a song as it was written.

    >>> import brindle
    >>> brindle.read("Cmin7 . F7").chords[0]
    SongChord(position=0.0, length=2.0, symbol='Cmin7', chord=Chord('Cm7'))
    """

    position: float
    """In beats from the beginning of the song."""
    length: float
    """In beats."""
    symbol: str
    """As it was written."""
    chord: Chord
    """What it means; without root where no chord sounds."""


@dataclass(frozen=True)
class Fault:
    """What is wrong in a song or was left out of it.

    >>> import brindle
    >>> brindle.read("C what G").faults[0].column
    3
    """

    text: str
    """What is wrong."""
    line: int
    """From 1; 0 where it is the whole song."""
    column: int
    """In characters from 1."""
    is_note: bool
    """All chords are there, something else was left out."""


@dataclass(frozen=True)
class Bar:
    """A bar as it is played.

    >>> import brindle
    >>> brindle.read("C . . . | F . . .").bars[1]
    Bar(number='2', position=4.0, length=4.0, time=None)
    """

    number: str
    """As printed."""
    position: float
    """In beats from the beginning of the song."""
    length: float
    """In beats."""
    time: tuple[int, int] | None
    """Its time signature, where the song tells one."""


@dataclass(frozen=True)
class Section:
    """A part of a song that begins here.

    >>> import brindle
    >>> brindle.read("{sov: Verse 1}\\n[C]la\\n{eov}").sections
    (Section(name='Verse 1', position=0.0),)
    """

    name: str
    """May be empty."""
    position: float
    """In beats from the beginning of the song."""


@dataclass(frozen=True)
class Region:
    """A passage in one key.

    >>> import brindle
    >>> brindle.read("C F G C").analyse().regions[0]
    Region(key=Key('C Major'), position=0.0, end=4.0, first_chord=0, chord_count=4)
    """

    key: Key
    """The key of the passage."""
    position: float
    """In beats from the beginning of the song."""
    end: float
    """In beats from the beginning of the song."""
    first_chord: int
    """Index of a chord of the song."""
    chord_count: int
    """How many chords it has."""


@dataclass(frozen=True)
class ChordReading:
    """One chord as a teacher reads it.

    >>> import brindle
    >>> reading = brindle.read("C A7 Dm G7 C").analyse().chords[1]
    >>> reading.numeral, reading.relation
    ('V7/ii', 'dominant')
    """

    position: float
    """In beats from the beginning of the song."""
    length: float
    """In beats."""
    symbol: str
    """As it was written."""
    chord: Chord
    """What it means."""
    key: Key | None
    """The key of its passage; None for no chord."""
    numeral: str
    """In that key, "V7/ii"; empty for no chord."""
    function: str
    """"tonic", "subdominant", "dominant", "none" for a chord that only passes by; empty for no chord."""
    relation: str
    """What it is to the chords around it: "related second", "substitute dominant"."""
    resolves_to: int | None
    """Index of the chord that it leads to."""
    under: int | None
    """Index of the later chord that it stands under in the tree of the song."""
    deceptive: bool
    """A dominant of the tonic that is followed by vi or VI instead."""
    explanation: str
    """A sentence, if explanations were asked for."""
