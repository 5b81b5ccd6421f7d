// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "Values.h"

#include "brindle/chords/ChordTones.h"

#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

#include <vector>

namespace brindle::python {
namespace {

CChordLite ChordOfIntervals(const nb::object& root, const nb::iterable& intervals,
                            const nb::object& bass) {
    CSemitones semitones;
    for (const int interval : NumbersOf("intervals", intervals)) {
        if (interval < 0 || interval > 11) throw nb::value_error("an interval is 0 to 11");
        semitones.SetSemitone(interval, true);
    }
    return {NoteOf(root), bass.is_none() ? CKeyEnh() : NoteOf(bass), semitones};
}

nb::tuple NotesOf(const CChordLite& chord) {
    return TupleOf(ChordTones(chord), [](const CKeyEnh& note) { return nb::cast(note); });
}

nb::tuple PitchClassesOf(const CChordLite& chord) {
    return TupleOf(ChordTones(chord), [](const CKeyEnh& note) { return nb::int_(note.mKeyNr); });
}

std::string NameOfChord(const CChordLite& chord, std::string_view style, bool isUnicode) {
    return WriteChordSymbol(chord, StyleOf(style, isUnicode));
}

nb::tuple StateOf(const CChordLite& chord) {
    return nb::make_tuple(chord.mRootKeyEnh, chord.mBassKeyEnh, chord.mSemitones.Mask());
}

CChordLite ChordOfState(const nb::tuple& state) {
    return {nb::cast<CKeyEnh>(state[0]), nb::cast<CKeyEnh>(state[1]),
            CSemitones(nb::cast<std::uint64_t>(state[2]) & 0xFFF)};
}

constexpr const char* kChord = R"(A chord: a root, the tones above it, and a bass if it has another.

It is read as people write it, `Co7`, `C-7b5`, `F♯m7♭5`, `Ab:min7/b3`. Chords never change and are
equal if root, bass and tones are, spelling included. "N.C." is a chord without root.

>>> import brindle
>>> brindle.Chord("F#min7/C#")
Chord('F#m7/C#')
>>> brindle.Chord("CΔ") == brindle.Chord("Cmaj7")
True)";

constexpr const char* kChordOf = R"(The chord with these semitones above a root.

>>> import brindle
>>> brindle.Chord.of("E", [0, 3, 7, 10], bass=brindle.Note("G"))
Chord('Em7/G'))";

constexpr const char* kChordName = R"(The symbol as people type it; it reads back as the same chord.

`style` is "letters", "german" (B is H, B flat is B) or "solfege".

>>> import brindle
>>> chord = brindle.Chord("Bbm7b5")
>>> chord.name(unicode=True)
'B♭m7♭5'
>>> chord.name("german")
'Bm7b5')";

constexpr const char* kChordBass = R"(What stands behind the slash; None without one.

>>> import brindle
>>> brindle.Chord("D/F#").bass
Note('F#')
>>> print(brindle.Chord("D").bass)
None)";

constexpr const char* kChordNotes = R"(The tones from the root up, as the chord spells them.

A bass that is none of its tones is not among them.

>>> import brindle
>>> [str(note) for note in brindle.Chord("Co7").notes]
['C', 'Eb', 'Gb', 'Bbb'])";

}  // namespace

void BindChords(nb::module_& module) {
    nb::class_<CChordLite> chord(module, "Chord", kChord);
    chord.def(
        "__init__",
        [](CChordLite* self, std::string_view symbol) {
            new (self) CChordLite(ChordOfSymbol(symbol));
        },
        nb::arg("symbol"));
    chord.def_static("of", ChordOfIntervals, nb::arg("root"), nb::arg("intervals"),
                     nb::arg("bass") = nb::none(), kChordOf,
                     nb::sig("def of(root: Note | str, intervals: collections.abc.Iterable[int], "
                             "bass: Note | str | None = None) -> Chord"));
    chord.def_prop_ro(
        "root", [](const CChordLite& self) { return OrNone(self.mRootKeyEnh); },
        nb::sig("def root(self, /) -> Note | None"),
        R"(The note that the chord is named after; None for no chord.

>>> import brindle
>>> brindle.Chord("Ebm7").root
Note('Eb')
>>> print(brindle.Chord("N.C.").root)
None)");
    chord.def_prop_ro(
        "bass", [](const CChordLite& self) { return OrNone(self.mBassKeyEnh); },
        nb::sig("def bass(self, /) -> Note | None"), kChordBass);
    chord.def_prop_ro(
        "intervals", [](const CChordLite& self) { return IntervalsOf(self.mSemitones); },
        nb::sig("def intervals(self, /) -> tuple[int, ...]"),
        R"(Semitones above the root, from 0 up.

>>> import brindle
>>> brindle.Chord("C9").intervals
(0, 2, 4, 7, 10))");
    chord.def_prop_ro("pitch_classes", PitchClassesOf,
                      nb::sig("def pitch_classes(self, /) -> tuple[int, ...]"),
                      R"(The tones from the root up, 0 for C to 11 for B.

>>> import brindle
>>> brindle.Chord("G7").pitch_classes
(7, 11, 2, 5))");
    chord.def_prop_ro("notes", NotesOf, nb::sig("def notes(self, /) -> tuple[Note, ...]"),
                      kChordNotes);
    chord.def("name", NameOfChord, nb::arg("style") = "letters", nb::kw_only(),
              nb::arg("unicode") = false, kChordName,
              nb::sig("def name(self, style: typing.Literal['letters', 'german', 'solfege'] = "
                      "'letters', *, unicode: bool = False) -> str"));
    chord.def("__str__", [](const CChordLite& self) { return WriteChordSymbol(self); });
    chord.def("__repr__",
              [](const CChordLite& self) { return "Chord('" + WriteChordSymbol(self) + "')"; });
    BindValue(chord, StateOf, ChordOfState);
}

}  // namespace brindle::python
