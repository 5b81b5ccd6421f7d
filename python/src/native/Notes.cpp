// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "Values.h"

#include <nanobind/stl/optional.h>
#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

#include <optional>

namespace brindle::python {
namespace {

std::string NameOfNote(const CKeyEnh& note, std::string_view style, bool isUnicode) {
    return WriteNoteName(note, StyleOf(style, isUnicode));
}

nb::tuple StateOf(const CKeyEnh& note) {
    return nb::make_tuple(note.mKeyNr, static_cast<int>(note.mEnh));
}

CKeyEnh NoteOfState(const nb::tuple& state) {
    const CKeyEnh note{nb::cast<int>(state[0]), static_cast<TEnh>(nb::cast<int>(state[1]))};
    const bool isUnspelled = note.mEnh == TEnh_Undef && note.mKeyNr >= 0 && note.mKeyNr < 12;
    if (note == CKeyEnh() || isUnspelled || note.HasSensefulEnh()) return note;
    throw nb::value_error("this is no note");
}

std::optional<int> AccidentalOf(const CKeyEnh& note) {
    if (note.mEnh == TEnh_Undef) return std::nullopt;
    return EnhToSemitone(note.mEnh);
}

constexpr const char* kNote =
    R"(A tone with its spelling and without an octave: F sharp is not G flat.

Notes never change, are ordered by pitch class, and equal only if they are spelled the same.

>>> import brindle
>>> brindle.Note("F#")
Note('F#')
>>> brindle.Note("F#") == brindle.Note("Gb")
False
>>> brindle.Note("F#").pitch_class == brindle.Note("Gb").pitch_class
True)";

constexpr const char* kNoteName = R"(The name, in letters, as Germans or as singers say it.

`style` is "letters", "german" (B is H, B flat is B) or "solfege".

>>> import brindle
>>> brindle.Note("Bb").name()
'Bb'
>>> brindle.Note("Bb").name(style="german")
'B'
>>> brindle.Note("Bb").name(style="solfege", unicode=True)
'Si♭')";

}  // namespace

void BindNotes(nb::module_& module) {
    nb::class_<CKeyEnh> note(module, "Note", kNote);
    note.def(
        "__init__",
        [](CKeyEnh* self, std::string_view text) { new (self) CKeyEnh(NoteOfText(text)); },
        nb::arg("name"));
    note.def_prop_ro(
        "pitch_class", [](const CKeyEnh& self) { return self.mKeyNr; },
        R"(0 for C to 11 for B.

>>> import brindle
>>> brindle.Note("Cb").pitch_class
11)");
    note.def_prop_ro(
        "accidental", AccidentalOf, nb::sig("def accidental(self, /) -> int | None"),
        R"(By how many semitones signs raise the letter: 1 for a sharp, -2 for a double flat.

>>> import brindle
>>> brindle.Note("Bbb").accidental
-2)");
    note.def("name", NameOfNote, nb::arg("style") = "letters", nb::kw_only(),
             nb::arg("unicode") = false, kNoteName,
             nb::sig("def name(self, style: typing.Literal['letters', 'german', 'solfege'] = "
                     "'letters', *, unicode: bool = False) -> str"));
    note.def("__str__", [](const CKeyEnh& self) { return WriteNoteName(self); });
    note.def("__repr__", [](const CKeyEnh& self) { return "Note('" + WriteNoteName(self) + "')"; });
    BindValue(note, StateOf, NoteOfState);
}

}  // namespace brindle::python
