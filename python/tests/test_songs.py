"""Songs and their analyses."""

import copy
import dataclasses
import json
import pickle
import xml.etree.ElementTree as ElementTree

import brindle
import pytest

BLUES = "C7 . . . | F7 . . . | C7 . . . | C7 . . . | G7 . F7 . | C7 . G7 ."


def test_a_text_is_read():
    song = brindle.read("{title: One}\n{key: C}\n{tempo: 96}\n[C]la [G7]la\n")
    assert (song.title, song.format, song.tempo) == ("One", "chord-pro", 96.0)
    assert song.stated_key == brindle.Key("C")
    assert [chord.symbol for chord in song] == ["C", "G7"] and len(song) == 2


def test_a_file_is_read_by_path_and_by_its_name(source_folder):
    path = source_folder / "examples/scores/beautiful-dreamer.musicxml"
    song = brindle.read(path)
    assert song.format == "musicxml" and len(song) > 10
    assert brindle.read(str(path)).chords == song.chords
    assert brindle.read(path.read_bytes()).chords == song.chords
    with pytest.raises(FileNotFoundError):
        brindle.read(source_folder / "no such song.txt")


def test_faults_are_values():
    song = brindle.read("C what | G huh")
    assert song.has_fault and len(song) == 0
    assert (song.faults[0].line, song.faults[0].column) == (1, 3)
    with pytest.raises(brindle.SongError, match="^line 1, column 3: what: a chord begins") as raised:
        song.analyse()
    assert (raised.value.text, raised.value.position) == ("C what | G huh", 3)
    assert repr(song) == "<Song of 0 chords, with a fault>"
    lenient = brindle.read("C what | G huh", lenient=True)
    assert [fault.column for fault in lenient.faults] == [3, 13]
    assert [chord.symbol for chord in lenient if chord.chord.root] == ["C", "G"]


def test_the_line_of_a_fault_is_told():
    with pytest.raises(brindle.SongError) as raised:
        brindle.read(b"C G |\r\nAm | \xc3\xa9 x\r\nF", format="chord-text").analyse()
    assert (raised.value.text, raised.value.position) == ("Am | é x", 6)


def test_a_song_without_chords_has_no_key():
    for nothing in ("", "N.C.", "<score-partwise/>"):
        analysis = brindle.read(nothing).analyse()
        assert analysis.key is None and analysis.confidence is None


#   source                       what it is taken for
NAMES = [
    ("nosuch.txt",               FileNotFoundError),
    ("songs/nosuch.musicxml",    FileNotFoundError),
    ("./nosuch",                 FileNotFoundError),
    ("nosuch song.cho",          FileNotFoundError),
    ("what",                     None),
    ("C what.Hm | G",            None),
    ("nosuch.txt\n",             None),
    ("https://nosuch.invalid/a.txt", None),
]


@pytest.mark.parametrize("source, error", NAMES)
def test_a_string_that_is_meant_as_a_file_is_no_wrong_chord(source, error):
    if error is None:
        assert brindle.read(source).has_fault
        return
    for read in (brindle.read, brindle.score_midi, lambda name: brindle.MarkovModel.learn([name])):
        with pytest.raises(error, match="No such file") as raised:
            read(source)
        assert raised.value.filename == source


def test_a_song_and_its_analysis_are_sequences():
    song = brindle.read("Dm7 G7 | C A7")
    for sequence in (song, song.analyse()):
        assert [sequence[i] for i in range(len(sequence))] == list(sequence)
        assert sequence[-1].symbol == "A7" and [c.symbol for c in sequence[1:3]] == ["G7", "C"]
        assert sequence.chords is sequence.chords  # made once, so that a loop with an index is linear
        with pytest.raises(IndexError):
            sequence[4]
        with pytest.raises(TypeError):
            sequence["Dm7"]


def test_bytes_of_any_kind_are_read():
    for source in (b"C G", bytearray(b"C G"), memoryview(b"xC Gx")[1:-1]):
        assert [chord.symbol for chord in brindle.read(source)] == ["C", "G"]


def test_a_song_is_transposed_and_travels():
    song = brindle.read("{key: C}\n{tempo: 96}\n[Dm7]la [G7/B]la [N.C.]la [Cmaj7]la")
    up = song.transpose(1).transpose(2)
    symbols = ["Fm7", "Bb7/D", "N.C.", "Ebmaj7"]
    for again in (up, pickle.loads(pickle.dumps(up)), copy.deepcopy(up)):
        assert [chord.symbol for chord in again] == symbols
        assert again.stated_key == brindle.Key("Eb") and again.tempo == 96
        assert [chord.numeral for chord in again.analyse()] == ["ii7", "V7", "", "I^7"]
    for _ in range(2000):  # as many as somebody may press a key
        up = up.transpose(6)
    assert [chord.symbol for chord in pickle.loads(pickle.dumps(up))] == symbols
    learned = [brindle.MarkovModel.learn([each]).dumps() for each in (up, up.chord_pro(), song)]
    assert learned[0] == learned[1] != learned[2]
    assert up.transpose(-3).chords == brindle.read(song.chord_pro()).chords


def test_a_transposed_song_keeps_its_faults():
    wrong = brindle.read("C what G").transpose(2)
    with pytest.raises(brindle.SongError, match="line 1, column 3"):
        pickle.loads(pickle.dumps(wrong)).analyse()
    with pytest.raises(brindle.SongError, match="line 1, column 3"):
        brindle.song_fingerings(wrong)


def test_a_song_is_midi():
    song = brindle.read("Dm7 G7 | C . . .")
    assert song.midi() == song.midi(120) != song.midi(tempo=60)
    assert song.midi(tempo=60).count(b"\xff\x51\x03\x0f\x42\x40") == 1  # a second a beat
    for tempo in (0, -1, 1001, float("nan"), float("inf")):
        with pytest.raises(ValueError, match="1 to 1000"):
            song.midi(tempo)


#   options                       error
OPTIONS = [
    ({"beats_per_bar": 0},        ValueError),
    ({"beats_per_bar": "4"},      TypeError),
    ({"beats_per_chord": float("nan")}, ValueError),
    ({"beats_per_chord": 1e308},  ValueError),
    ({"beats_per_bar": 1e-300},   ValueError),
    ({"format": "tape"},          ValueError),
]


@pytest.mark.parametrize("options, error", OPTIONS)
def test_options_that_make_no_sense_raise(options, error):
    with pytest.raises(error):
        brindle.read("C", **options)


def test_a_reading():
    analysis = brindle.read("Dm7 G7 | C . E7 . | Am . . .").analyse(explain=True)
    assert str(analysis.key) == "C Major"
    rows = [(c.symbol, c.numeral, c.function, c.relation, c.resolves_to) for c in analysis]
    assert rows == [
        ("Dm7", "ii7", "subdominant", "related second", 1),
        ("G7", "V7", "dominant", "dominant", 2),
        ("C", "I", "tonic", "tonic", None),
        ("E7", "V7", "dominant", "dominant", 4),
        ("Am", "i", "tonic", "tonic", None),
    ]
    assert analysis.chords[3].explanation.startswith("E7 is the dominant of")
    regions = [(str(r.key), r.position, r.end, r.first_chord, r.chord_count) for r in analysis.regions]
    assert regions == [("C Major", 0.0, 6.0, 0, 3), ("A Minor", 6.0, 12.0, 3, 2)]


def test_songs_are_read_as_teachers_read_them(source_folder):
    """The table that the tests of the library use: numeral~relation>index of what it leads to."""
    table = (source_folder / "tests/data/reading/songs.tsv").read_text(encoding="utf-8")
    rows = [line.split("\t") for line in table.splitlines()[1:]]
    # Where the key changes may be seen in two ways; songs in one key have one.
    rows = [row for row in rows if len(row) == 3 and row[2].count(":") == 1]
    assert len(rows) > 10
    for name, chords, expected in rows:
        words = [word for word in expected.split() if not word.endswith(":")]
        numerals = [  # of which some have two ways to be written
            {way.split("~")[0].split(">")[0] for way in word.split("|")} for word in words
        ]
        analysis = brindle.read(chords, even=True).analyse()
        # A chord that is written twice in a row stands there once.
        once = [
            chord
            for before, chord in zip((None, *analysis), analysis)
            if before is None or before.chord != chord.chord
        ]
        assert len(once) == len(numerals), name
        for chord, ways in zip(once, numerals):
            assert chord.numeral in ways, f"{name} at {chord.position}"


def test_a_stated_key_counts():
    song = brindle.read("Am F C G")
    assert song.analyse(key="A minor").key == brindle.Key("Am")
    assert song.analyse(key=brindle.Key("C")).key == brindle.Key("C")
    assert song.analyse(key="Am").to_dict() != song.analyse(key="C").to_dict()
    with pytest.raises(brindle.KeyNameError):
        song.analyse(key="A mynor")


def goldens(path):
    command = None
    outputs = {}
    for line in path.read_text(encoding="utf-8").splitlines(keepends=True):
        if line.startswith("$ "):
            command = line[2:].strip()
            outputs[command] = ""
        else:
            outputs[command] += line
    return outputs


def test_the_json_is_that_of_the_program(source_folder):
    outputs = goldens(source_folder / "tests/cli/golden/analyse-json.txt")
    command, expected = next(iter(outputs.items()))
    text = command.split("'")[1]
    analysis = brindle.read(text).analyse()
    assert analysis.to_json().strip() == expected.strip()
    assert analysis.to_dict() == json.loads(expected)


def test_pictures_are_svg():
    analysis = brindle.read(BLUES).analyse()
    for picture in (analysis.svg(), analysis.time_axis_svg(), analysis._repr_svg_()):
        assert ElementTree.fromstring(picture).tag.endswith("svg")
    assert analysis.svg(theme="dark") != analysis.svg(theme="light")
    with pytest.raises(ValueError):
        analysis.svg(theme="pink")


def test_songs_and_analyses_are_pickled():
    song = brindle.read("Dm7 G7 C", beats_per_chord=2, lenient=True)
    again = pickle.loads(pickle.dumps(song))
    assert again.chords == song.chords and again.chords[0].length == 2.0
    analysis = song.analyse(key="C", copies=True, explain=True)
    again = pickle.loads(pickle.dumps(analysis))
    assert again.chords == analysis.chords and again.to_json() == analysis.to_json()


def test_records_are_plain_data():
    chord = brindle.read("C F G").analyse().chords[0]
    assert dataclasses.replace(chord) == chord and hash(chord) == hash(dataclasses.replace(chord))
    with pytest.raises(dataclasses.FrozenInstanceError):
        chord.symbol = "D"
    assert pickle.loads(pickle.dumps(chord)) == chord


def test_scores_give_lines_and_midi(source_folder):
    path = source_folder / "examples/scores/frere-jacques.musicxml"
    lines = brindle.score_json_lines(path).splitlines()
    assert len(lines) > 20 and all(isinstance(json.loads(line), dict) for line in lines)
    assert brindle.score_midi(path).startswith(b"MThd")
    for bad in (b"", b"PK\x03\x04", b"<a>", "no score"):
        with pytest.raises(brindle.ScoreError):
            brindle.score_midi(bad)
