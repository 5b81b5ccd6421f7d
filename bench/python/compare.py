"""Chord symbols, keys and lead sheets a second, beside music21 and tonal, in one run.

    python bench/python/compare.py [--tonal FOLDER]

music21 is a package of Python; FOLDER has a `node_modules` with the package
`tonal`. What is not there is left out. All work on the same symbols and the same songs.
"""

import argparse
import json
import os
import pathlib
import subprocess
import time

import brindle

ROOTS = ["C", "Db", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"]
KINDS = ["", "m", "7", "m7", "maj7", "dim", "m7b5", "6", "9", "sus4", "dim7", "aug"]
SYMBOLS = [root + kind for root in ROOTS for kind in KINDS]
SCORES = sorted((pathlib.Path(__file__).parents[2] / "examples/scores").glob("*.musicxml"))
SONG = "Dm7 . G7 . | Cmaj7 . A7 . | Dm7 . G7 . | C . . . | Fm7 . Bb7 . | Ebmaj7 . . . | Am7b5 . D7 . | Gm . . ."


def rate(work, count):
    """How many of `count` things a second, the best of rounds of about half a second."""
    best = 0.0
    for _ in range(3):
        rounds, begin = 0, time.perf_counter()
        while (spent := time.perf_counter() - begin) < 0.5:
            work()
            rounds += 1
        best = max(best, count * rounds / spent)
    return best


def rates_of_brindle():
    songs = [SONG] * 500
    sources = [path.read_bytes() for path in SCORES]
    tones = {symbol: brindle.Chord(symbol).pitch_classes for symbol in SYMBOLS}
    assert all(3 <= len(tones[symbol]) <= 5 for symbol in SYMBOLS)
    return {
        "symbols": rate(lambda: [brindle.Chord(s).pitch_classes for s in SYMBOLS], len(SYMBOLS)),
        "keys": rate(lambda: [brindle.Key(r + " major").scale.notes for r in ROOTS], len(ROOTS)),
        "sheets": rate(lambda: [brindle.read(s).analyse().chords for s in sources], len(sources)),
        "songs": rate(lambda: [brindle.read(SONG).analyse().chords for _ in range(50)], 50),
        "songs in batches, 1 thread": rate(lambda: brindle.analyse_batch(songs, threads=1), 500),
        "songs in batches, all threads": rate(lambda: brindle.analyse_batch(songs), 500),
    }


def rates_of_music21():
    from music21 import converter, harmony, key

    # It writes the flats of roots as "-".
    symbols = [root.replace("b", "-") + kind for root in ROOTS for kind in KINDS]

    def sheet(path):
        score = converter.parse(path, forceSource=True)
        found = score.analyze("key")
        return found, [chord.pitches for chord in score.recurse().getElementsByClass("ChordSymbol")]

    return {
        "symbols": rate(
            lambda: [[p.pitchClass for p in harmony.ChordSymbol(s).pitches] for s in symbols],
            len(symbols),
        ),
        "keys": rate(
            lambda: [[p.name for p in key.Key(r.replace("b", "-")).pitches] for r in ROOTS],
            len(ROOTS),
        ),
        "sheets": rate(lambda: [sheet(path) for path in SCORES], len(SCORES)),
    }


TONAL = """
const {get} = require("tonal").Chord;
const {majorKey} = require("tonal").Key;
const {symbols, roots} = JSON.parse(process.argv[1]);
function rate(work, count) {
    let best = 0;
    for (let round = 0; round < 3; ++round) {
        let rounds = 0, begin = process.hrtime.bigint(), spent = 0;
        while ((spent = Number(process.hrtime.bigint() - begin) / 1e9) < 0.5) { work(); ++rounds; }
        best = Math.max(best, count * rounds / spent);
    }
    return best;
}
let sum = 0;
console.log(JSON.stringify({
    symbols: rate(() => { for (const s of symbols) sum += get(s).notes.length; }, symbols.length),
    keys: rate(() => { for (const r of roots) sum += majorKey(r).scale.length; }, roots.length),
}));
"""


def rates_of_tonal(folder):
    ran = subprocess.run(
        ["node", "-e", TONAL, json.dumps({"symbols": SYMBOLS, "roots": ROOTS})],
        cwd=folder, capture_output=True, text=True, check=True,
    )
    return json.loads(ran.stdout)


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--tonal", help="a folder with node_modules")
    arguments = parser.parse_args()
    ours = rates_of_brindle()
    others = {}
    try:
        others["music21"] = rates_of_music21()
    except ImportError:
        print("music21 is not installed: left out")
    if arguments.tonal:
        others["tonal"] = rates_of_tonal(arguments.tonal)
    for name, value in ours.items():
        row = f"{name + ' a second':42} {value:12.0f}"
        for other, rates in others.items():
            if name in rates:
                row += f"   {other} {rates[name]:10.0f} (x {value / rates[name]:.1f})"
        print(row)
    print(f"{os.cpu_count()} processors")


if __name__ == "__main__":
    main()
