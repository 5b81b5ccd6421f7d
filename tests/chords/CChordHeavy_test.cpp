// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <map>
#include <string>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

using TOperation = void (*)(CChordHeavy& chord, const json& in);

/// Operations on a chord, which stands in front of their arguments.
const std::map<std::string, TOperation> kOperations = {
    {"SetBassKeyEnh", [](CChordHeavy& c, const json& in) { c.SetBassKeyEnh(KeyEnhOf(in.at(1))); }},
    {"RemoveBassNote", [](CChordHeavy& c, const json&) { c.RemoveBassNote(); }},
    {"SetBassNoteInOctave",
     [](CChordHeavy& c, const json& in) {
         c.SetBassNoteInOctave(in.at(1), in.at(2), EnhOf(in.at(3)));
     }},
    {"AddBassNoteKeepingFormer",
     [](CChordHeavy& c, const json& in) { c.AddBassNoteKeepingFormer(NoteOf(in.at(1))); }},
    {"SetBassNoteDeletingFormer",
     [](CChordHeavy& c, const json& in) { c.SetBassNoteDeletingFormer(NoteOf(in.at(1))); }},
    {"AddNote", [](CChordHeavy& c, const json& in) { c.AddNote(NoteOf(in.at(1))); }},
    {"DelNote",
     [](CChordHeavy& c, const json& in) {
         if (in.at(1).is_array()) {
             c.DelNote(NoteOf(in.at(1)));
         } else {
             c.DelNote(in.at(1).get<std::size_t>());
         }
     }},
    {"DeleteAllNotesInOctave",
     [](CChordHeavy& c, const json& in) { c.DeleteAllNotesInOctave(in.at(1)); }},
    {"Invert", [](CChordHeavy& c, const json&) { c.Invert(); }},
    {"Transpose", [](CChordHeavy& c, const json& in) { c.Transpose(in.at(1)); }},
    {"ChangeAllNotesWithinIntvlRange",
     [](CChordHeavy& c, const json& in) {
         c.ChangeAllNotesWithinIntvlRange(in.at(1), in.at(2), in.at(3));
     }},
    {"SetRootNote", [](CChordHeavy& c, const json& in) { c.SetRootNote(NoteOf(in.at(1))); }},
    {"SetRootKeyEnh", [](CChordHeavy& c, const json& in) { c.SetRootKeyEnh(KeyEnhOf(in.at(1))); }},
    {"SetRootKeyNr", [](CChordHeavy& c, const json& in) { c.SetRootKeyNr(in.at(1)); }},
    {"SetSemitones", [](CChordHeavy& c, const json& in) { c.SetSemitones(SemitonesOf(in.at(1))); }},
    {"SetBasicChord",
     [](CChordHeavy& c, const json& in) {
         c.SetBasicChord(static_cast<TBasicChord>(in.at(1).get<int>()));
     }},
    {"SetRootKeyNrAndBasicChord",
     [](CChordHeavy& c, const json& in) {
         c.SetRootKeyNrAndBasicChord(in.at(1), static_cast<TBasicChord>(in.at(2).get<int>()));
     }},
    {"AddIntvlInCompingRange",
     [](CChordHeavy& c, const json& in) { c.AddIntvlInCompingRange(in.at(1)); }},
    {"AddIntvlInCompingPlusWrapIntvlRange",
     [](CChordHeavy& c, const json& in) { c.AddIntvlInCompingPlusWrapIntvlRange(in.at(1)); }},
    {"SetFromNoteSet", [](CChordHeavy& c, const json& in) { c.SetFromNoteSet(NotesOf(in.at(1))); }},
    {"SetFromNoteNrSet",
     [](CChordHeavy& c, const json& in) {
         CMySet<unsigned char> noteNrs;
         for (const json& noteNr : in.at(1)) noteNrs.insert(noteNr.get<unsigned char>());
         c.SetFromNoteNrSet(noteNrs);
     }},
    {"SetFromKeyNrSet",
     [](CChordHeavy& c, const json& in) {
         CMySet<int> keyNrs;
         for (const json& keyNr : in.at(1)) keyNrs.insert(keyNr.get<int>());
         c.SetFromKeyNrSet(keyNrs);
     }},
};

using TForm = json (*)(const CChordHeavy& chord);

/// An answer for each operation that gives the chord in `form`.
std::map<std::string, Answer> AnswersByOperation(TForm form) {
    std::map<std::string, Answer> answers;
    for (const auto& [name, operation] : kOperations) {
        answers["CChordHeavy::" + name] = [form, operation = operation](const json& in) {
            CChordHeavy chord = ChordHeavyOf(in.at(0));
            operation(chord, in);
            return form(chord);
        };
    }
    return answers;
}

json InARow(const json& in) {
    CChordHeavy chord = ChordHeavyOf(in.at(0));
    json chords = json::array();
    for (const json& operation : in.at(1)) {
        kOperations.at(operation.at(0).get<std::string>())(chord, operation);
        chords.push_back(FormOf(chord));
    }
    return chords;
}

json Built(const json& in) {
    const CKeyEnh root = KeyEnhOf(in.at(0));
    const CKeyEnh bass = KeyEnhOf(in.at(2));
    if (in.at(1).contains("TBasicChord")) {
        const auto basicChord = static_cast<TBasicChord>(in.at(1).at("TBasicChord").get<int>());
        return NumbersOf(CChordHeavy(root, basicChord, bass));
    }
    const auto intvls = in.at(1).at("IntvlSet").get<std::vector<int>>();
    return NumbersOf(CChordHeavy(root, CIntvlSet(intvls), bass, in.at(3).get<int>()));
}

json Described(const json& in) {
    const CChordHeavy chord = ChordHeavyOf(in.at(0));
    return {{"root", FormOf(chord.RootNote())},
            {"IntvlSet", chord.IntvlSet()},
            {"Semitones", chord.Semitones().Mask()},
            {"BasicChord", static_cast<int>(chord.BasicChord())},
            {"BassKeyEnh", FormOf(chord.BassKeyEnh())},
            {"XGChordIx", chord.XGChordIx()},
            {"IsNarrowChord", chord.IsNarrowChord()},
            {"SetFromChordHeavy", FormOf(LiteOf(chord))}};
}

json Unfolded(const json& in) {
    const CChordLite compact = ChordLiteOf(in.at(0));
    const CChordHeavy chord = compact.ToChordHeavy(24);
    if (chord.RootNote().IsUndef()) {
        json form = NumbersOf(chord);
        form["BasicChord"] = static_cast<int>(chord.BasicChord());
        form["Name"] = chord.Name(CurrentChordNamePrefs);
        return form;
    }
    json form = {
        {"root", FormOf(chord.RootNote())},
        {"lowest", FormOf(chord.LowestNote())},
        {"noteNrs", NoteNrsOf(chord)},
        {"IntvlSet", chord.IntvlSet()},
        {"Semitones", chord.Semitones().Mask()},
        {"BasicChord", static_cast<int>(chord.BasicChord())},
        {"BassKeyEnh", FormOf(chord.BassKeyEnh())},
        {"XGChordIx", chord.XGChordIx()},
        {"IsNarrowChord", chord.IsNarrowChord()},
        {"HasIntvlInAnyOctaveButNotInBassNoteAlone",
         ThoseOf(0, 11, [&](int i) { return chord.HasIntvlInAnyOctaveButNotInBassNoteAlone(i); })},
        {"RootNoteSpecified", chord.RootNoteSpecified()}};
    // The file does not ask it of a bass on the root's own key.
    if (compact.mRootKeyEnh.mKeyNr != compact.mBassKeyEnh.mKeyNr) {
        form["IsSlashChord"] = chord.IsSlashChord();
    }
    return form;
}

}  // namespace

TEST_CASE("A compact chord becomes notes, and the notes the chord again") {
    CheckExpected("chord_lite_to_full",
                  {{"CChordLite::ToChordHeavy", Unfolded},
                   {"CChordLite::SetFromChordHeavy", [](const json& in) {
                        return FormOf(LiteOf(ChordLiteOf(in.at(0)).ToChordHeavy(24)));
                    }}});
}

TEST_CASE("Given notes tell root, bass, intervals and name of their chord") {
    CheckExpected(
        "chord_note_sets",
        {
            {"CChordHeavy", Described},
            {"CChordHeavy::XGChordIx",
             [](const json& in) { return ChordHeavyOf(in.at(0)).XGChordIx(); }},
            {"CChordHeavy::AppendJSONString",
             [](const json& in) { return JSONStringOf(ChordHeavyOf(in.at(0))); }},
            {"CChordHeavy::IsHarmonicallyTheSame",
             [](const json& in) {
                 return ChordHeavyOf(in.at(0)).IsHarmonicallyTheSame(ChordHeavyOf(in.at(1)));
             }},
            {"CChordHeavy::IsExactlyTheSame",
             [](const json& in) {
                 return ChordHeavyOf(in.at(0)).IsExactlyTheSame(ChordHeavyOf(in.at(1)));
             }},
        });
}

TEST_CASE("Bass, notes and octaves of a chord change without its other tones") {
    auto answers = AnswersByOperation([](const CChordHeavy& chord) { return FormOf(chord); });
    answers["CChordHeavy::Transpose"] = AnswersByOperation(NumbersOf).at("CChordHeavy::Transpose");
    answers["operations"] = InARow;
    CheckExpected("chord_operations", answers);
}

TEST_CASE("A chord takes a new root and new contents") {
    auto answers = AnswersByOperation(NumbersOf);
    answers["CChordHeavy"] = Built;
    CheckExpected("chord_setters", answers);
}
