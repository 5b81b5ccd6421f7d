"""Fingerings, grids and models."""

import json
import pickle
import sys
import xml.etree.ElementTree as ElementTree

import brindle
import pytest

#   chord     tuning          capo  best
FINGERINGS = [
    ("Am7",   None,           0,    "x02010"),
    ("C",     None,           0,    "x32010"),
    ("D/F#",  None,           0,    "200232"),
    ("G",     "ukulele",      0,    "0232"),
    ("D",     "DADGAD",       0,    None),
    ("Dm7",   "drop d",       2,    None),
    ("G7",    "E2A2D3G3B3E4", 0,    None),
]


@pytest.mark.parametrize("chord, tuning, capo, best", FINGERINGS)
def test_a_fingering_sounds_its_chord(chord, tuning, capo, best):
    found = brindle.fingerings(chord, tuning=tuning, capo=capo, limit=20)
    assert 0 < len(found) <= 20
    assert best is None or str(found[0]) == best
    sought = brindle.Chord(chord)
    allowed = set(sought.pitch_classes) | ({sought.bass.pitch_class} if sought.bass else set())
    for fingering in found:
        sounding = {pitch % 12 for pitch in fingering.pitches if pitch is not None}
        assert sounding <= allowed
        assert fingering.omitted or allowed == sounding


def test_a_chord_may_be_handed_in():
    assert brindle.fingerings(brindle.Chord("Am7")) == brindle.fingerings("Am7")


#   call                                                   error
ERRORS = [
    (lambda: brindle.fingerings("Am7", tuning="XYZ"),      brindle.FingeringError),
    (lambda: brindle.fingerings("Am7", capo=25),           ValueError),
    (lambda: brindle.fingerings("Am7", bass="low"),        ValueError),
    (lambda: brindle.song_fingerings(brindle.read("C"), highest_capo=13), ValueError),
    (lambda: brindle.song_fingerings(brindle.read("C"), tuning="XYZ"), brindle.FingeringError),
    (lambda: brindle.song_fingerings("C"),                 TypeError),
    (lambda: brindle.fingerings("Amy"),                    brindle.ChordError),
    (lambda: brindle.fingerings("N.C."),                   brindle.ChordError),
    (lambda: brindle.fingerings(7),                        (TypeError, RuntimeError)),
    (lambda: brindle.fretted("x320"),                      brindle.FingeringError),
    (lambda: brindle.fretted("hello"),                     brindle.FingeringError),
    (lambda: brindle.GridPackage("no such package"),       brindle.FingeringError),
    (lambda: brindle.GridPackage("/"),                     brindle.FingeringError),
    (lambda: brindle.fingerings_svg([1]),                  TypeError),
    (lambda: brindle.fingerings_svg([None]),               TypeError),
    (lambda: brindle.fingerings_json([brindle.fretted("x32010"), None]), TypeError),
]


@pytest.mark.parametrize("call, error", ERRORS)
def test_what_makes_no_sense_raises(call, error):
    with pytest.raises(error):
        call()


#   song               options                  capo  shapes
SONGS = [
    ("Bb F | Gm Eb",   {},                      3,    ["G", "D", "Em", "C"]),
    ("Bb F | Gm Eb",   {"capo": 0},             0,    ["Bb", "F", "Gm", "Eb"]),
    ("Bb F | Gm Eb",   {"capo": 1},             1,    ["A", "E", "F#m", "D"]),
    ("Bb F | Gm Eb",   {"highest_capo": 0},     0,    ["Bb", "F", "Gm", "Eb"]),
    ("C E7 Am C",      {"capo": 3},             3,    ["A", "C#7", "F#m"]),
]


@pytest.mark.parametrize("text, options, capo, shapes", SONGS)
def test_a_song_has_fingerings_under_a_capo(text, options, capo, shapes):
    song = brindle.read(text)
    grids = brindle.song_fingerings(song, **options)
    assert [grid.name for grid in grids] == shapes
    assert {grid.capo for grid in grids} == {capo}
    told = json.loads(brindle.song_fingerings_json(song, **options))
    assert told["Capos"][0]["Shapes"] == shapes
    assert [row["Symbol"] for row in told["Chords"]] == [chord.symbol for chord in song]


def test_fingerings_are_pickled_and_drawn():
    fingering = brindle.fingerings("F", capo=1)[0]
    again = pickle.loads(pickle.dumps(fingering))
    assert again == fingering and hash(again) == hash(fingering)
    assert again.svg() == fingering.svg() and again != brindle.fretted("x32010")
    assert again != None and again != "x02010"  # noqa: E711
    assert ElementTree.fromstring(fingering._repr_svg_().encode()).tag.endswith("svg")
    assert fingering.svg(left_handed=True) != fingering.svg()


def test_written_fingerings_come_with_the_package():
    found = brindle.grids("Am")
    assert found and all(grid.library for grid in found)
    assert brindle.grids("Am", tuning="DADGAD")
    package = pickle.loads(pickle.dumps(brindle.GridPackage()))
    assert package.find("Am") == found


SONGS = ["C . . . | F . . . | G . . . | C . . .", "Am . F . | C . G . | Am . F . | G . C ."]


def test_a_model_learns_and_generates():
    model = brindle.MarkovModel.learn(SONGS, order=2)
    assert model.order == 2
    chords = model.generate(seed=5, beats=16)
    assert chords == model.generate(seed=5, beats=16)
    assert len({model.generate(seed=seed, beats=16) for seed in range(20)}) > 1
    song = brindle.read(chords)
    assert sum(chord.length for chord in song) == 16
    known = {chord.symbol for text in SONGS for chord in brindle.read(text)}
    assert {chord.symbol for chord in song} <= known


def test_a_model_is_kept(tmp_path):
    model = brindle.MarkovModel.learn(SONGS)
    text = model.dumps()
    path = tmp_path / "songs.model"
    model.save(path)
    for again in (brindle.MarkovModel.load(path), pickle.loads(pickle.dumps(model))):
        assert again.dumps() == text
        assert again.generate(seed=3, beats=8) == model.generate(seed=3, beats=8)


def test_a_model_refuses():
    model = brindle.MarkovModel.learn(SONGS)
    for call, error in [
        (lambda: brindle.MarkovModel(0), ValueError),
        (lambda: brindle.MarkovModel.loads("{}"), brindle.ModelError),
        (lambda: model.add("C what"), brindle.SongError),
        (lambda: model.add(""), brindle.SongError),
        (lambda: model.generate(beats=0), brindle.ModelError),
        (lambda: model.generate(seed=-1), ValueError),
        (lambda: model.generate(seed=2**64), ValueError),
        (lambda: model.generate(samples=-1), ValueError),
        (lambda: brindle.MarkovModel.learn("C F G C"), TypeError),
        (lambda: brindle.MarkovModel.load(sys.executable), brindle.ModelError),
        (lambda: brindle.MarkovModel().generate(), brindle.ModelError),
    ]:
        with pytest.raises(error):
            call()
