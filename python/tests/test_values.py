"""Notes, keys, scales and chords."""

import copy
import json
import pickle

import brindle
import pytest
from hypothesis import given, settings
from hypothesis import strategies as st

SPELLINGS = [letter + sign for letter in "CDEFGAB" for sign in ("", "#", "b", "bb")]
notes = st.sampled_from(SPELLINGS).map(brindle.Note)
chords = st.builds(
    brindle.Chord.of,
    notes,
    st.sets(st.integers(1, 11)).map(lambda tones: sorted(tones | {0})),
    st.none() | notes,
)
values = st.one_of(
    notes,
    chords,
    st.sampled_from([f"{key}{mode}" for key in ("C", "F#", "Bb", "Eb") for mode in ("", "m")]).map(
        brindle.Key
    ),
    st.sampled_from(["D dorian", "Bb blues minor", "F# lydian", "A natural minor"]).map(
        brindle.Scale
    ),
)

#   symbol          root   bass  intervals           notes
CHORDS = [
    ("C",           "C",  None, (0, 4, 7),           "C E G"),
    ("F#m7/C#",     "F#", "C#", (0, 3, 7, 10),       "F# A C# E"),
    ("Co7",         "C",  None, (0, 3, 6, 9),        "C Eb Gb Bbb"),
    ("Ab:min7/b3",  "Ab", "Cb", (0, 3, 7, 10),       "Ab Cb Eb Gb"),
    ("B♭m7♭5",      "Bb", None, (0, 3, 6, 10),       "Bb Db Fb Ab"),
    ("C7#9",        "C",  None, (0, 3, 4, 7, 10),    "C E G Bb D#"),
    ("CΔ",          "C",  None, (0, 4, 7, 11),       "C E G B"),
    ("Gsus4",       "G",  None, (0, 5, 7),           "G C D"),
]


@pytest.mark.parametrize("symbol, root, bass, intervals, tones", CHORDS)
def test_a_chord_symbol_is_read(symbol, root, bass, intervals, tones):
    chord = brindle.Chord(symbol)
    assert str(chord.root) == root
    assert (None if chord.bass is None else str(chord.bass)) == bass
    assert chord.intervals == intervals
    assert sorted(str(note) for note in chord.notes) == sorted(tones.split())
    assert set(chord.pitch_classes) == {note.pitch_class for note in chord.notes}


def test_the_symbols_of_the_library_are_read_alike(source_folder):
    """The table that the tests of the library use: text, tones, bass key."""
    table = (source_folder / "tests/data/chord-spellings.tsv").read_text(encoding="utf-8")
    read = 0
    for line in table.splitlines()[1:]:
        text, tones, bass = line.split("\t")[:3]
        if not tones or not tones[0].isdigit():
            continue
        chord = brindle.Chord(text)
        assert ",".join(map(str, chord.intervals)) == tones, text
        assert ("" if chord.bass is None else str(chord.bass.pitch_class)) == bass, text
        read += 1
    assert read > 300


#   text         position
FAULTS = [
    ("Cmay7",    4),
    ("",         1),
    ("Q",        1),
    ("F♯m7♭5?",  7),
    ("%",        1),
]


@pytest.mark.parametrize("text, position", FAULTS)
def test_what_is_no_chord_is_told_with_its_place(text, position):
    with pytest.raises(brindle.ChordError) as raised:
        brindle.Chord(text)
    assert (raised.value.text, raised.value.position) == (text, position)
    assert isinstance(raised.value, ValueError)
    again = pickle.loads(pickle.dumps(raised.value))
    assert (str(again), again.text, again.position) == (str(raised.value), text, position)


#   call                                       error
ERRORS = [
    (lambda: brindle.Note("H#b!"),             brindle.NoteError),
    (lambda: brindle.Note("Cm"),               brindle.NoteError),
    (lambda: brindle.Note(""),                 brindle.NoteError),
    (lambda: brindle.Key("C mayor"),           brindle.KeyNameError),
    (lambda: brindle.Scale("D dorain"),        brindle.ScaleError),
    (lambda: brindle.name([60, 200]),          brindle.NoteError),
    (lambda: brindle.name([]),                 brindle.NoteError),
    (lambda: brindle.name([60], before="Q"),   brindle.ChordError),
    (lambda: brindle.names([60], after=7),     TypeError),
    (lambda: brindle.fingerings(7),            TypeError),
    (lambda: brindle.grids("C", tuning=7),     TypeError),
    (lambda: brindle.read("C").analyse(key=7), TypeError),
    (lambda: brindle.Chord("C").name("tonic"), ValueError),
    (lambda: brindle.Chord.of(brindle.Note("C"), [12]), ValueError),
    (lambda: brindle.Chord.of("X", [0]),       brindle.NoteError),
    (lambda: brindle.Chord.of(None, [0]),      TypeError),
    (lambda: brindle.Chord.of("C", "047"),     TypeError),
    (lambda: brindle.name([60.5]),             TypeError),
    (lambda: brindle.name("abc"),              TypeError),
    (lambda: brindle.name(60),                 TypeError),
    (lambda: brindle.Chord(7),                 TypeError),
    (lambda: brindle.Chord("C\ud800"),         (ValueError, TypeError)),
]


@pytest.mark.parametrize("call, error", ERRORS)
def test_bad_input_raises(call, error):
    with pytest.raises(error):
        call()


def test_keys_and_scales_answer():
    key = brindle.Key("fis-Moll")
    assert (str(key), key.mode, key.signature) == ("F# Minor", "minor", 3)
    assert key.relative == brindle.Key("A")
    assert " ".join(map(str, key.scale.notes)) == "F# G# A B C# D E"
    assert brindle.Scale("D dorian").intervals == (0, 2, 3, 5, 7, 9, 10)


def test_styles():
    chord = brindle.Chord("Bbm7/Ab")
    assert chord.name("german") == "Bm7/Ab"
    assert chord.name("solfege") == "Sibm7/Lab"
    assert chord.name(unicode=True) == "B♭m7/A♭"


def test_notes_are_named():
    assert brindle.name([60, 64, 67, 70]) == "C7"
    assert brindle.name([57, 60, 64, 67]) == "Am7"
    assert brindle.name([61, 65, 68], key="F# major") == "C#"
    assert brindle.name([64, 67, 69, 72]) == "Am7/E"
    assert brindle.name([64, 67, 69, 72], before=brindle.Chord("Dm7"), after="G7") == "C6/E"
    assert brindle.names([64, 67, 69, 72], before="Dm7", after="G7")[0].cost == 86
    assert brindle.name([64, 67, 69, 72], before="N.C.") == "Am7/E"
    assert [name.symbol for name in brindle.names([60, 63, 66, 69], limit=1)] == ["Cdim7"]
    assert brindle.names([]) == []
    for notes in ({67, 60, 64}, iter([60, 64, 67]), range(60, 68, 12), (n for n in (60, 64, 67))):
        assert brindle.name(notes) == "C"


def test_states_that_make_no_sense_are_refused():
    for value, state in [
        (brindle.Note("C"), (99, 2)),
        (brindle.Note("C"), (0, 77)),
        (brindle.Note("C"), ("C", "#")),
        (brindle.Key("C"), (brindle.Note("C"), 9)),
        (brindle.Chord("C"), (brindle.Note("C"),)),
        (brindle.Chord("C"), (1, 2, 3)),
    ]:
        with pytest.raises((ValueError, TypeError, IndexError, RuntimeError)):
            value.__setstate__(state)
        str(value)


@given(values)
def test_values_keep_themselves(value):
    """Pickles, copies, text and hash agree; what is printed reads back."""
    assert pickle.loads(pickle.dumps(value)) == value
    assert copy.copy(value) == value and copy.deepcopy(value) == value
    again = eval(repr(value), vars(brindle))
    if isinstance(value, brindle.Chord) and value.bass is not None:
        if value.bass.pitch_class == value.root.pitch_class:
            return  # a bass on the root is not written
    assert again == value and hash(again) == hash(value)
    assert not value < again and value <= again


@given(values, values)
def test_values_are_ordered(a, b):
    if type(a) is not type(b):
        assert a != b
        with pytest.raises(TypeError):
            a < b
    else:
        assert (a < b) + (b < a) + (a == b) == 1
        assert (a > b) == (b < a) and (a >= b) == (not a < b)


@given(chords)
def test_a_chord_and_its_exact_name_sound_the_same(chord):
    again = brindle.Chord(chord.name())
    assert again.intervals == chord.intervals and again.root == chord.root


@settings(max_examples=300)
@given(st.text(max_size=12) | st.from_regex(r"[A-H][#b♯♭]?(m|maj|dim|sus|add|7|9|\(|\)|/|-|\+)*"))
def test_any_text_is_read_or_refused(text):
    for reader in (brindle.Chord, brindle.Key, brindle.Scale, brindle.Note):
        try:
            str(reader(text))
        except brindle.BrindleError as error:
            assert error.text == text
            assert 0 <= error.position <= len(text) + 1
        except UnicodeEncodeError:
            assert any("\ud800" <= sign <= "\udfff" for sign in text)
