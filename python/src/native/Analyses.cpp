// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "SourceSong.h"

#include "brindle/present/AnalysisJson.h"
#include "brindle/present/AnalysisSvg.h"
#include "brindle/present/CPaint.h"
#include "brindle/present/Explain.h"
#include "brindle/present/LeadSheetSvg.h"
#include "brindle/present/ReadingText.h"
#include "brindle/present/ShowSong.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/ReadSongHarmony.h"

#include <nanobind/operators.h>
#include <nanobind/stl/shared_ptr.h>
#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

#include <mutex>
#include <string>
#include <vector>

namespace brindle::python {
namespace {

/// A song with its reading. What only pictures and JSON need is found when it is first asked for.
class CAnalysis {
public:
    CAnalysis(CSourceSongPtr source, const CSignKeyLite& key, bool hasAlternatives, bool hasCopies,
              bool isExplained)
        : mSource(std::move(source)), mKey(key), mIsExplained(isExplained) {
        mOptions.mReadings = hasAlternatives;
        mOptions.mCopies = hasCopies;
        if (!key.IsUndef()) {
            mStated = std::make_unique<CSong>(mSource->mSong);
            StateKey(key, *mStated);
        }
        mReading = ReadSongHarmony(Song(), {.mStatedKey = key});
        if (isExplained) mExplanations = Explain(Song(), mReading);
    }

    [[nodiscard]] const CSong& Song() const { return mStated ? *mStated : mSource->mSong; }

    [[nodiscard]] const CSongAnalysis& Found() const {
        std::call_once(mOnce, [this] { mFound = AnalyseSong(Song(), mOptions); });
        return mFound;
    }

    [[nodiscard]] std::string Json() const {
        return AnalysisJson(Song(), Found(), mReading, mExplanations);
    }

    CSourceSongPtr mSource;
    CSignKeyLite mKey;
    CAnalyseSongOptions mOptions;
    CSongReading mReading;
    std::vector<std::string> mExplanations;
    bool mIsExplained;
    CLazyTuple mChords;

private:
    std::unique_ptr<CSong> mStated;
    mutable std::once_flag mOnce;
    mutable CSongAnalysis mFound;
};

using CAnalysisPtr = std::shared_ptr<CAnalysis>;

CAnalysisPtr Analyse(const CSourceSongPtr& song, const nb::object& key, bool hasAlternatives,
                     bool hasCopies, bool isExplained) {
    CheckUnderstood(*song);
    const CSignKeyLite stated = KeyOf(key);
    const nb::gil_scoped_release released;
    return std::make_shared<CAnalysis>(song, stated, hasAlternatives, hasCopies, isExplained);
}

nb::object IndexOrNone(std::ptrdiff_t index) {
    return index < 0 ? nb::none() : nb::object(nb::int_(index));
}

nb::object ChordAt(const CAnalysis& analysis, std::size_t index, const nb::object& record) {
    const CSong& song = analysis.Song();
    const CChordReading& reading = analysis.mReading.mChords[index];
    const auto& chord = song.mChords[index];
    const auto& sentences = analysis.mExplanations;
    return record(chord.mPosition, LengthOfChord(song, index), SymbolOfChord(song, index),
                  CChordLite(chord), OrNone(reading.mKey), reading.mNumeral,
                  NameOf(reading.mFunction), NameOf(reading.mRelation),
                  IndexOrNone(reading.mResolvesTo), IndexOrNone(reading.mUnder), reading.mDeceptive,
                  index < sentences.size() ? sentences[index] : "");
}

nb::tuple MadeChordsOf(const CAnalysis& analysis) {
    const nb::object record = RecordType("ChordReading");
    nb::list chords;
    for (std::size_t i = 0; i < ChordCount(analysis.Song()); ++i) {
        chords.append(ChordAt(analysis, i, record));
    }
    return nb::tuple(chords);
}

const nb::object& ChordsOf(const CAnalysis& analysis) {
    return analysis.mChords.Get([&] { return MadeChordsOf(analysis); });
}

nb::tuple RegionsOf(const CAnalysis& analysis) {
    const nb::object record = RecordType("Region");
    return TupleOf(analysis.mReading.mRegions, [&](const CKeyRegion& region) {
        return record(region.mKey, region.mPosition, region.mEndPosition, region.mBegin,
                      region.mEnd - region.mBegin);
    });
}

nb::object ConfidenceOf(const CAnalysis& analysis) {
    if (analysis.mReading.mKey.IsUndef()) return nb::none();
    return nb::float_(analysis.mReading.mConfidence);
}

constexpr CWord<TSheetTheme> kThemes[] = {
    {"auto", TSheetTheme_Auto},
    {"light", TSheetTheme_Light},
    {"dark", TSheetTheme_Dark},
};

std::string LeadSheetOf(const CAnalysis& analysis, std::string_view theme, int barsPerLine,
                        double width) {
    CLeadSheetOptions options;
    options.mTheme = ValueOfWord("theme", theme, kThemes);
    options.mBarsPerLine = barsPerLine;
    options.mWidth = width;
    const nb::gil_scoped_release released;
    return LeadSheetSvg(analysis.Song(), analysis.mReading, options);
}

std::string TimeAxisOf(const CAnalysis& analysis) {
    const nb::gil_scoped_release released;
    return AnalysisSvg(ShowSong(analysis.Song(), analysis.Found()));
}

std::string JsonOf(const CAnalysis& analysis) {
    const nb::gil_scoped_release released;
    return analysis.Json();
}

std::string TextOf(const CAnalysis& analysis) {
    return ReadingText(analysis.Song(), analysis.mReading, {}, CPaint(false));
}

nb::tuple PickleOf(const CAnalysis& analysis) {
    return nb::make_tuple(
        nb::module_::import_("brindle._songs").attr("analyse_again"),
        nb::make_tuple(analysis.mSource, OrNone(analysis.mKey), analysis.mOptions.mReadings,
                       analysis.mOptions.mCopies, analysis.mIsExplained));
}

/// Of the same song, asked in the same way.
bool IsSameAnalysis(const CAnalysis& a, const CAnalysis& b) {
    return IsSameSong(*a.mSource, *b.mSource) && a.mKey == b.mKey &&
           a.mOptions.mReadings == b.mOptions.mReadings &&
           a.mOptions.mCopies == b.mOptions.mCopies && a.mIsExplained == b.mIsExplained;
}

constexpr const char* kAnalysis =
    R"(A song as a teacher reads it: its key, the passages in other keys, what each chord does.

It is made by `Song.analyse`, never changes, and runs over its chords. A notebook shows it as a lead
sheet.

>>> import brindle
>>> analysis = brindle.read("Dm7 G7 | Cmaj7 . A7 . | Dm7 G7 | C").analyse()
>>> analysis.key
Key('C Major')
>>> [chord.numeral for chord in analysis]
['ii7', 'V7', 'I^7', 'V7/ii', 'ii7', 'V7', 'I'])";

constexpr const char* kAnalyse = R"(Reads the harmony of the song.

A song that was not understood is a `SongError`, unless it was read leniently. `key` states its key instead of what the song says. `alternatives` and `copies` add other readings and
repeated passages to the JSON and the time axis; both take longer. `explain` gives each chord a sentence.

>>> import brindle
>>> analysis = brindle.read("C E7 Am").analyse(explain=True)
>>> analysis.chords[1].explanation
'E7 is the dominant of A minor, which follows.')";

constexpr const char* kSvg =
    R"(The song as a lead sheet with numerals, keys and arrows, a file in SVG.

`theme` is "auto" (that of the viewer), "light" or "dark".

>>> import brindle
>>> brindle.read("C F G C").analyse().svg(theme="dark", bars_per_line=2).startswith("<svg")
True)";

void BindFindings(nb::class_<CAnalysis>& analysis) {
    analysis.def_prop_ro(
        "key", [](const CAnalysis& self) { return OrNone(self.mReading.mKey); },
        nb::sig("def key(self, /) -> Key | None"),
        R"(The key of the song; None for a song without chords.

>>> import brindle
>>> brindle.read("Am Dm E7 Am").analyse().key
Key('A Minor'))");
    analysis.def_prop_ro("confidence", ConfidenceOf,
                         nb::sig("def confidence(self, /) -> float | None"),
                         R"(The share of the key in the points of all 24, 0 to 1.

>>> import brindle
>>> brindle.read("C F G C").analyse().confidence > 0.5
True)");
    analysis.def_prop_ro("regions", RegionsOf,
                         nb::sig("def regions(self, /) -> tuple[brindle._records.Region, ...]"),
                         R"(Passages in one key, which follow each other without a gap.

>>> import brindle
>>> [str(region.key) for region in brindle.read("C F G7 C").analyse().regions]
['C Major'])");
    analysis.def_prop_ro(
        "chords", ChordsOf,
        nb::sig("def chords(self, /) -> tuple[brindle._records.ChordReading, ...]"),
        R"(What each chord is and does.

>>> import brindle
>>> chord = brindle.read("Dm7 G7 | C").analyse().chords[1]
>>> chord.numeral, chord.function, chord.relation, chord.resolves_to
('V7', 'dominant', 'dominant', 2))");
    analysis.def_prop_ro(
        "song", [](const CAnalysis& self) { return self.mSource; },
        R"(The song that was analysed.

>>> import brindle
>>> brindle.read("C F").analyse().song
<Song of 2 chords>)");
}

}  // namespace

void BindAnalyses(nb::module_& module) {
    nb::class_<CAnalysis> analysis(module, "Analysis", kAnalysis);
    BindFindings(analysis);
    analysis.def("__len__", [](const CAnalysis& self) { return ChordCount(self.Song()); });
    BindSequence(analysis, "ChordReading", ChordsOf);
    analysis.def("to_json", JsonOf, R"(The analysis as strict JSON, the same as the program prints.

>>> import brindle
>>> brindle.read("C F G C").analyse().to_json()[0]
'{')");
    analysis.def(
        "to_dict",
        [](const CAnalysis& self) {
            return nb::module_::import_("json").attr("loads")(JsonOf(self));
        },
        nb::sig("def to_dict(self) -> dict[str, typing.Any]"),
        R"(The JSON as a dictionary.

>>> import brindle
>>> brindle.read("C F G C").analyse().to_dict()["KeyOfSong"]["SignKey"]["Name"]
'C Major')");
    analysis.def("to_text", TextOf, R"(The reading for people, in lines of 80 characters.

>>> import brindle
>>> print(brindle.read("C F G C").analyse().to_text())
Key of the song C major, clear (confidence 0.99)
<BLANKLINE>
1 | C  F   G  C |
  | I  IV  V  I |
<BLANKLINE>)");
    analysis.def("svg", LeadSheetOf, nb::kw_only(), nb::arg("theme") = "auto",
                 nb::arg("bars_per_line") = 4, nb::arg("width") = 800.0, kSvg,
                 nb::sig("def svg(self, *, theme: typing.Literal['auto', 'light', 'dark'] = "
                         "'auto', bars_per_line: int = 4, width: float = 800.0) -> str"));
    analysis.def("time_axis_svg", TimeAxisOf,
                 R"(Chords, centers and keys along a time axis, a file in SVG.

>>> import brindle
>>> "</svg>" in brindle.read("C F G C").analyse().time_axis_svg()
True)");
    analysis.def(
        "_repr_svg_", [](const CAnalysis& self) { return LeadSheetOf(self, "auto", 4, 800.0); },
        "What a notebook shows.");
    analysis.def("__repr__", [](const CAnalysis& self) {
        const CSignKeyLite& key = self.mReading.mKey;
        const std::string name = key.IsUndef() ? "no key" : nb::str(nb::cast(key)).c_str();
        return "<Analysis in " + name + " of " + std::to_string(ChordCount(self.Song())) +
               " chords>";
    });
    analysis.def("__eq__", IsSameAnalysis, nb::is_operator(),
                 nb::sig("def __eq__(self, other: object, /) -> bool"));
    analysis.def("__hash__",
                 [](const CAnalysis& self) { return nb::hash(nb::cast(self.mSource)); });
    analysis.def("__reduce__", PickleOf,
                 nb::sig("def __reduce__(self) -> tuple[typing.Any, tuple[typing.Any, ...]]"));

    nb::class_<CSourceSong> song = nb::borrow<nb::class_<CSourceSong>>(module.attr("Song"));
    song.def("analyse", Analyse, nb::arg("key") = nb::none(), nb::arg("alternatives") = false,
             nb::arg("copies") = false, nb::arg("explain") = false, kAnalyse,
             nb::sig("def analyse(self, key: Key | str | None = None, alternatives: bool = False, "
                     "copies: bool = False, explain: bool = False) -> Analysis"));
}

}  // namespace brindle::python
