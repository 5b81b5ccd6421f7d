// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "SourceSong.h"

#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/platform/Resources.h"
#include "brindle/present/ChordGrid.h"
#include "brindle/present/GridsJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/SongGrids.h"

#include <nanobind/stl/optional.h>
#include <nanobind/stl/shared_ptr.h>
#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>
#include <nanobind/stl/vector.h>

#include <memory>
#include <mutex>
#include <optional>
#include <utility>

namespace brindle::python {
namespace {

constexpr CWord<TFingeringBass> kBasses[] = {
    {"usual", TFingeringBass::Usual},
    {"required", TFingeringBass::Required},
    {"free", TFingeringBass::Free},
};

constexpr CWord<TGridDots> kDots[] = {
    {"fingers", TGridDots::Fingers},
    {"notes", TGridDots::Notes},
    {"intervals", TGridDots::Intervals},
};

constexpr int kMostCapo = 24;

GChShortTuning TuningOf(const nb::object& tuning, int capo) {
    if (capo < 0 || capo > kMostCapo) throw nb::value_error("a capo is a fret of 0 to 24");
    if (tuning.is_none()) return kGChStandardGuitar;
    const auto text = nb::cast<std::string>(tuning);
    const auto read = ReadTuning(text);
    if (read) return *read;
    throw CFault("FingeringError", "a tuning is a name, DADGAD or E2A2D3G3B3E4", text, 1);
}

CChordLite SoundingChordOf(const nb::object& chord) {
    const CChordLite read = ChordOf(chord);
    if (read.IsUndef()) throw CFault("ChordError", "no chord has no fingering", SymbolOf(chord), 1);
    return read;
}

using CGridPtr = std::shared_ptr<CChordGrid>;

std::vector<CGridPtr> Shared(std::vector<CChordGrid> grids) {
    std::vector<CGridPtr> shared;
    shared.reserve(grids.size());
    for (CChordGrid& grid : grids) shared.push_back(std::make_shared<CChordGrid>(std::move(grid)));
    return shared;
}

CFingeringOptions OptionsOf(int capo, int highestFret, int span, bool mayOmitTones,
                            bool mayOmitRoot, std::string_view bass) {
    CFingeringOptions options;
    options.mCapo = capo;
    options.mHighestFret = highestFret;
    options.mSpan = span;
    options.mSpanUpTheNeck = span + 1;
    options.mMayOmitTones = mayOmitTones;
    options.mMayOmitRoot = mayOmitRoot;
    options.mBass = ValueOfWord("bass", bass, kBasses);
    return options;
}

std::vector<CGridPtr> Find(const nb::object& chord, const nb::object& tuning, int capo,
                           std::size_t limit, int highestFret, int span, bool mayOmitTones,
                           bool mayOmitRoot, std::string_view bass) {
    const GChShortTuning strings = TuningOf(tuning, capo);
    const CChordLite sought = SoundingChordOf(chord);
    const std::string symbol = Printable(SymbolOf(chord));
    CFingeringOptions options = OptionsOf(capo, highestFret, span, mayOmitTones, mayOmitRoot, bass);
    options.mLimit = limit;
    const nb::gil_scoped_release released;
    return Shared(FoundGrids(symbol, sought, strings, options));
}

CShownSongGrids ChosenForSong(const CSourceSongPtr& song, const nb::object& tuning,
                              std::optional<int> capo, int highestCapo, int highestFret, int span,
                              bool mayOmitTones, bool mayOmitRoot, std::string_view bass) {
    constexpr int kMostCapoOfSong = 12;
    CheckUnderstood(*song);
    const GChShortTuning strings = TuningOf(tuning, capo.value_or(0));
    if (highestCapo < 0 || highestCapo > kMostCapoOfSong) {
        throw nb::value_error("the highest capo is a fret of 0 to 12");
    }
    CSongFingeringOptions options;
    options.mFingering =
        OptionsOf(capo.value_or(0), highestFret, span, mayOmitTones, mayOmitRoot, bass);
    options.mHighestCapo = highestCapo;
    const nb::gil_scoped_release released;
    return MakeSongGrids(song->mSong, strings, options,
                         capo ? TSongCapo::Told : TSongCapo::Easiest);
}

CGridPtr OfFrets(const std::string& frets, const nb::object& tuning, int capo) {
    const GChShortTuning strings = TuningOf(tuning, capo);
    const auto read = ReadFrets(frets);
    if (!read) throw CFault("FingeringError", "frets are written as x32010", frets, 1);
    const auto count = static_cast<std::size_t>(GChNumberOfStringsInShortTuning(strings));
    if (read->size() != count) {
        throw CFault(
            "FingeringError",
            std::to_string(read->size()) + " frets for " + std::to_string(count) + " strings",
            frets, 1);
    }
    auto grid = GridOfFrets(frets, *read, strings, capo);
    if (!grid) throw CFault("FingeringError", "at most 15 strings are fretted", frets, 1);
    return std::make_shared<CChordGrid>(std::move(*grid));
}

/// A package of written fingerings; calls of several threads come one after the other.
class CPackage {
public:
    explicit CPackage(const std::string& path) {
        const std::string used =
            path.empty() ? (ResourceFolder() / kGChFactoryPackagePath).string() : path;
        if (GChIsDbPackageAtPath(used) && mDatabase.readFromDbPackageAtPath(used)) return;
        throw CFault("FingeringError", Printable(used) + " is no package of fingerings", used);
    }

    std::vector<CGridPtr> Find(const nb::object& chord, const nb::object& tuning, int capo) {
        const GChShortTuning strings = TuningOf(tuning, capo);
        const CChordLite sought = SoundingChordOf(chord);
        const std::string symbol = Printable(SymbolOf(chord));
        CFingeringOptions options;
        options.mCapo = capo;
        const nb::gil_scoped_release released;
        const std::lock_guard lock(mMutex);
        return Shared(GridsForChord(mDatabase, symbol, sought, strings, options));
    }

private:
    GChDatabase mDatabase;
    std::mutex mMutex;
};

// A list of shared values takes None for a missing one.
std::vector<CChordGrid> Plain(const std::vector<CGridPtr>& grids) {
    std::vector<CChordGrid> plain;
    for (const CGridPtr& grid : grids) {
        if (grid == nullptr) throw nb::type_error("None is no Fingering");
        plain.push_back(*grid);
    }
    return plain;
}

std::string SvgOf(const std::vector<CGridPtr>& grids, const std::string& title,
                  std::string_view dots, bool isLeftHanded) {
    const std::vector<CChordGrid> plain = Plain(grids);
    CGridStyle style;
    style.mDots = ValueOfWord("dots", dots, kDots);
    style.mLeftHanded = isLeftHanded;
    return GridsSvg(plain, Printable(title), style);
}

std::string JsonOf(const std::vector<CGridPtr>& grids) {
    return GridsJson(Plain(grids));
}

nb::tuple NumbersOf(const std::vector<int>& numbers) {
    return TupleOf(
        numbers, [](int number) { return number < 0 ? nb::none() : nb::object(nb::int_(number)); });
}

nb::tuple StateOf(const CChordGrid& grid) {
    return nb::make_tuple(
        grid.mSymbol, grid.mName, grid.mOtherNames,
        nb::bytes(reinterpret_cast<const char*>(grid.mTuning.data()), grid.mTuning.size()),
        grid.mCapo,
        TupleOf(grid.mElems,
                [](const GChChordElem& elem) {
                    return nb::make_tuple(elem.fingerNumber(), elem.absFretIndex(),
                                          elem.coveredMinStr(), elem.coveredMaxStr(),
                                          elem.fingerPointType());
                }),
        grid.mFrets, grid.mPitches, grid.mRoot, grid.mLibrary, grid.mOmitted, grid.mDifficulty);
}

CChordGrid GridOfState(const nb::tuple& state) {
    CChordGrid grid;
    const auto tuning = nb::cast<nb::bytes>(state[3]);
    for (std::size_t i = 0; i < grid.mTuning.size() && i < tuning.size(); ++i) {
        grid.mTuning[i] = static_cast<std::uint8_t>(tuning.c_str()[i]);
    }
    grid.mSymbol = nb::cast<std::string>(state[0]);
    grid.mName = nb::cast<std::string>(state[1]);
    grid.mOtherNames = nb::cast<std::vector<std::string>>(state[2]);
    grid.mCapo = nb::cast<int>(state[4]);
    for (const nb::handle elem : nb::cast<nb::tuple>(state[5])) {
        const auto made = GChChordElem::make(nb::cast<int>(elem[0]), nb::cast<int>(elem[1]),
                                             nb::cast<int>(elem[2]), nb::cast<int>(elem[3]),
                                             nb::cast<std::uint8_t>(elem[4]));
        if (made) grid.mElems.push_back(*made);
    }
    grid.mFrets = nb::cast<std::vector<int>>(state[6]);
    grid.mPitches = nb::cast<std::vector<int>>(state[7]);
    grid.mRoot = nb::cast<int>(state[8]);
    grid.mLibrary = nb::cast<std::string>(state[9]);
    grid.mOmitted = nb::cast<std::vector<std::string>>(state[10]);
    grid.mDifficulty = nb::cast<int>(state[11]);
    return grid;
}

constexpr const char* kFingerings =
    R"(How a chord can be held, the best first: low, whole, its root lowest, easy.

`tuning` is a name ("drop d", "ukulele"), letters from the lowest string ("DADGAD") or pitches
("E2A2D3G3B3E4"); without one it is the guitar's. `bass` is "usual" (what stands behind the slash, or
preferably the root), "required" or "free". Works for 3 to 12 strings.

>>> import brindle
>>> best = brindle.fingerings("Am7")[0]
>>> best.frets
(None, 0, 2, 0, 1, 0)
>>> str(best)
'x02010'
>>> str(brindle.fingerings("G", tuning="ukulele")[0])
'0232')";

constexpr const char* kSongFingerings =
    R"(Easy fingerings of a song that are near each other, each different one once.

Without a `capo` it lies where the song is easiest, up to the `highest_capo`; names are those of the
shapes under it, symbols those of the song.

>>> import brindle
>>> grids = brindle.song_fingerings(brindle.read("Bb F | Gm Eb"))
>>> grids[0].capo, [grid.name for grid in grids]
(3, ['G', 'D', 'Em', 'C'])
>>> [str(grid) for grid in brindle.song_fingerings(brindle.read("C F"), tuning="ukulele", capo=0)]
['0003', '2010'])";

constexpr const char* kSongFingeringsJson =
    R"(The same as strict JSON, with the fingering of each chord and what each capo makes of the song.

>>> import brindle, json
>>> advice = json.loads(brindle.song_fingerings_json(brindle.read("Bb F | Gm Eb")))
>>> advice["Capos"][0]["Capo"], advice["Capos"][0]["Shapes"]
(3, ['G', 'D', 'Em', 'C']))";

constexpr const char* kFretted = R"(The fingering of typed frets, named by what sounds.

>>> import brindle
>>> brindle.fretted("x32010").name
'C'
>>> brindle.fretted("x-10-12-12-11-10").name
'Gm')";

constexpr const char* kGridsSvg = R"(Diagrams side by side, a file in SVG.

`dots` tells what stands on them: "fingers", "notes" or "intervals".

>>> import brindle
>>> brindle.fingerings_svg(brindle.fingerings("E7", limit=3), title="E7").count("<svg")
1)";

void BindGrid(nb::module_& module) {
    nb::class_<CChordGrid> grid(
        module, "Fingering",
        R"(A chord as one hand holds it; strings are counted from the lowest.

A notebook shows it as a diagram.

>>> import brindle
>>> brindle.fingerings("C")[0]
<Fingering x32010 of C>)");
    grid.def_prop_ro(
        "frets", [](const CChordGrid& self) { return NumbersOf(self.mFrets); },
        nb::sig("def frets(self, /) -> tuple[int | None, ...]"),
        R"(Of each string: None muted, 0 open, else the fret, counted from the capo.

>>> import brindle
>>> brindle.fretted("320003").frets
(3, 2, 0, 0, 0, 3))");
    grid.def_prop_ro(
        "pitches", [](const CChordGrid& self) { return NumbersOf(self.mPitches); },
        nb::sig("def pitches(self, /) -> tuple[int | None, ...]"),
        R"(MIDI numbers of what sounds, guitars as written, an octave higher; None for a muted string.

>>> import brindle
>>> brindle.fretted("x02010").pitches
(None, 57, 64, 67, 72, 76))");
    grid.def_prop_ro(
        "symbol", [](const CChordGrid& self) { return self.mSymbol; },
        R"(What was asked for.

>>> import brindle
>>> brindle.fingerings("Amin7")[0].symbol
'Amin7')");
    grid.def_prop_ro(
        "name", [](const CChordGrid& self) { return self.mName; },
        R"(The name of what sounds.

>>> import brindle
>>> brindle.fretted("200232").name
'D/F#')");
    grid.def_prop_ro(
        "capo", [](const CChordGrid& self) { return self.mCapo; },
        R"(The fret of the capo; 0 without one.

>>> import brindle
>>> brindle.fretted("x32010", capo=2).capo
2)");
    grid.def_prop_ro(
        "difficulty", [](const CChordGrid& self) { return self.mDifficulty; },
        R"(0 to 9; -1 if one hand cannot hold it.

>>> import brindle
>>> brindle.fretted("133211").difficulty > brindle.fretted("022000").difficulty
True)");
    grid.def_prop_ro(
        "omitted",
        [](const CChordGrid& self) {
            return TupleOf(self.mOmitted,
                           [](const std::string& degree) { return nb::cast(degree); });
        },
        nb::sig("def omitted(self, /) -> tuple[str, ...]"),
        R"(Degrees of the chord that do not sound.

>>> import brindle
>>> brindle.fingerings("Am7")[0].omitted
())");
    grid.def_prop_ro(
        "library", [](const CChordGrid& self) { return self.mLibrary; },
        R"(Where it comes from; "" for what was searched or typed.

>>> import brindle
>>> brindle.fingerings("C")[0].library
'')");
    grid.def("__str__", [](const CChordGrid& self) { return FretsText(self); });
    grid.def("__repr__", [](const CChordGrid& self) {
        const std::string name = self.mName.empty() ? "no chord" : self.mName;
        return "<Fingering " + FretsText(self) + " of " + name + ">";
    });
    grid.def(
        "svg",
        [](const CGridPtr& self, std::string_view dots, bool isLeftHanded) {
            return SvgOf({self}, "", dots, isLeftHanded);
        },
        nb::kw_only(), nb::arg("dots") = "fingers", nb::arg("left_handed") = false,
        nb::sig("def svg(self, *, dots: typing.Literal['fingers', 'notes', 'intervals'] = "
                "'fingers', left_handed: bool = False) -> str"),
        R"(The diagram, a file in SVG.

>>> import brindle
>>> "</svg>" in brindle.fretted("x32010").svg(dots="notes")
True)");
    grid.def(
        "_repr_svg_", [](const CGridPtr& self) { return SvgOf({self}, "", "fingers", false); },
        "What a notebook shows.");
    grid.def(
        "__eq__",
        [](const CChordGrid& self, const CChordGrid& other) {
            return StateOf(self).equal(StateOf(other));
        },
        nb::is_operator(), nb::sig("def __eq__(self, other: object, /) -> bool"));
    grid.def("__hash__",
             [](const CChordGrid& self) { return nb::hash(nb::cast(FretsText(self))); });
    grid.def("__getstate__", StateOf);
    grid.def("__setstate__", [](CChordGrid& self, const nb::tuple& state) {
        new (&self) CChordGrid(GridOfState(state));
    });
}

/// A function of a song that gives what `resultOf` makes of its grids.
template <class TResultOf>
void BindForSong(nb::module_& module, const char* name, const char* doc, TResultOf resultOf,
                 const std::string& type) {
    const std::string signature =
        "def " + std::string(name) +
        "(song: Song, *, tuning: str | None = None, capo: int | None = None, highest_capo: int = "
        "7, "
        "highest_fret: int = 15, span: int = 4, omit_tones: bool = True, omit_root: bool = False, "
        "bass: typing.Literal['usual', 'required', 'free'] = 'usual') -> " +
        type;
    module.def(
        name,
        [resultOf](const CSourceSongPtr& song, const nb::object& tuning, std::optional<int> capo,
                   int highestCapo, int highestFret, int span, bool mayOmitTones, bool mayOmitRoot,
                   std::string_view bass) {
            return resultOf(ChosenForSong(song, tuning, capo, highestCapo, highestFret, span,
                                          mayOmitTones, mayOmitRoot, bass));
        },
        nb::arg("song"), nb::kw_only(), nb::arg("tuning") = nb::none(),
        nb::arg("capo") = nb::none(), nb::arg("highest_capo") = 7, nb::arg("highest_fret") = 15,
        nb::arg("span") = 4, nb::arg("omit_tones") = true, nb::arg("omit_root") = false,
        nb::arg("bass") = "usual", doc, nb::sig(signature.c_str()));
}

}  // namespace

void BindFingerings(nb::module_& module) {
    BindGrid(module);
    nb::class_<CPackage>(module, "_GridPackage", "The fingerings behind GridPackage.")
        .def(nb::init<const std::string&>(), nb::arg("path"))
        .def("find", &CPackage::Find, nb::arg("chord"), nb::arg("tuning").none(), nb::arg("capo"),
             nb::sig("def find(self, chord: Chord | str, tuning: str | None, capo: int) -> "
                     "list[Fingering]"));
    module.def("fingerings", Find, nb::arg("chord"), nb::kw_only(), nb::arg("tuning") = nb::none(),
               nb::arg("capo") = 0, nb::arg("limit") = 10, nb::arg("highest_fret") = 15,
               nb::arg("span") = 4, nb::arg("omit_tones") = true, nb::arg("omit_root") = false,
               nb::arg("bass") = "usual", kFingerings,
               nb::sig("def fingerings(chord: Chord | str, *, tuning: str | None = None, capo: int "
                       "= 0, limit: int = 10, highest_fret: int = 15, span: int = 4, omit_tones: "
                       "bool = True, omit_root: bool = False, bass: typing.Literal['usual', "
                       "'required', 'free'] = 'usual') -> list[Fingering]"));
    BindForSong(
        module, "song_fingerings", kSongFingerings,
        [](CShownSongGrids chosen) { return Shared(std::move(chosen.mGrids)); }, "list[Fingering]");
    BindForSong(
        module, "song_fingerings_json", kSongFingeringsJson,
        [](const CShownSongGrids& chosen) { return SongGridsJson(chosen); }, "str");
    module.def("fretted", OfFrets, nb::arg("frets"), nb::kw_only(), nb::arg("tuning") = nb::none(),
               nb::arg("capo") = 0, kFretted,
               nb::sig("def fretted(frets: str, *, tuning: str | None = None, capo: int = 0) -> "
                       "Fingering"));
    module.def("fingerings_svg", SvgOf, nb::arg("fingerings"), nb::kw_only(), nb::arg("title") = "",
               nb::arg("dots") = "fingers", nb::arg("left_handed") = false, kGridsSvg,
               nb::sig("def fingerings_svg(fingerings: collections.abc.Sequence[Fingering], *, "
                       "title: str = '', dots: typing.Literal['fingers', 'notes', 'intervals'] = "
                       "'fingers', left_handed: bool = False) -> str"));
    module.def("fingerings_json", JsonOf, nb::arg("fingerings"),
               R"(Fingerings as strict JSON, as the program prints them.

>>> import brindle, json
>>> grids = json.loads(brindle.fingerings_json(brindle.fingerings("C", limit=2)))
>>> grids["Grids"][0]["Frets"]
[None, 3, 2, 0, 1, 0])");
}

}  // namespace brindle::python
