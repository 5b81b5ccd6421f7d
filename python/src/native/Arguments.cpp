// SPDX-License-Identifier: MIT
#include "Arguments.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/ReadKeyText.h"

#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

namespace brindle::python {
namespace {

constexpr CWord<TNoteNaming> kNamings[] = {
    {"letters", TNoteNaming_Letters},
    {"german", TNoteNaming_German},
    {"solfege", TNoteNaming_Solfege},
};

}  // namespace

CChordSymbolStyle StyleOf(std::string_view naming, bool hasUnicodeSigns) {
    CChordSymbolStyle style;
    style.mNotes = ValueOfWord("style", naming, kNamings);
    style.mUnicodeSigns = hasUnicodeSigns;
    return style;
}

CChordLite ChordOfSymbol(std::string_view symbol) {
    const CChordTextReading reading = ReadChordText(symbol);
    if (reading.mKind == TChordText_Chord) return reading.mChord;
    if (reading.mKind == TChordText_NoChord) return {};
    const std::string text(symbol);
    if (reading.mKind == TChordText_Repeat) {
        throw CFault("ChordError", "\"" + text + "\" repeats the chord before it", text, 1);
    }
    throw CFault("ChordError", reading.mFault, text, static_cast<std::size_t>(reading.mFaultPos));
}

CChordLite ChordOf(const nb::object& chordOrSymbol) {
    if (nb::isinstance<nb::str>(chordOrSymbol)) {
        return ChordOfSymbol(nb::cast<std::string_view>(chordOrSymbol));
    }
    return nb::cast<CChordLite>(chordOrSymbol);
}

std::string SymbolOf(const nb::object& chordOrSymbol) {
    if (nb::isinstance<nb::str>(chordOrSymbol)) return nb::cast<std::string>(chordOrSymbol);
    return WriteChordSymbol(nb::cast<CChordLite>(chordOrSymbol));
}

CSignKeyLite KeyOfText(std::string_view text) {
    std::string typed(text);
    ConvertUtf8SharpAndFlatToAscii(typed);
    const CKeyText read = ReadKeyText(typed);
    // The reader counts bytes of a text in ASCII, which are its characters up to a fault.
    if (!read.mError.empty()) {
        throw CFault("KeyNameError", read.mError, std::string(text), read.mColumn + 1);
    }
    return read.mSignKey;
}

CSignKeyLite KeyOf(const nb::object& keyOrText) {
    if (keyOrText.is_none()) return {};
    if (nb::isinstance<nb::str>(keyOrText)) {
        return KeyOfText(nb::cast<std::string_view>(keyOrText));
    }
    return nb::cast<CSignKeyLite>(keyOrText);
}

std::vector<int> NumbersOf(const char* name, const nb::iterable& numbers) {
    std::vector<int> result;
    for (const nb::handle number : numbers) {
        int value = 0;
        if (!nb::try_cast(number, value)) {
            throw nb::type_error((std::string(name) + " are whole numbers").c_str());
        }
        result.push_back(value);
    }
    return result;
}

CKeyEnh NoteOfText(std::string_view text) {
    std::string typed(text);
    ConvertUtf8SharpAndFlatToAscii(typed);
    CKeyEnh note;
    int consumed = 0;
    note.SetFromString(typed, &consumed, NamePrefs());
    if (note.IsUndef() || static_cast<std::size_t>(consumed) != typed.size()) {
        throw CFault("NoteError", "a note is a letter of A to H with # or b behind it",
                     std::string(text), static_cast<std::size_t>(consumed) + 1);
    }
    return note;
}

CKeyEnh NoteOf(const nb::object& noteOrText) {
    if (nb::isinstance<nb::str>(noteOrText)) {
        return NoteOfText(nb::cast<std::string_view>(noteOrText));
    }
    return nb::cast<CKeyEnh>(noteOrText);
}

nb::tuple IntervalsOf(CSemitones semitones) {
    nb::list intervals;
    for (int interval = 0; interval < 12; ++interval) {
        if (semitones.HasIntvl(interval)) intervals.append(interval);
    }
    return nb::tuple(intervals);
}

nb::object RecordType(const char* name) {
    return nb::module_::import_("brindle._records").attr(name);
}

}  // namespace brindle::python
