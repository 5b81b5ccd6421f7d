// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"

#include "brindle/chords/NameNotes.h"

#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

#include <vector>

namespace brindle::python {
namespace {

constexpr CWord<TBassUse> kBassUses[] = {
    {"usual", TBassUse::Usual},
    {"only", TBassUse::Only},
    {"none", TBassUse::None},
};

std::vector<CNote> NotesOfNumbers(const nb::iterable& numbers) {
    std::vector<CNote> notes;
    for (const int number : NumbersOf("notes", numbers)) {
        if (number < 0 || number > 127) {
            throw CFault("NoteError", "a note is a number of 0 to 127", std::to_string(number));
        }
        notes.emplace_back(number, TEnh_Undef);
    }
    return notes;
}

/// The root of a neighbour; undefined for None and for no chord.
int RootOf(const nb::object& chordOrSymbol) {
    if (chordOrSymbol.is_none()) return kKeyNrUndef;
    return ChordOf(chordOrSymbol).mRootKeyEnh.mKeyNr;
}

/// What is known of the notes besides themselves.
struct CSurroundings {
    nb::object mKey;
    nb::object mBefore;
    nb::object mAfter;
};

CNamingOptions OptionsFor(const CSurroundings& around, std::string_view bass, std::size_t limit) {
    CNamingOptions options;
    options.mKey = KeyOf(around.mKey);
    options.mPreviousRoot = RootOf(around.mBefore);
    options.mNextRoot = RootOf(around.mAfter);
    options.mBass = ValueOfWord("bass", bass, kBassUses);
    options.mLimit = limit;
    return options;
}

nb::list NamesOf(const nb::iterable& notes, const nb::object& key, std::string_view bass,
                 const nb::object& before, const nb::object& after, std::size_t limit) {
    const nb::object record = RecordType("NamedChord");
    const CNamingOptions options = OptionsFor({key, before, after}, bass, limit);
    nb::list names;
    for (const CNamedChord& name : NameNotes(NotesOfNumbers(notes), options)) {
        names.append(record(name.mSymbol, name.mExactSymbol, name.mChord, name.mCost));
    }
    return names;
}

std::string LikeliestName(const nb::iterable& notes, const nb::object& key, std::string_view bass,
                          const nb::object& before, const nb::object& after) {
    const CNamingOptions options = OptionsFor({key, before, after}, bass, 1);
    const auto names = NameNotes(NotesOfNumbers(notes), options);
    if (names.empty()) throw CFault("NoteError", "no notes have no name");
    return names.front().mSymbol;
}

constexpr const char* kName = R"(The likeliest name of notes, which are MIDI numbers in any order.

`key` is that of the piece; `bass` tells whether the lowest note is the bass as "usual", is "only"
the bass, or says "none", as on a ukulele. `before` and `after` are the chords around the notes.

>>> import brindle
>>> brindle.name([60, 64, 67, 70])
'C7'
>>> brindle.name([64, 67, 72])
'C/E'
>>> brindle.name([64, 67, 69, 72], before="Dm7", after="G7")
'C6/E')";

constexpr const char* kNames =
    R"(All names of notes, the likeliest first, at most one for each root.

>>> import brindle
>>> for name in brindle.names([57, 60, 64, 67], limit=2):
...     print(name.symbol, name.cost)
Am7 10
C6/A 55)";

}  // namespace

void BindNames(nb::module_& module) {
    module.def("name", LikeliestName, nb::arg("notes"), nb::kw_only(), nb::arg("key") = nb::none(),
               nb::arg("bass") = "usual", nb::arg("before") = nb::none(),
               nb::arg("after") = nb::none(), kName,
               nb::sig("def name(notes: collections.abc.Iterable[int], *, key: Key | str | None = "
                       "None, bass: typing.Literal['usual', 'only', 'none'] = 'usual', "
                       "before: Chord | str | None = None, after: Chord | str | None = None) "
                       "-> str"));
    module.def(
        "names", NamesOf, nb::arg("notes"), nb::kw_only(), nb::arg("key") = nb::none(),
        nb::arg("bass") = "usual", nb::arg("before") = nb::none(), nb::arg("after") = nb::none(),
        nb::arg("limit") = 12, kNames,
        nb::sig("def names(notes: collections.abc.Iterable[int], *, key: Key | str | None = None, "
                "bass: typing.Literal['usual', 'only', 'none'] = 'usual', "
                "before: Chord | str | None = None, after: Chord | str | None = None, "
                "limit: int = 12) -> list[brindle._records.NamedChord]"));
}

}  // namespace brindle::python
