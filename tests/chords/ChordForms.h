// SPDX-License-Identifier: MIT
#pragma once

#include "tests/support/Forms.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CSignKeyHeavy.h"

/// The forms in which the files of expected chords write notes and full chords.
namespace brindle::test {

inline CMySet<CNote> NotesOf(const nlohmann::json& list) {
    CMySet<CNote> notes;
    for (const auto& pair : list) notes.insert(NoteOf(pair));
    return notes;
}

inline nlohmann::json NotesFormOf(const CChordHeavy& chord) {
    nlohmann::json notes = nlohmann::json::array();
    for (const CNote& note : chord.Notes()) notes.push_back(FormOf(note));
    return notes;
}

inline nlohmann::json NoteNrsOf(const CChordHeavy& chord) {
    nlohmann::json noteNrs = nlohmann::json::array();
    for (const CNote& note : chord.Notes()) noteNrs.push_back(note.mNoteNr);
    return noteNrs;
}

/// {"root": [noteNr, enh], "notes": [...]}, or without a root: the lowest note is the root then
inline CChordHeavy ChordHeavyOf(const nlohmann::json& form) {
    if (form.contains("root")) return {NoteOf(form.at("root")), NotesOf(form.at("notes"))};
    CChordHeavy chord;
    chord.SetFromNoteSet(NotesOf(form.at("notes")));
    return chord;
}

/// The same, or a compact chord in full
inline CChordHeavy AnyChordOf(const nlohmann::json& form) {
    return form.contains("semitones") ? ChordLiteOf(form).ToChordHeavy(24) : ChordHeavyOf(form);
}

inline nlohmann::json FormOf(const CChordHeavy& chord) {
    return {{"root", FormOf(chord.RootNote())}, {"notes", NotesFormOf(chord)}};
}

inline nlohmann::json NumbersOf(const CChordHeavy& chord) {
    return {{"rootNr", chord.RootNote().mNoteNr}, {"noteNrs", NoteNrsOf(chord)}};
}

inline CChordLite LiteOf(const CChordHeavy& heavy) {
    CChordLite chord;
    chord.SetFromChordHeavy(heavy);
    return chord;
}

/// The members of `first` to `last` for which `has` is true.
template <class Predicate>
nlohmann::json ThoseOf(int first, int last, Predicate has) {
    nlohmann::json list = nlohmann::json::array();
    for (int i = first; i <= last; ++i) {
        if (has(i)) list.push_back(i);
    }
    return list;
}

/// What `answer` gives for the keys 0 to 11.
template <class Answer>
nlohmann::json ForEachKeyNr(Answer answer) {
    nlohmann::json list = nlohmann::json::array();
    for (int keyNr = 0; keyNr < 12; ++keyNr) list.push_back(answer(keyNr));
    return list;
}

}  // namespace brindle::test
