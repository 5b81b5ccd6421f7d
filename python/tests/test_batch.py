"""Many songs in one call."""

import os
import signal
import threading
import time

import brindle
import pytest

arrow = pytest.importorskip("pyarrow")

SONGS = ["Dm7 G7 | C . . .", "what is this", None, "", "{title: ü}\n[Am]la [E7]la [Am]la", "N.C. C"]


def rows_of_objects(texts, **options):
    """The same table, from songs one by one."""
    for text in texts:
        if text is None:
            yield dict.fromkeys(["title", "key", "confidence", "chords", "faults"])
            continue
        song = brindle.read(text.encode(), **options)
        if song.has_fault and not options["lenient"]:
            analysis = brindle.read("").analyse()
        else:
            analysis = song.analyse()
        yield {
            "title": song.title,
            "key": analysis.key and str(analysis.key),
            "confidence": analysis.confidence,
            "chords": [
                {
                    "position": chord.position,
                    "length": chord.length,
                    "symbol": chord.symbol,
                    "root": chord.chord.root and chord.chord.root.pitch_class,
                    "mask": chord.chord.root and sum(1 << step for step in chord.chord.intervals),
                    "numeral": chord.numeral,
                    "function": chord.function,
                    "relation": chord.relation,
                    "key": chord.key and str(chord.key),
                }
                for chord in analysis
            ],
            "faults": [
                {"line": f.line, "column": f.column, "text": f.text, "is_note": f.is_note}
                for f in song.faults
            ],
        }


@pytest.mark.parametrize("lenient", [False, True])
def test_a_batch_has_what_the_objects_have(lenient):
    batch = brindle.analyse_batch(SONGS, lenient=lenient)
    batch.validate(full=True)
    assert batch.to_pylist() == list(rows_of_objects(SONGS, lenient=lenient))


def test_the_schema_is_as_documented():
    lists = {
        "chords": "list<item: struct<position: double, length: double, symbol: string, root: int8, "
        "mask: int16, numeral: string, function: string, relation: string, key: string>>",
        "faults": "list<item: struct<line: int32, column: int32, text: string, is_note: bool>>",
    }
    shown = {field.name: str(field.type) for field in brindle.batch_schema()}
    assert shown == {"title": "string", "key": "string", "confidence": "double", **lists}


ARRAYS = [
    arrow.array(SONGS),
    arrow.array(SONGS, arrow.large_string()),
    arrow.array([text and text.encode() for text in SONGS], arrow.binary()),
    arrow.array(["x", *SONGS, "y"]).slice(1, len(SONGS)),
    arrow.chunked_array([SONGS[:2], SONGS[2:]]),
    arrow.array(SONGS).dictionary_encode(),
]


@pytest.mark.parametrize("texts", ARRAYS, ids=lambda array: str(array.type))
def test_arrays_are_taken_in_any_form(texts):
    assert brindle.analyse_batch(texts).equals(brindle.analyse_batch(SONGS))


def test_the_order_is_that_of_the_input_whatever_the_threads():
    songs = [f"{{title: {number}}}\n[C]la [G7]la [C]la" for number in range(10000)]
    one = brindle.analyse_batch(songs, threads=1)
    assert one.column("title").to_pylist() == [str(number) for number in range(10000)]
    assert brindle.analyse_batch(songs, threads=4).equals(one)


def test_an_empty_batch_has_the_schema():
    for nothing in ([], arrow.array([], arrow.string())):
        batch = brindle.analyse_batch(nothing)
        assert batch.num_rows == 0 and batch.schema == brindle.batch_schema()


class Column:
    """What a column of another package tells of itself."""

    def __init__(self, *chunks):
        self.table = arrow.chunked_array(chunks)

    def __arrow_c_stream__(self, requested_schema=None):
        return self.table.__arrow_c_stream__(requested_schema)


def test_columns_of_other_packages_are_taken():
    assert brindle.analyse_batch(Column(SONGS[:3], SONGS[3:])).equals(brindle.analyse_batch(SONGS))


#   texts                                    what is said
NO_TEXTS = [
    ("C G Am F",                             "texts are many songs"),
    (b"C G Am F",                            "texts are many songs"),
    (["C", 1],                               r"texts\[1\] is of type int"),
    ([bytearray(b"C")],                      r"texts\[0\] is of type bytearray"),
    (arrow.array([1]),                       "an array of int64"),
    (arrow.table({"text": ["C"]}),           "an array of struct"),
]


@pytest.mark.parametrize("texts, said", NO_TEXTS, ids=lambda value: str(value)[:20])
def test_what_is_no_text_is_told(texts, said):
    with pytest.raises(TypeError, match=said):
        brindle.analyse_batch(texts)


def test_half_a_character_is_a_fault_of_its_song_alone():
    batch = brindle.analyse_batch(["C", "\ud800", "F"])
    assert batch.column("key").to_pylist() == ["C Major", None, "F Major"]
    assert len(batch.column("faults")[1]) == 1


@pytest.fixture
def interruptible():
    """What runs in the background has Ctrl-C ignored."""
    before = signal.signal(signal.SIGINT, signal.default_int_handler)
    yield
    signal.signal(signal.SIGINT, before)


@pytest.mark.usefixtures("interruptible")
def test_a_batch_ends_when_it_is_interrupted():
    songs = ["Dm7 G7 | C A7 | " * 100] * 100
    begin = time.monotonic()
    brindle.analyse_batch(songs, threads=1)
    alone = time.monotonic() - begin
    many = songs * (1 + int(4 / alone))  # of four seconds or more
    threading.Timer(0.2, lambda: os.kill(os.getpid(), signal.SIGINT)).start()
    begin = time.monotonic()
    with pytest.raises(KeyboardInterrupt):
        brindle.analyse_batch(many, threads=1)
    assert time.monotonic() - begin < 2


def test_numbers_of_threads_are_checked():
    with pytest.raises(ValueError):
        brindle.analyse_batch(["C"], threads=0)
    assert brindle.analyse_batch(["C"] * 1000, threads=10**9).num_rows == 1000
