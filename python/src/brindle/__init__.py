"""Music theory and harmony analysis: chords, keys, lead sheets, fingerings, whole corpora.

>>> import brindle
>>> brindle.Chord("F#m7/C#").name()
'F#m7/C#'
>>> brindle.read("Dm7 G7 | Cmaj7").analyse().key
Key('C Major')
"""

from __future__ import annotations

from pathlib import Path as _Path

from brindle import _native
from brindle._batch import analyse_batch, batch_schema
from brindle._errors import (
    BrindleError,
    ChordError,
    FingeringError,
    KeyNameError,
    ModelError,
    NoteError,
    ScaleError,
    ScoreError,
    SongError,
)
from brindle._grids import GridPackage, grids
from brindle._models import MarkovModel, score_json_lines, score_midi
from brindle._native import (
    Analysis,
    Chord,
    Fingering,
    Key,
    Note,
    Scale,
    Song,
    __version__,
    fingerings,
    fingerings_json,
    fingerings_svg,
    fretted,
    name,
    names,
    song_fingerings,
    song_fingerings_json,
)
from brindle._records import (
    Bar,
    ChordReading,
    Fault,
    ModelSong,
    NamedChord,
    NextChord,
    OrderScore,
    Quote,
    Region,
    Section,
    SongChord,
    WrittenSong,
)
from brindle._song_models import SongModel
from brindle._songs import read

__all__ = [
    "Analysis",
    "Bar",
    "BrindleError",
    "Chord",
    "ChordError",
    "ChordReading",
    "Fault",
    "Fingering",
    "FingeringError",
    "GridPackage",
    "Key",
    "KeyNameError",
    "MarkovModel",
    "ModelError",
    "ModelSong",
    "NamedChord",
    "NextChord",
    "Note",
    "NoteError",
    "OrderScore",
    "Quote",
    "Region",
    "Scale",
    "ScaleError",
    "ScoreError",
    "Section",
    "Song",
    "SongChord",
    "SongError",
    "SongModel",
    "WrittenSong",
    "__version__",
    "analyse_batch",
    "batch_schema",
    "fingerings",
    "fingerings_json",
    "fingerings_svg",
    "fretted",
    "grids",
    "name",
    "names",
    "read",
    "score_json_lines",
    "score_midi",
    "song_fingerings",
    "song_fingerings_json",
]

# Tracebacks name errors and records as users do.
for _value in (globals()[_name] for _name in __all__):
    if getattr(_value, "__module__", "") in ("brindle._errors", "brindle._records"):
        _value.__module__ = "brindle"

_folder = _Path(__file__).parent
_native._set_folders(str(_folder / "data"), str(_folder / "locale"))
