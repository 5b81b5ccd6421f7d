// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "Values.h"

#include "brindle/present/ShownNames.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/ReadKeyText.h"

#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

namespace brindle::python {
namespace {

std::string NameOfKey(const CSignKeyLite& key) {
    return key.NameLong(NamePrefs());
}

const char* ModeOf(const CSignKeyLite& key) {
    return key.mSignKeyType == TSignKeyType_Minor ? "minor" : "major";
}

CScaleLite ScaleOfText(std::string_view text) {
    std::string typed(text);
    ConvertUtf8SharpAndFlatToAscii(typed);
    const CScaleText read = ReadScaleText(typed);
    if (!read.mError.empty()) {
        throw CFault("ScaleError", read.mError, std::string(text), read.mColumn + 1);
    }
    return CScaleLite(read.mScale);
}

CScaleHeavy HeavyOf(const CScaleLite& scale) {
    return {scale.mRootKeyEnh, scale.mSemitones};
}

std::string NameOfScale(const CScaleLite& scale) {
    const CScaleHeavy heavy = HeavyOf(scale);
    const std::string_view kind =
        heavy.ScaleType() == st_custom ? std::string_view("Custom") : heavy.ScaleRow().mName;
    return KeyName(scale.mRootKeyEnh) + " " + std::string(kind);
}

nb::tuple NotesOf(const CScaleLite& scale) {
    return TupleOf(KeysOf(HeavyOf(scale)), [](const CKeyEnh& note) { return nb::cast(note); });
}

nb::tuple StateOfKey(const CSignKeyLite& key) {
    return nb::make_tuple(key.mRootKeyEnh, static_cast<int>(key.mSignKeyType));
}

CSignKeyLite KeyOfState(const nb::tuple& state) {
    const int type = nb::cast<int>(state[1]);
    if (type != TSignKeyType_Major && type != TSignKeyType_Minor) {
        throw nb::value_error("this is no key");
    }
    return {nb::cast<CKeyEnh>(state[0]), static_cast<TSignKeyType>(type)};
}

nb::tuple StateOfScale(const CScaleLite& scale) {
    return nb::make_tuple(scale.mRootKeyEnh, scale.mSemitones.Mask());
}

CScaleLite ScaleOfState(const nb::tuple& state) {
    return {nb::cast<CKeyEnh>(state[0]), CSemitones(nb::cast<std::uint64_t>(state[1]) & 0xFFF)};
}

void BindKey(nb::module_& module) {
    nb::class_<CSignKeyLite> key(module, "Key", R"(A major or minor key.

It is read as people type it, in German, too.

>>> import brindle
>>> brindle.Key("F# minor")
Key('F# Minor')
>>> brindle.Key("Bb") == brindle.Key("B-Dur")
True)");
    key.def(
        "__init__",
        [](CSignKeyLite* self, std::string_view text) { new (self) CSignKeyLite(KeyOfText(text)); },
        nb::arg("name"));
    key.def_prop_ro(
        "tonic", [](const CSignKeyLite& self) { return self.mRootKeyEnh; },
        R"(The note that the key is named after.

>>> import brindle
>>> brindle.Key("Ebm").tonic
Note('Eb'))");
    key.def_prop_ro("mode", ModeOf,
                    nb::sig("def mode(self, /) -> typing.Literal['major', 'minor']"),
                    R"("major" or "minor".

>>> import brindle
>>> brindle.Key("am").mode
'minor')");
    key.def_prop_ro(
        "signature", [](const CSignKeyLite& self) { return self.SignsCount(); },
        R"(The sharps of its signature, flats as a negative number.

>>> import brindle
>>> brindle.Key("F minor").signature
-4)");
    key.def_prop_ro(
        "relative", [](const CSignKeyLite& self) { return self.ParallelSignKey(); },
        R"(The key of the other mode with the same signature.

>>> import brindle
>>> brindle.Key("C").relative
Key('A Minor'))");
    key.def_prop_ro(
        "scale", [](const CSignKeyLite& self) { return self.Scale(); },
        R"(Its major or natural minor scale.

>>> import brindle
>>> [str(note) for note in brindle.Key("D").scale.notes]
['D', 'E', 'F#', 'G', 'A', 'B', 'C#'])");
    key.def_prop_ro("name", NameOfKey, R"(The name in words.

>>> import brindle
>>> brindle.Key("am").name
'A Minor')");
    key.def("__str__", NameOfKey);
    key.def("__repr__", [](const CSignKeyLite& self) { return "Key('" + NameOfKey(self) + "')"; });
    BindValue(key, StateOfKey, KeyOfState);
}

void BindScale(nb::module_& module) {
    nb::class_<CScaleLite> scale(module, "Scale", R"(A scale: a root and the tones above it.

>>> import brindle
>>> brindle.Scale("D dorian")
Scale('D Dorian')
>>> brindle.Scale("D dorian").intervals
(0, 2, 3, 5, 7, 9, 10))");
    scale.def(
        "__init__",
        [](CScaleLite* self, std::string_view text) { new (self) CScaleLite(ScaleOfText(text)); },
        nb::arg("name"));
    scale.def_prop_ro(
        "root", [](const CScaleLite& self) { return self.mRootKeyEnh; },
        R"(The note that the scale begins with.

>>> import brindle
>>> brindle.Scale("Bb blues minor").root
Note('Bb'))");
    scale.def_prop_ro(
        "intervals", [](const CScaleLite& self) { return IntervalsOf(self.mSemitones); },
        nb::sig("def intervals(self, /) -> tuple[int, ...]"),
        R"(Semitones above the root, from 0 up.

>>> import brindle
>>> brindle.Scale("C major").intervals
(0, 2, 4, 5, 7, 9, 11))");
    scale.def_prop_ro("notes", NotesOf, nb::sig("def notes(self, /) -> tuple[Note, ...]"),
                      R"(The tones from the root up, as the scale spells them.

>>> import brindle
>>> " ".join(str(note) for note in brindle.Scale("F lydian").notes)
'F G A B C D E')");
    scale.def_prop_ro("name", NameOfScale, R"(Root and kind.

>>> import brindle
>>> brindle.Scale("Am").name
'A Natural Minor')");
    scale.def("__str__", NameOfScale);
    scale.def("__repr__",
              [](const CScaleLite& self) { return "Scale('" + NameOfScale(self) + "')"; });
    BindValue(scale, StateOfScale, ScaleOfState);
}

}  // namespace

void BindKeysAndScales(nb::module_& module) {
    BindScale(module);
    BindKey(module);
}

}  // namespace brindle::python
