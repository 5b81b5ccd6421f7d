"""Models of songs: learning, asking, writing, files, and what is refused."""

import copy
import json
import pickle
import random
import threading

import brindle
import pytest

SONGS = ["{title: One}\n{key: G}\n[G]la [C]la [D7]la [G]la", "Am Dm | E7 Am"]


def small():
    return brindle.SongModel.learn(SONGS)


def test_a_model_tells_what_it_was_made_of():
    first, second = small().songs
    assert first == brindle.ModelSong("One", "", "", brindle.Key("G"), 4)
    assert (second.title, second.key) == ("", brindle.Key("Am"))
    joplin = [s for s in brindle.SongModel.built_in("ragtime").songs if "Joplin" in s.makers]
    assert joplin and all("(1868-1917)" in song.makers for song in joplin)
    more = brindle.SongModel.learn(SONGS, built_in=True)
    assert [len(more.songs), more.songs[:2]] == [83, small().songs]


def test_models_survive_files_pickles_and_copies(tmp_path):
    model = small()
    model.save(tmp_path / "songs.json")
    again = [
        brindle.SongModel.load(tmp_path / "songs.json"),
        pickle.loads(pickle.dumps(model)),
        copy.deepcopy(model),
    ]
    for other in again:
        assert other == model and hash(other) == hash(model)
        assert other.next_chords(["D7"], key="G") == model.next_chords(["D7"], key="G")
    assert model != brindle.SongModel.learn(SONGS[:1])


@pytest.mark.parametrize("key", ["C", "Eb", "F# minor", "B", "Gm"])
def test_what_comes_next_is_the_same_in_all_keys(key):
    model = brindle.SongModel.built_in()
    mode = "minor" if brindle.Key(key).mode == "minor" else "major"
    home = model.next_chords(key=f"C {mode}", limit=8)
    moved = model.next_chords(key=key, limit=8)
    assert [chord.numeral for chord in moved] == [chord.numeral for chord in home]
    assert {chord.key for chord in moved} == {brindle.Key(key)}
    assert [chord.probability for chord in moved] == pytest.approx([c.probability for c in home])


def test_what_comes_next_depends_on_place_order_and_key():
    model = brindle.SongModel.built_in()
    assert model.next_chords() == ()  # of no key
    assert model.next_chords(["Am", "E7"])[0].key == brindle.Key("Am")
    ways = {
        tuple(model.next_chords(["C", "F"], key="C", **way))
        for way in ({}, {"place": "middle"}, {"order": 1})
    }
    assert len(ways) == 3
    assert model.next_chords([brindle.Chord("G7")], key="C") == model.next_chords(["G7"], key="C")
    for wrong in ({"place": "bar 5"}, {"order": 0}, {"order": 6}, {"limit": -1}):
        with pytest.raises(ValueError):
            model.next_chords(["C"], **wrong)
    with pytest.raises(TypeError):
        model.next_chords("C G")
    with pytest.raises(brindle.ChordError):
        model.next_chords(["what"])


def test_a_song_is_as_it_was_asked_for():
    model = brindle.SongModel.built_in()
    written = model.write_song(
        key="Eb", form="abab", bars=16, beats_per_bar=3, contains=["ii V", "IV"], never=["Bdim"],
        begins="I", seed=2**64 - 1,
    )
    song = written.song
    assert [section.name for section in song.sections] == list("ABAB")
    assert (len(song.bars), song.beats_per_bar, song.stated_key) == (16, 3.0, brindle.Key("Eb"))
    assert song[0].chord.root == brindle.Note("Eb") and song[-1].chord.root == brindle.Note("Eb")
    told = json.loads(written.json)
    assert (told["Seed"], told["Form"], told["Text"]) == (2**64 - 1, "ABAB", written.text)
    assert [(c["Symbol"], c["Position"], c["Length"]) for c in told["Chords"]] == [
        (c.symbol, c.position, c.length) for c in song
    ]
    assert [c["Numeral"] for c in told["Chords"]] == [c.numeral for c in song.analyse()]
    text = brindle.read(written.text, beats_per_bar=3)
    assert [(c.chord, c.position) for c in text] == [(c.chord, c.position) for c in song]


@pytest.mark.parametrize("seed", range(6))
def test_a_seed_writes_the_same_song_again(seed):
    model = brindle.SongModel.built_in()
    written = model.write_song(seed=seed)
    assert written == model.write_song(seed=seed) != model.write_song(seed=seed + 1)
    assert written.quote is None or written.quote.bars <= 4
    again = pickle.loads(pickle.dumps(written))
    assert again == written and again.song.chords == written.song.chords
    assert again.song.analyse().svg() == written.song.analyse().svg()
    # It can be taught, as any other song.
    brindle.MarkovModel.learn([written.song])
    assert brindle.SongModel.learn([written.song.transpose(2)]).chord_count > 4


@pytest.mark.parametrize(
    "wishes, told",
    [
        ({"begins": "X"}, "begins: X is neither a chord nor a numeral"),
        ({"sheet": "C | X"}, "sheet: bar 2: X is no chord; a gap is _"),
        ({"form": "AAA", "bars": 16}, "a form is letters from A to Z that share 16 bars evenly"),
        ({"form": "blues", "bars": 13}, "form: a blues has 12 bars, or 24, 36 and so on"),
        ({"begins": "C", "never": "C", "ends": "F"},
         "these wishes cannot be met together: begins C; never C"),
    ],
)
def test_what_cannot_be_written_is_told(wishes, told):
    with pytest.raises(brindle.ModelError) as raised:
        brindle.SongModel.built_in().write_song(**wishes)
    assert str(raised.value) == told


@pytest.mark.parametrize(
    "wrong",
    [{"bars": 257}, {"bars": -1}, {"beats_per_bar": 0}, {"order": 0}, {"seed": -1}, {"seed": 2**64},
     {"most_quoted_bars": float("nan")}, {"most_quoted_bars": -1.0}, {"key": "H sharp what"}],
)
def test_numbers_out_of_range_are_refused(wrong):
    with pytest.raises(ValueError):
        small().write_song(**wrong)


def test_any_damage_to_a_model_is_refused_or_harmless():
    text = small().dumps()
    chance = random.Random(7)
    refused = 0
    for _ in range(400):
        damaged = list(text)
        for _ in range(chance.randint(1, 3)):
            damaged[chance.randrange(len(damaged))] = chance.choice('09a"[]{},:\\\0é-')
        try:
            assert brindle.SongModel.loads("".join(damaged)) == small()
        except brindle.ModelError:
            refused += 1
    assert refused > 380
    for bad in ("", "[" * 100000, text[:-20], text.replace('l":1', 'l":2'), brindle.MarkovModel().dumps()):
        with pytest.raises(brindle.ModelError):
            brindle.SongModel.loads(bad)


def test_learning_is_refused_or_broken_off_as_a_whole():
    for wrong in (["C what"], ["{title: None}"], [SONGS[0], "C what"]):
        with pytest.raises(brindle.SongError):
            brindle.SongModel.learn(wrong)
    with pytest.raises(TypeError):
        brindle.SongModel.learn("C F G")
    with pytest.raises(ValueError):
        brindle.SongModel.learn([])

    def interrupted():
        yield SONGS[0]
        raise KeyboardInterrupt

    with pytest.raises(KeyboardInterrupt):
        brindle.SongModel.learn(interrupted())


def test_other_threads_run_while_songs_are_written():
    model = brindle.SongModel.built_in()
    expected = model.write_song(bars=64, seed=3)
    results = []
    threads = [
        threading.Thread(target=lambda: results.append(model.write_song(bars=64, seed=3)))
        for _ in range(4)
    ]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()
    assert results == [expected] * 4


def test_songs_and_analyses_are_values():
    song = brindle.read("{title: T}\n[C]la [G7]la", lenient=True)
    same = [copy.copy(song), copy.deepcopy(song), pickle.loads(pickle.dumps(song)),
            brindle.read("{title: T}\n[C]la [G7]la", lenient=True)]
    for other in same:
        assert other == song and hash(other) == hash(song)
        assert other.transpose(2) == song.transpose(2) != song
        assert other.analyse(key="F") == song.analyse(key="F") != song.analyse()
        assert hash(other.analyse()) == hash(song.analyse())
    assert song != brindle.read("{title: T}\n[C]la [G7]la") and song != "C G7"
    assert len({song, *same}) == 1
