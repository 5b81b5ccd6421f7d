// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "SourceSong.h"

#include "brindle/platform/FileNames.h"
#include "brindle/present/ChordProText.h"
#include "brindle/present/PrintableSong.h"
#include "brindle/present/WrittenSongText.h"
#include "brindle/song/SongBeats.h"
#include "brindle/song/TransposeSong.h"

#include <nanobind/operators.h>
#include <nanobind/stl/optional.h>
#include <nanobind/stl/shared_ptr.h>
#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

#include <algorithm>
#include <optional>

namespace brindle::python {
namespace {

constexpr CWord<TSongFormat> kFormats[] = {
    {"auto", TSongFormat_Auto},
    {"chord-text", TSongFormat_ChordText},
    {"even-text", TSongFormat_EvenText},
    {"chords-above-lyrics", TSongFormat_ChordsAboveLyrics},
    {"chord-pro", TSongFormat_ChordPro},
    {"chart", TSongFormat_Chart},
    {"chart-link", TSongFormat_ChartLink},
    {"chart-page", TSongFormat_ChartPage},
    {"chord-strings", TSongFormat_ChordStrings},
    {"musicxml", TSongFormat_MusicXml},
    {"compressed-musicxml", TSongFormat_CompressedMusicXml},
    {"roman-text", TSongFormat_RomanText},
};

std::string_view FormatWord(TSongFormat format) {
    for (const auto& row : kFormats) {
        if (row.mValue == format) return row.mWord;
    }
    return "";
}

CSongOptions OptionsFor(std::string_view format, double beatsPerBar, double beatsPerChord,
                        bool isEven, bool isLenient) {
    if (!AreSongBeats(beatsPerBar) || !AreSongBeats(beatsPerChord)) {
        throw nb::value_error("beats are numbers of 1/1024 to 1024");
    }
    CSongOptions options;
    options.mFormat = ValueOfWord("format", format, kFormats);
    options.mBeatsPerBar = beatsPerBar;
    options.mBeatsPerChord = beatsPerChord;
    options.mEven = isEven;
    options.mLenient = isLenient;
    return options;
}

CSourceSongPtr Read(const nb::bytes& source, std::string_view format, double beatsPerBar,
                    double beatsPerChord, bool isEven, bool isLenient) {
    auto song = std::make_shared<CSourceSong>();
    song->mOptions = OptionsFor(format, beatsPerBar, beatsPerChord, isEven, isLenient);
    song->mSource.assign(source.c_str(), source.size());
    const nb::gil_scoped_release released;
    song->mSong = ReadSong(song->mSource, song->mOptions);
    MakePrintable(song->mSong);
    return song;
}

nb::tuple MadeChordsOf(const CSourceSong& source) {
    const nb::object record = RecordType("SongChord");
    const CSong& song = source.mSong;
    nb::list chords;
    for (std::size_t i = 0; i < ChordCount(song); ++i) {
        const auto& chord = song.mChords[i];
        chords.append(record(chord.mPosition, LengthOfChord(song, i), SymbolOfChord(song, i),
                             CChordLite(chord)));
    }
    return nb::tuple(chords);
}

const nb::object& ChordsOf(const CSourceSong& source) {
    return source.mChords.Get([&] { return MadeChordsOf(source); });
}

nb::tuple FaultsOf(const CSourceSong& source) {
    const nb::object record = RecordType("Fault");
    return TupleOf(source.mSong.mFaults, [&](const CSongFault& fault) {
        return record(fault.mText, fault.mLine, fault.mColumn, fault.mIsNote);
    });
}

nb::tuple BarsOf(const CSourceSong& source) {
    const nb::object record = RecordType("Bar");
    return TupleOf(source.mSong.mBars, [&](const CSongBar& bar) {
        const nb::object time =
            bar.mTime.IsUndef()
                ? nb::none()
                : nb::object(nb::make_tuple(bar.mTime.mNumerator, bar.mTime.mDenominator));
        return record(bar.mNumber, bar.mPosition, bar.mLength, time);
    });
}

nb::tuple SectionsOf(const CSourceSong& source) {
    const nb::object record = RecordType("Section");
    return TupleOf(source.mSong.mSections, [&](const CSongSection& section) {
        return record(section.mName, section.mPosition);
    });
}

CSourceSongPtr Transposed(const CSourceSongPtr& from, int semitones) {
    auto song = std::make_shared<CSourceSong>();
    const nb::gil_scoped_release released;
    song->mSong = TransposeSong(from->mSong, semitones);
    song->mSource = from->mSource;
    song->mOptions = from->mOptions;
    song->mFrom = from->mFrom ? from->mFrom : from;
    song->mSteps = from->mSteps;
    song->mSteps.push_back(semitones);
    return song;
}

nb::bytes MidiOf(const CSourceSong& source, std::optional<double> tempo) {
    const double used = tempo.value_or(source.mSong.mTempo.value_or(kUsualTempo));
    if (!IsPlayableTempo(used)) throw nb::value_error("a tempo is 1 to 1000 beats a minute");
    std::string bytes;
    {
        const nb::gil_scoped_release released;
        bytes = MidiFileBytes(MidiPieceOfSong(source.mSong, used));
    }
    return nb::bytes(bytes.data(), bytes.size());
}

nb::tuple PickleOf(const CSourceSong& song) {
    const nb::module_ module = nb::module_::import_("brindle._songs");
    if (song.mIsWritten) {
        return nb::make_tuple(module.attr("written_again"),
                              nb::make_tuple(nb::bytes(song.mSource.data(), song.mSource.size()),
                                             RepeatsOf(song.mSong)));
    }
    if (song.mFrom) {
        return nb::make_tuple(module.attr("transpose_again"),
                              nb::make_tuple(song.mFrom, TupleOf(song.mSteps, [](int step) {
                                                 return nb::int_(step);
                                             })));
    }
    const CSongOptions& options = song.mOptions;
    return nb::make_tuple(module.attr("read_again"),
                          nb::make_tuple(nb::bytes(song.mSource.data(), song.mSource.size()),
                                         FormatWord(options.mFormat), options.mBeatsPerBar,
                                         options.mBeatsPerChord, options.mEven, options.mLenient));
}

std::string ReprOf(const CSourceSong& song) {
    const std::size_t count = ChordCount(song.mSong);
    const std::string title = song.mSong.mTitle.empty() ? "" : " \"" + song.mSong.mTitle + "\"";
    return "<Song" + title + " of " + std::to_string(count) + (count == 1 ? " chord" : " chords") +
           (song.mSong.HasFault() ? ", with a fault>" : ">");
}

// A line of a source, from 1, as far as there is one.
std::string LineOf(std::string_view source, std::size_t number) {
    for (; number > 1; --number) {
        const std::size_t end = source.find('\n');
        if (end == source.npos) return "";
        source.remove_prefix(end + 1);
    }
    const std::string_view line = source.substr(0, source.find('\n'));
    return std::string(line.ends_with('\r') ? line.substr(0, line.size() - 1) : line);
}

constexpr const char* kSong =
    R"(A song from any source, played through its repeats, endings and jumps.

It is made by `read` and never changes. All positions and lengths are beats from its beginning: quarter
notes in a score, what the song itself counts in a text.

>>> import brindle
>>> song = brindle.read("Dm7 G7 | Cmaj7 . . .")
>>> song
<Song of 3 chords>
>>> [(chord.position, chord.symbol) for chord in song]
[(0.0, 'Dm7'), (1.0, 'G7'), (4.0, 'Cmaj7')])";

void BindLists(nb::class_<CSourceSong>& song) {
    song.def_prop_ro("chords", ChordsOf,
                     nb::sig("def chords(self, /) -> tuple[brindle._records.SongChord, ...]"),
                     R"(Its chords as they are played.

>>> import brindle
>>> brindle.read("C . G7 .").chords[1].length
2.0)");
    song.def_prop_ro("faults", FaultsOf,
                     nb::sig("def faults(self, /) -> tuple[brindle._records.Fault, ...]"),
                     R"(What is wrong with it, or was left out of it; empty if all is understood.

>>> import brindle
>>> fault = brindle.read("C what G").faults[0]
>>> fault.line, fault.column
(1, 3))");
    song.def_prop_ro("bars", BarsOf,
                     nb::sig("def bars(self, /) -> tuple[brindle._records.Bar, ...]"),
                     R"(Its bars as they are played; empty for a text without bar lines.

>>> import brindle
>>> [bar.position for bar in brindle.read("C . . . | F . . . | G . . .").bars]
[0.0, 4.0, 8.0])");
    song.def_prop_ro("sections", SectionsOf,
                     nb::sig("def sections(self, /) -> tuple[brindle._records.Section, ...]"),
                     R"(Verses, choruses, rehearsal marks.

>>> import brindle
>>> brindle.read("{title: T}\n{soc}\n[C]la [G]la\n{eoc}\n").sections
(Section(name='Chorus', position=0.0),))");
}

void BindFacts(nb::class_<CSourceSong>& song) {
    song.def_prop_ro(
        "title", [](const CSourceSong& self) { return self.mSong.mTitle; },
        R"(Its title; "" if it tells none.

>>> import brindle
>>> brindle.read("{title: Greensleeves}\n[Am]Alas my [G]love").title
'Greensleeves')");
    song.def_prop_ro(
        "makers", [](const CSourceSong& self) { return self.mSong.mMakers; },
        R"(Composers, artists and writers of the words.

>>> import brindle
>>> brindle.read("{composer: Foster}\n[C]la").makers
'Foster')");
    song.def_prop_ro(
        "style", [](const CSourceSong& self) { return self.mSong.mStyle; },
        R"(Its style, as a chart tells it.

>>> import brindle
>>> brindle.read("C F G").style
'')");
    song.def_prop_ro(
        "format", [](const CSourceSong& self) { return FormatWord(self.mSong.mFormat); },
        R"(What it was read as.

>>> import brindle
>>> brindle.read("C F G").format
'chord-text')");
    song.def_prop_ro(
        "stated_key", [](const CSourceSong& self) { return self.mSong.mStatedKey; },
        R"(The first key that it states.

>>> import brindle
>>> brindle.read("{key: Em}\n[Em]la [B7]la").stated_key
Key('E Minor'))");
    song.def_prop_ro(
        "tempo", [](const CSourceSong& self) { return self.mSong.mTempo; },
        R"(Quarter notes a minute.

>>> import brindle
>>> brindle.read("{tempo: 96}\n[C]la").tempo
96.0)");
    song.def_prop_ro(
        "beats_per_bar", [](const CSourceSong& self) { return self.mSong.mBeatsPerBar; },
        R"(Length of a bar.

>>> import brindle
>>> brindle.read("C F G", beats_per_bar=3).beats_per_bar
3.0)");
    song.def_prop_ro(
        "has_fault", [](const CSourceSong& self) { return self.mSong.HasFault(); },
        R"(Whether something was not understood; it then has no chords, unless it was read leniently.

>>> import brindle
>>> brindle.read("C what G").has_fault
True)");
}

void BindChanges(nb::class_<CSourceSong>& song) {
    song.def(
        "transpose", Transposed, nb::arg("semitones"),
        R"(The song so many semitones higher, or lower for a negative number, spelled for its new key.

>>> import brindle
>>> [chord.symbol for chord in brindle.read("Dmin7 G7/B | Cmaj7").transpose(3)]
['Fm7', 'Bb7/D', 'Ebmaj7'])");
    song.def(
        "chord_pro", [](const CSourceSong& self) { return ChordProText(self.mSong); },
        R"(The song in ChordPro, its chords as a grid as they are played; words are not kept.

>>> import brindle
>>> print(brindle.read("Dm7 G7 | C . . .").chord_pro(), end="")
{time: 4/4}
{start_of_grid}
| Dm7 G7 . . | C . . . |
{end_of_grid})");
    song.def("midi", MidiOf, nb::arg("tempo") = nb::none(),
             R"(The chords and their bass as a Standard MIDI File.

`tempo` is beats a minute, 1 to 1000; without one that of the song, or 120.

>>> import brindle
>>> brindle.read("Dm7 G7 | C").midi(tempo=96)[:4]
b'MThd')");
}

bool AreSameOptions(const CSongOptions& a, const CSongOptions& b) {
    return a.mFormat == b.mFormat && a.mBeatsPerBar == b.mBeatsPerBar &&
           a.mBeatsPerChord == b.mBeatsPerChord && a.mEven == b.mEven && a.mLenient == b.mLenient;
}

nb::int_ HashOf(const CSourceSong& song) {
    return nb::int_(nb::hash(nb::make_tuple(nb::bytes(song.mSource.data(), song.mSource.size()),
                                            ChordCount(song.mSong))));
}

}  // namespace

bool IsSameSong(const CSourceSong& a, const CSourceSong& b) {
    return a.mSource == b.mSource && AreSameOptions(a.mOptions, b.mOptions) &&
           a.mSteps == b.mSteps && a.mIsWritten == b.mIsWritten &&
           a.mSong.mRepeats == b.mSong.mRepeats;
}

nb::list RepeatsOf(const CSong& song) {
    nb::list repeats;
    for (const CSongRepeat& repeat : song.mRepeats) {
        repeats.append(nb::make_tuple(repeat.mPosition, repeat.mSourcePosition, repeat.mBarCount));
    }
    return repeats;
}

void CheckUnderstood(const CSourceSong& source) {
    if (source.mOptions.mLenient || !source.mSong.HasFault()) return;
    const auto& faults = source.mSong.mFaults;
    const auto fault = std::find_if(faults.begin(), faults.end(),
                                    [](const CSongFault& each) { return !each.mIsNote; });
    if (fault == faults.end() || fault->mLine == 0) {
        throw CFault("SongError", fault == faults.end() ? "the song has a fault" : fault->mText);
    }
    throw CFault("SongError",
                 "line " + std::to_string(fault->mLine) + ", column " +
                     std::to_string(fault->mColumn) + ": " + fault->mText,
                 LineOf(source.mSource, fault->mLine), fault->mColumn);
}

void BindSongs(nb::module_& module) {
    nb::class_<CSourceSong> song(module, "Song", kSong);
    BindFacts(song);
    BindLists(song);
    BindChanges(song);
    song.def("__len__", [](const CSourceSong& self) { return ChordCount(self.mSong); });
    BindSequence(song, "SongChord", ChordsOf);
    song.def("__repr__", ReprOf);
    song.def("__eq__", IsSameSong, nb::is_operator(),
             nb::sig("def __eq__(self, other: object, /) -> bool"));
    song.def("__hash__", HashOf, nb::sig("def __hash__(self, /) -> int"));
    song.def("__reduce__", PickleOf,
             nb::sig("def __reduce__(self) -> tuple[typing.Any, tuple[typing.Any, ...]]"));
    module.def("_looks_like_file_name", LooksLikeFileName, nb::arg("word"),
               "Whether a word is meant as the name of a file.");
    module.def("_read", Read, nb::arg("source"), nb::arg("format"), nb::arg("beats_per_bar"),
               nb::arg("beats_per_chord"), nb::arg("even"), nb::arg("lenient"),
               "Reads the bytes of a song.");
}

}  // namespace brindle::python
