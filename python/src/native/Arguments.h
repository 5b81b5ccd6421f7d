// SPDX-License-Identifier: MIT
#pragma once

#include "Errors.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/CSignKeyLite.h"

#include <nanobind/nanobind.h>

#include <string>
#include <string_view>
#include <vector>

namespace brindle::python {

/// An element of a table of words that an argument may be.
template <class TValue>
struct CWord {
    std::string_view mWord;
    TValue mValue;
};

/// The value of a word; ValueError with all words for another one.
template <class TValue, std::size_t kCount>
TValue ValueOfWord(std::string_view name, std::string_view word,
                   const CWord<TValue> (&words)[kCount]) {
    std::string known;
    for (const auto& row : words) {
        if (row.mWord == word) return row.mValue;
        known += (known.empty() ? "" : ", ") + std::string(row.mWord);
    }
    throw nb::value_error((std::string(name) + " is one of " + known).c_str());
}

/// The style of "letters", "german" or "solfege".
[[nodiscard]] CChordSymbolStyle StyleOf(std::string_view naming, bool hasUnicodeSigns);

/// A chord, or what a symbol says; ChordError if that is none.
[[nodiscard]] CChordLite ChordOfSymbol(std::string_view symbol);
[[nodiscard]] CChordLite ChordOf(const nb::object& chordOrSymbol);
/// The symbol as it was typed, or that of the chord.
[[nodiscard]] std::string SymbolOf(const nb::object& chordOrSymbol);
/// A key, or what a text says; undefined for None.
[[nodiscard]] CSignKeyLite KeyOf(const nb::object& keyOrText);
[[nodiscard]] CSignKeyLite KeyOfText(std::string_view text);

/// Numbers of a list, a set, an array; TypeError, which names the argument, if one is none.
[[nodiscard]] std::vector<int> NumbersOf(const char* name, const nb::iterable& numbers);

/// A note, or the one that a text names; NoteError if it names none.
[[nodiscard]] CKeyEnh NoteOf(const nb::object& noteOrText);
[[nodiscard]] CKeyEnh NoteOfText(std::string_view text);

/// A tuple of what `make` gives for each element.
template <class TList, class TMake>
nb::tuple TupleOf(const TList& list, const TMake& make) {
    nb::list result;
    for (const auto& element : list) result.append(make(element));
    return nb::tuple(result);
}

/// Semitones above a root, from 0 up.
[[nodiscard]] nb::tuple IntervalsOf(CSemitones semitones);

/// None for what is undefined.
template <class T>
nb::object OrNone(const T& value) {
    return value.IsUndef() ? nb::none() : nb::cast(value);
}

/// The constructor of a record of `brindle._records`.
[[nodiscard]] nb::object RecordType(const char* name);

}  // namespace brindle::python
