// SPDX-License-Identifier: MIT
#include "brindle/theory/CNote.h"

#include "brindle/theory/NoteIntervals.h"
#include "brindle/theory/Trace.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

#include <limits>
#include <sstream>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr std::int64_t kFarBelow = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kFarAbove = std::numeric_limits<std::int64_t>::max();

/// in: the note first, answered as the note after the change
Answer After(void (*change)(CNote&, const json& in)) {
    return [change](const json& in) {
        CNote note = NoteOf(in.at(0));
        change(note, in);
        return test::FormOf(note);
    };
}

/// in: note number and spelling, or {"CKeyEnh", "oct"}
json Construct(const json& in) {
    if (in.size() == 2) return FormOf(CNote(in.at(0).get<std::int64_t>(), EnhOf(in.at(1))));
    const CKeyEnh keyEnh = KeyEnhOf(in.at(0).at("CKeyEnh"));
    const int oct = in.at(0).at("oct").get<int>();
    const CNote note(keyEnh, oct);
    if (note != CNote(std::pair(keyEnh.mKeyNr, keyEnh.mEnh), oct)) return "the forms differ";
    return FormOf(note);
}

json ReadFromString(const json& in) {
    CNote note(100, TEnh_n);  // what was there must not show in the result
    const bool isRead = note.SetFromString(in.at(0).get<std::string>(), NamePrefsOf(in.at(1)));
    return {{"return", isRead}, {"CNote", FormOf(note)}};
}

Answer IntvlBy(int (*intvl)(std::int64_t, std::int64_t)) {
    return [intvl](const json& in) {
        return intvl(in.at(0).get<std::int64_t>(), in.at(1).get<std::int64_t>());
    };
}

}  // namespace

TEST_CASE("A note keeps its number and spelling through change, name and reading") {
    test::CheckExpected(
        "theory-notes",
        {
            {"CNote", Construct},
            {"CNote::SetNoteNr",
             After([](CNote& note, const json& in) { note.SetNoteNr(in.at(1)); })},
            {"CNote::SetNoteNrAndMakeSensefulEnhAssumingCMajor",
             After([](CNote& note, const json& in) {
                 note.SetNoteNrAndMakeSensefulEnhAssumingCMajor(in.at(1));
             })},
            {"CNote::SetEnh",
             After([](CNote& note, const json& in) { note.SetEnh(EnhOf(in.at(1))); })},
            {"CNote::SetEnhAndDontMakeSenseful", After([](CNote& note, const json& in) {
                 note.SetEnhAndDontMakeSenseful(EnhOf(in.at(1)));
             })},
            {"CNote::SetKeyNr",
             After([](CNote& note, const json& in) { note.SetKeyNr(in.at(1)); })},
            {"CNote::SetKeyNrAndEnhAssumingCMajor", After([](CNote& note, const json& in) {
                 note.SetKeyNrAndEnhAssumingCMajor(in.at(1));
             })},
            {"CNote::SetOct", After([](CNote& note, const json& in) { note.SetOct(in.at(1)); })},
            {"CNote::Clear", After([](CNote& note, const json&) { note.Clear(); })},
            {"CNote::EnhShiftToFlats",
             After([](CNote& note, const json&) { note.EnhShiftToFlats(); })},
            {"CNote::EnhShiftToSharps",
             After([](CNote& note, const json&) { note.EnhShiftToSharps(); })},
            {"CNote::EnhShift", After([](CNote& note, const json&) { note.EnhShift(); })},
            {"CNote::AddIntvlAndClampToKey",
             After([](CNote& note, const json& in) { note.AddIntvlAndClampToKey(in.at(1)); })},
            {"CNote::KeyEnh",
             [](const json& in) { return test::FormOf(NoteOf(in.at(0)).KeyEnh()); }},
            {"CNote::IsUndef", [](const json& in) { return NoteOf(in.at(0)).IsUndef(); }},
            {"CNote::HasSensefulEnh",
             [](const json& in) { return NoteOf(in.at(0)).HasSensefulEnh(); }},
            {"CNote::KeyName",
             [](const json& in) { return NoteOf(in.at(0)).KeyName(NamePrefsOf(in.at(1))); }},
            {"CNote::KeyNameWithoutEnh",
             [](const json& in) {
                 return NoteOf(in.at(0)).KeyNameWithoutEnh(NamePrefsOf(in.at(1)));
             }},
            {"CNote::OctName",
             [](const json& in) { return NoteOf(in.at(0)).OctName(NamePrefsOf(in.at(1))); }},
            {"CNote::SetFromString", ReadFromString},
            {"KeyDirectionFrom",
             [](const json& in) {
                 return static_cast<int>(
                     KeyDirectionFrom(in.at(0).get<std::int64_t>(), in.at(1).get<std::int64_t>()));
             }},
            {"IntvlFromTo", IntvlBy(IntvlFromTo)},
            {"IntvlFromToTolerateNoteNrSmallUndef", IntvlBy(IntvlFromToTolerateNoteNrSmallUndef)},
            {"DistanceBetween",
             [](const json& in) { return DistanceBetween(NoteOf(in.at(0)), NoteOf(in.at(1))); }},
            {"LowIntervalLimit",
             [](const json& in) { return LowIntervalLimit(in.at(0).get<int>()); }},
        });
}

TEST_CASE("A note reads as it looks, signs in front of the octave included") {
    CChordNamePrefs prefs;
    prefs.mOctaveNaming = 1;
    struct CCase {
        const char* mText;
        CNote mNote;
    };
    const CCase cases[] = {
        {"C\u266F4", CNote(CKeyEnh_Cis, 4)},
        {" B\u266D\u266D3", CNote(CKeyEnh_Bbb, 3)},
        {"C 4", CNote(CKeyEnh_C, 4)},
        {"C99999999999999999999", CNote(108, TEnh_n)},
        {"B-99999999999999999999", CNote(CKeyEnh_B, -2)},
        {"X4", CNote_Undef},
        {"", CNote_Undef},
    };
    for (const CCase& test : cases) {
        CAPTURE(test.mText);
        CNote note(60, TEnh_n);
        CHECK(note.SetFromString(test.mText, prefs) == !test.mNote.IsUndef());
        CHECK(note == test.mNote);
    }
}

TEST_CASE("A spelling that its key cannot have is repaired on request") {
    const auto repaired = [](std::int64_t noteNr, TEnh enh) {
        CNote note;
        note.mNoteNr = noteNr;
        note.SetEnhAndDontMakeSenseful(enh);
        note.MakeSensefulEnhAssumingCMajor();
        return note.mEnh;
    };
    CHECK(repaired(61, TEnh_Undef) == TEnh_s);
    CHECK(repaired(61, TEnh_n) == TEnh_s);
    CHECK(repaired(68, TEnh_sss) == TEnh_s);
    CHECK(repaired(70, TEnh_b) == TEnh_b);
    CHECK(repaired(kNoteNrUndef, TEnh_b) == TEnh_Undef);
}

TEST_CASE("Steps of respelling leave triple accidentals of a note triple") {
    CNote note;
    note.mNoteNr = 61;
    note.SetEnhAndDontMakeSenseful(TEnh_bbb);
    note.EnhShiftToSharps();  // a double flat would give a flat
    CHECK(note.mEnh == TEnh_s);
}

TEST_CASE("Notes far off the keyboard come back onto it with their key, or stay far off") {
    for (const std::int64_t noteNr : {kFarBelow, kFarAbove, std::int64_t{-13}, std::int64_t{131}}) {
        CAPTURE(noteNr);
        CNote note;
        note.mNoteNr = noteNr;
        const int key = FoldIntoOctave(noteNr);
        note.AddIntvlAndClampToKey(0);
        CHECK(note.KeyNr() == key);
        CHECK(note.mNoteNr >= 0);
        CHECK(note.mNoteNr <= 127);
    }
    CHECK(IntvlFromTo(kFarBelow, kFarAbove) == -1);  // the lowest 32 bits, no overflow
}

TEST_CASE("Notes order by number, then from flat to sharp, and print") {
    CHECK(CNote(61, TEnh_b) < CNote(61, TEnh_s));
    CHECK(CNote(60, TEnh_n) < CNote(61, TEnh_b));
    CHECK(JSONStringOf(CNote(61, TEnh_b)) == "{\"name\":\"D\u266D\",\"nr\":61,\"enh\":\"flat\"}");
    CHECK(JSONStringOf(CNote_Undef) == R"({"name":"Undef","nr":-1,"enh":"undef"})");
    CHECK(TraceString(KeyDirectionFrom(60, 59)) == "Down");
}

TEST_CASE("A note takes number and spelling at once as it is made with them") {
    for (const TEnh enh : {TEnh_b, TEnh_n, TEnh_s, TEnh_Undef}) {
        for (const std::int64_t noteNr : {60, 61, 66, 127}) {
            CNote note(12, TEnh_n);
            note.SetNoteNrAndEnh(noteNr, enh);
            CHECK(note == CNote(noteNr, enh));
        }
    }
}
