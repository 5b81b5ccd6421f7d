"""Calls the functions of the Python package with damaged input until its time is over.

python_fuzz.py SECONDS [--seed SEED]     so many seconds of calls; prints how many of which
python_fuzz.py --call SEED NUMBER        one of these calls again

Each call is made by its seed and number alone. The last number is in the file that BRINDLE_LAST_CALL
names, so that a crash can be made again. What a call may raise is in `EXPECTED`; all else is a fault,
as is a call that takes longer than a minute.
"""

from __future__ import annotations

import argparse
import collections
import copy
import faulthandler
import os
import pickle
import random
import sys
import tempfile
import time
from collections.abc import Callable
from pathlib import Path
from typing import Any

import brindle

try:
    import pyarrow
except ImportError:
    pyarrow = None

EXPECTED = (ValueError, TypeError, OverflowError, IndexError, OSError)
SLOWEST_CALL = 60
FOLDER = Path(__file__).parent
STRANGE: list[Any] = [
    None, True, -1, 0, 1, 13, 2**15, 2**31 - 1, 2**31, 2**63, -(2**63), 2**70, 0.5, -0.0,
    float("nan"), float("inf"), 1e308, "", "\0", "\ud800", "C\0m7", "é", b"", b"\xff", "x" * 5000,
    [], [None], ["C"], {}, object(), brindle.Chord("C"), brindle.Key("C"), int, brindle.Chord,
]  # fmt: skip


def seeds_of(*folders: str) -> list[bytes]:
    files = [file for folder in folders for file in sorted((FOLDER / "corpus" / folder).iterdir())]
    return [file.read_bytes()[:20000] for file in files]


class Dice:
    """Makes the arguments of one call."""

    seeds = {
        "chord": seeds_of("chord_text", "chord_symbol"),
        "key": seeds_of("key_text", "sign_key_string") + [b"Eb minor", b"h-moll"],
        "scale": seeds_of("scale_string") + [b"D dorian", b"F# harmonic minor"],
        "song": seeds_of("song", "roman_text", "numerals", "musicxml", "musicxml_container"),
        "score": seeds_of("musicxml_import", "musicxml", "musicxml_container"),
        "model": seeds_of("markov_model"),
    }

    def __init__(self, seed: str, number: int) -> None:
        self.random = random.Random(f"{seed}:{number}")

    def damaged(self, kind: str) -> bytes:
        content = bytearray(self.random.choice(self.seeds[kind]))
        for _ in range(self.random.randint(0, 6)):
            place = self.random.randint(0, len(content))
            other = self.random.choice(self.seeds[kind])
            begin = self.random.randint(0, len(other))
            pieces = (
                self.random.randbytes(self.random.randint(1, 4)),
                other[begin : begin + self.random.randint(1, 60)],
                bytes(content[place : place + 30]) * self.random.randint(1, 20),
            )
            content[place : place + self.random.randint(0, 8)] = self.random.choice(pieces)
        return bytes(content)

    def text(self, kind: str) -> Any:
        content = self.damaged(kind)
        if kind in ("chord", "key", "scale"):
            content = content[: self.random.choice((4, 12, 60, 2000))]
        return self.maybe_strange(content.decode("utf-8", "replace"))

    def source(self, kind: str) -> Any:
        content = self.damaged(kind)
        how = self.random.choice(("strict", "replace", "surrogateescape"))
        try:
            return self.maybe_strange(self.random.choice((content, content.decode("utf-8", how))))
        except UnicodeDecodeError:
            return content

    def maybe_strange(self, value: Any) -> Any:
        return self.random.choice(STRANGE) if self.random.random() < 0.05 else value

    def integer(self, least: int, most: int) -> Any:
        return self.maybe_strange(self.random.randint(least, most))

    def word(self, *words: Any) -> Any:
        return self.maybe_strange(self.random.choice(words))

    def several(self, most: int, make: Callable[[], Any]) -> Any:
        return self.maybe_strange([make() for _ in range(self.random.randint(0, most))])


def look_at(value: Any, depth: int = 2) -> None:
    """Asks a value for all that it tells, prints, copies and pickles it."""
    repr(value), str(value)
    assert copy.copy(value) == value or value != value or not is_value(value)
    if is_value(value):
        assert pickle.loads(pickle.dumps(value)) == value, "a pickle reads as another value"
        hash(value)
    if depth == 0:
        return
    if isinstance(value, (list, tuple)):
        for item in value[:20]:
            look_at(item, depth - 1)
    if not type(value).__module__.startswith("brindle"):
        return
    for name in dir(type(value)):
        if not name.startswith("_") and not callable(getattr(type(value), name)):
            look_at(getattr(value, name), depth - 1)


def is_value(value: Any) -> bool:
    return isinstance(value, (brindle.Chord, brindle.Key, brindle.Note, brindle.Scale))


def call_chord(dice: Dice) -> None:
    chord = brindle.Chord(dice.text("chord"))
    look_at(chord)
    chord.name(dice.word("usual", "german", "solfege", "jazz"))


def call_chord_of(dice: Dice) -> None:
    tones = dice.several(14, lambda: dice.integer(-2, 13))
    notes = [brindle.Note(name) for name in ("C", "F#", "Bb", "B#")]
    look_at(brindle.Chord.of(dice.word(*notes), tones, dice.word(None, *notes)))


def call_key(dice: Dice) -> None:
    look_at(brindle.Key(dice.text("key")))


def call_scale(dice: Dice) -> None:
    look_at(brindle.Scale(dice.text("scale")))


def call_note(dice: Dice) -> None:
    look_at(brindle.Note(dice.word("C", "F##", "Es", "sol", dice.text("key"))))


def call_names(dice: Dice) -> None:
    notes = dice.several(14, lambda: dice.integer(-1, 128))
    options = {
        "key": dice.word(None, "A minor", dice.text("key")),
        "bass": dice.word("usual", "only", "none", "x"),
        "before": dice.word(None, "Dm7", dice.text("chord")),
        "after": dice.word(None, "G7", brindle.Chord("C")),
    }
    look_at(brindle.names(notes, limit=dice.integer(-1, 14), **options))
    brindle.name(notes, **options)


def read_song(dice: Dice) -> Any:
    return brindle.read(
        dice.source("song"),
        format=dice.word("auto", "auto", "auto", "chord-pro", "chart", "roman-text", "musicxml", "x"),
        beats_per_bar=dice.word(4.0, 4.0, 3, 0.001, -1),
        beats_per_chord=dice.word(1.0, 2, 1e-9),
        even=dice.word(False, True),
        lenient=dice.word(False, True),
    )


def call_read(dice: Dice) -> None:
    song = read_song(dice)
    look_at(song)
    pickle.loads(pickle.dumps(song))
    list(song), len(song), song[:2]
    moved = song.transpose(dice.integer(-100, 100))
    pickle.loads(pickle.dumps(moved)).chord_pro(), moved.midi(dice.word(None, 60, 0.5, 1e9))


def call_analyse(dice: Dice) -> None:
    analysis = read_song(dice).analyse(
        key=dice.word(None, None, "A minor", dice.text("key")),
        alternatives=dice.word(False, True),
        copies=dice.word(False, True),
        explain=dice.word(False, True),
    )
    look_at(analysis)
    analysis.to_dict(), analysis.to_text(), analysis.time_axis_svg()
    analysis.svg(
        theme=dice.word("auto", "dark", "x"),
        bars_per_line=dice.integer(-1, 9),
        width=dice.word(800.0, 1, -5, 1e6),
    )
    pickle.loads(pickle.dumps(analysis))


def tuning_of(dice: Dice) -> Any:
    letters = dice.several(20, lambda: dice.random.choice("ABCDEFG#b0123456789"))
    text = "".join(letters) if isinstance(letters, list) and all(
        isinstance(letter, str) for letter in letters) else letters
    return dice.word(None, "ukulele", "DADGAD", "E2A2D3G3B3E4", text)


def call_fingerings(dice: Dice) -> None:
    found = brindle.fingerings(
        dice.text("chord"),
        tuning=tuning_of(dice),
        capo=dice.integer(-1, 26),
        limit=dice.integer(-1, 12),
    )
    look_at(found)
    brindle.fingerings_json(found), brindle.fingerings_svg(found, title=dice.text("key"))
    brindle.fingerings_svg([*found, dice.word(None, 1, *found)])


def call_fretted(dice: Dice) -> None:
    frets = dice.word("x32010", dice.text("chord"), "0-12-24-x")
    look_at(brindle.fretted(frets, tuning=tuning_of(dice), capo=dice.integer(-1, 26)))


def call_grids(dice: Dice) -> None:
    look_at(brindle.grids(dice.text("chord"), tuning=tuning_of(dice), capo=dice.integer(-1, 26)))


def call_model(dice: Dice) -> None:
    songs = dice.several(4, lambda: dice.source("song"))
    model = brindle.MarkovModel.learn(songs, order=dice.integer(-1, 6))
    brindle.MarkovModel.loads(model.dumps())
    generate(dice, model)


def generate(dice: Dice, model: Any) -> None:
    look_at(model)
    model.generate(
        seed=dice.integer(-1, 2**40),
        beats=dice.word(4.0, 16, 0, -1),
        order=dice.integer(-1, 5),
        samples=dice.integer(-1, 4),
    )


def call_model_file(dice: Dice) -> None:
    generate(dice, brindle.MarkovModel.loads(dice.text("model")))


def call_score(dice: Dice) -> None:
    source = dice.source("score")
    brindle.score_midi(source), brindle.score_json_lines(source)


def call_batch(dice: Dice) -> None:
    texts = dice.several(6, lambda: dice.word(None, dice.source("song")))
    if isinstance(texts, list) and dice.random.random() < 0.5:
        texts = pyarrow.array(texts, dice.random.choice((pyarrow.string(), pyarrow.binary(), None)))
        texts = texts.slice(*dice.random.choice(((0,), (1,), (1, 2))))
    batch = brindle.analyse_batch(
        texts, threads=dice.integer(0, 3), lenient=dice.word(False, True)
    )
    batch.validate(full=True)
    batch.to_pylist()


CALLS = [call for name, call in sorted(globals().items()) if name.startswith("call_")]
if pyarrow is None:
    CALLS.remove(call_batch)


def make_call(seed: str, number: int) -> tuple[str, str]:
    """Makes a call; the names of its function and of what it raised."""
    dice = Dice(seed, number)
    call = dice.random.choice(CALLS)
    try:
        call(dice)
    except UnicodeDecodeError:
        raise  # the package made a text that is none
    except EXPECTED as error:
        return call.__name__, type(error).__name__
    return call.__name__, "done"


def run(seconds: float, seed: str) -> None:
    last = os.open(os.environ.get("BRINDLE_LAST_CALL", os.devnull), os.O_WRONLY | os.O_CREAT, 0o600)
    counts: collections.Counter[tuple[str, str]] = collections.Counter()
    end = time.monotonic() + seconds
    number = 0
    while time.monotonic() < end:
        os.pwrite(last, f"--call {seed} {number}\n".encode(), 0)
        faulthandler.dump_traceback_later(SLOWEST_CALL, exit=True)
        counts[make_call(seed, number)] += 1
        number += 1
    faulthandler.cancel_dump_traceback_later()
    for name in sorted({call for call, _ in counts}):
        ways = [f"{way} {count}" for (call, way), count in sorted(counts.items()) if call == name]
        print(f"{name.removeprefix('call_')}: {', '.join(ways)}")
    print(f"{number} calls with seed {seed}, nothing found")


def main() -> None:
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("seconds", type=float, nargs="?", default=10)
    parser.add_argument("--seed", default=str(random.SystemRandom().randrange(10**6)))
    parser.add_argument("--call", nargs=2, metavar=("SEED", "NUMBER"))
    options = parser.parse_args()
    # A text may be the name of a file: here is none.
    with tempfile.TemporaryDirectory() as folder:
        os.chdir(folder)
        if options.call:
            print(*make_call(options.call[0], int(options.call[1])))
        else:
            run(options.seconds, options.seed)
        os.chdir(FOLDER)
    sys.stdout.flush()


if __name__ == "__main__":
    main()
