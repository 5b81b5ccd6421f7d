"""What songs and analyses consist of: plain records that compare, print, pickle and unpack."""

from __future__ import annotations

from dataclasses import dataclass, field

from brindle._native import Chord, Key, Song


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


@dataclass(frozen=True)
class ModelSong:
    """A song that a model was made of.

    >>> import brindle
    >>> brindle.SongModel.learn(["C F | G7 C"]).songs[0].key
    Key('C Major')
    """

    title: str
    """May be empty."""
    makers: str
    """With years, of a song that comes with the library; otherwise empty."""
    style: str
    """As its source calls it; may be empty."""
    key: Key
    """That it was written in."""
    chord_count: int
    """How many chords it has, equal neighbours as one."""


@dataclass(frozen=True)
class NextChord:
    """A chord that may come next.

    >>> import brindle
    >>> chord = brindle.SongModel.built_in().next_chords(["Dm7", "G7"], key="C")[0]
    >>> chord.chord, chord.numeral, chord.function
    (Chord('C'), 'I', 'tonic')
    """

    chord: Chord
    """Spelled as in the key."""
    probability: float
    """Of all chords that may come, 0 to 1."""
    numeral: str
    """What it is behind the chords before."""
    function: str
    """What it does there: "tonic", "subdominant", "dominant", "none"."""
    key: Key
    """In which that is said: the one that was asked for, or that was found."""


@dataclass(frozen=True)
class Quote:
    """A passage of a written song that stands just so, in whatever key, in a song of the model.

    >>> import brindle
    >>> quote = brindle.SongModel.learn(["C F | G7 C | Am Dm | G7 C"]).write_song(bars=4).quote
    >>> quote is None or quote.bars <= 4
    True
    """

    title: str
    """Of the song it stands in; may be empty."""
    source_bar: float
    """Where it stands there, in bars from 1, also within a bar."""
    bar: float
    """Where it stands in the written song, likewise."""
    bars: float
    """How long it is, in bars."""


@dataclass(frozen=True)
class WrittenSong:
    """A song that a model wrote.

    >>> import brindle
    >>> written = brindle.SongModel.built_in().write_song(form="blues", key="F")
    >>> len(written.song.bars)
    12
    """

    song: Song
    """To be analysed, transposed, drawn."""
    text: str
    """As a chord text, four bars a line, each part under its letter in brackets."""
    quote: Quote | None
    """The longest of all that stand in it."""
    json: str = field(repr=False)
    """As the program prints it."""


@dataclass(frozen=True)
class OrderScore:
    """How well songs are foretold by histories of one length; fewer bits are better.

    >>> import brindle
    >>> [score.order for score in brindle.SongModel.built_in("blues").scores()]
    [1, 2, 3, 4, 5]
    """

    order: int
    """Chords of history."""
    bits: float
    """Bits a chord, with chords told by their keys."""
    bits_without_keys: float
    """The same with all chords absolute."""
