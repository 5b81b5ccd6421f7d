// SPDX-License-Identifier: MIT
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordTypes.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"

#include <doctest/doctest.h>

#include <chrono>
#include <fstream>
#include <random>
#include <sstream>
#include <string>
#include <vector>

using namespace brindle;

namespace {

struct CSpelling {
    std::string mText;
    std::string mTones;
    std::string mBassKey;
    std::string mParserText;
    std::string mExact;
};

std::vector<CSpelling> Spellings() {
    std::ifstream file(BRINDLE_TEST_DATA "/chord-spellings.tsv");
    std::string line;
    std::getline(file, line);
    std::vector<CSpelling> spellings;
    while (std::getline(file, line)) {
        std::istringstream cells(line);
        CSpelling row;
        for (std::string* cell :
             {&row.mText, &row.mTones, &row.mBassKey, &row.mParserText, &row.mExact}) {
            std::getline(cells, *cell, '\t');
        }
        spellings.push_back(row);
    }
    return spellings;
}

std::string TonesText(CSemitones semitones) {
    std::string text;
    for (int tone = 0; tone < 12; ++tone) {
        if (semitones.HasIntvl(tone)) text += (text.empty() ? "" : ",") + std::to_string(tone);
    }
    return text;
}

CChordLite ChordOf(std::string_view text, const CChordTextOptions& prefs = {}) {
    const CChordTextReading reading = ReadChordText(text, prefs);
    CHECK_MESSAGE(reading.mKind == TChordText_Chord, text, ": ", reading.mFault);
    return reading.mChord;
}

/// Random texts of the pieces that chord symbols are made of, some of them spoilt.
class CSymbolMaker {
public:
    explicit CSymbolMaker(std::uint32_t seed) : mGenerator(seed) {}

    std::string Make() {
        static const std::vector<std::string> pieces{
            "m",  "maj", "M",  "-",   "+",    "o",  "dim", "aug",  "sus",  "sus2", "s4",  "add",
            "no", "7",   "9",  "11",  "13",   "6",  "5",   "4",    "2",    "3",    "b",   "#",
            "♭",  "♯",   "(",  ")",   ",",    "/",  " ",   "Δ",    "ø",    "°",    "alt", "omit",
            "x",  "bb",  "##", "E",   "Bb",   "/G", ":",   "min7", "(b9)", "is",   "es",  "th",
            "j7", "h",   "^",  "/Ab", " on ", "D",  "dom", ".",    "q",    "\xC3", "1",   "*"};
        static const std::vector<std::string> roots{"C", "F#", "Bb", "E", "As", "h", "D♭", "Gx"};
        std::string text = Of(roots);
        for (std::size_t count = mGenerator() % 6; count > 0; --count) text += Of(pieces);
        return text;
    }

private:
    const std::string& Of(const std::vector<std::string>& texts) {
        return texts[mGenerator() % texts.size()];
    }

    std::mt19937 mGenerator;
};

}  // namespace

TEST_CASE("Chord symbols are read as people write them") {
    const std::vector<CSpelling> spellings = Spellings();
    CHECK(spellings.size() == 342);
    for (const CSpelling& row : spellings) {
        CAPTURE(row.mText);
        const CChordTextReading reading = ReadChordText(row.mText);
        CHECK(reading.mFault == "");
        REQUIRE(reading.mKind == TChordText_Chord);
        CHECK(TonesText(reading.mChord.mSemitones) == row.mTones);
        const int bass = reading.mChord.mBassKeyEnh.mKeyNr;
        CHECK((bass == kKeyNrUndef ? "" : std::to_string(bass)) == row.mBassKey);
        CHECK(reading.mParserText == row.mParserText);
        CHECK((reading.mParserTextIsExact ? "yes" : "nearest") == row.mExact);
        CHECK((CChordLite(reading.mParserText, {}) == reading.mChord) ==
              reading.mParserTextIsExact);
    }
}

TEST_CASE("Contested spellings and rare marks have one reading") {
    struct CRow {
        const char* mText;
        const char* mTones;
    };
    const CRow rows[] = {
        {"CmM", "0,3,7,11"},
        {"Co7M", "0,3,6,9,11"},
        {"C9maj7", "0,2,4,7,11"},
        {"C7/ma7", "0,4,7,10,11"},
        {"C7M9", "0,2,4,7,11"},
        {"C5maj7", "0,7,11"},
        {"C^69", "0,2,4,7,9"},
        {"Cm+7", "0,3,7,11"},
        {"Cm4", "0,3,5,7"},
        {"C(9)", "0,2,4,7"},
        {"C5-", "0,4,6"},
        {"Caug5", "0,4,8"},
        {"C713", "0,4,7,9,10"},
        {"C7no3,5", "0,10"},
        {"C7omit3&5 5", "0,7,10"},
        {"Csus2/4", "0,2,5,7"},
        {"Csus#4", "0,6,7"},
        {"C7sus♯4", "0,6,7,10"},
        {"Csus#4b9", "0,1,6,7"},
        {"Csus(#4)", "0,6,7"},
        {"Csus+4", "0,6,7"},
        {"Csus #4", "0,6,7"},
        {"C7 suspended sharp fourth", "0,6,7,10"},
        {"Csus(#4,b9)", "0,1,6,7"},
        {"Csus4(#4)", "0,5,6,7"},
        {"Csus+ 4", "0,5,8"},
        {"Csus#11", "0,5,6,7"},
        {"C7 suspended fourth", "0,5,7,10"},
        {"C7 flat ninth", "0,1,4,7,10"},
        {"C dominant seventh", "0,4,7,10"},
        {"Cdim7/C", "0,3,6,9"},
        {"F:maj(9,*5)", "0,2,4"},
        {"C:(1,5)", "0,7"},
        {"C:minmaj7", "0,3,7,11"},
        {"Fa7", "0,4,8,10"},
        {"Fd7", "0,3,6,9"},
        {"C drone", "0,7"},
        {"Comit1", "4,7"},
        {"C##5", "0,4,8"},
        {"(E7)", "0,4,7,10"},
        // The flat eleventh is the enharmonic third, and takes the place of the eleventh.
        {"C7b11", "0,4,7,10"},
        {"Cm7b11", "0,3,4,7,10"},
        {"C11b11", "0,2,4,7,10"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(TonesText(ChordOf(row.mText).mSemitones) == row.mTones);
    }
}

TEST_CASE("Roots and basses are spelled as they are written") {
    struct CRow {
        const char* mText;
        CKeyEnh mRoot;
        CKeyEnh mBass;
        CChordTextOptions mPrefs;
    };
    const CKeyEnh none = CKeyEnh_Undef;
    const CRow rows[] = {
        {"Bbb7", CKeyEnh_Bbb, none, {}},
        {"Bbb9", CKeyEnh_Bb, none, {}},
        {"Cb9", CKeyEnh_Cb, none, {}},
        {"C b9", CKeyEnh_C, none, {}},
        {"C##m", CKeyEnh_Cx, none, {}},
        {"Ases", CKeyEnh_Abb, none, {}},
        {"Fisis7", CKeyEnh_Fx, none, {}},
        {"Es4", CKeyEnh_E, none, {}},
        {"Asus", CKeyEnh_A, none, {}},
        {"E-flat7", CKeyEnh_Eb, none, {}},
        {"B♭/F♯", CKeyEnh_Bb, CKeyEnh_Fis, {}},
        {"C7 on g", CKeyEnh_C, CKeyEnh_G, {}},
        {"C7(b9/E)", CKeyEnh_C, CKeyEnh_E, {}},
        {"C/c", CKeyEnh_C, none, {}},
        {"Ab:min/b3", CKeyEnh_Ab, CKeyEnh_Cb, {}},
        {"C:maj/5", CKeyEnh_C, CKeyEnh_G, {}},
        {"B7/H", CKeyEnh_Bb, CKeyEnh_B, {.mBIsBFlat = true}},
        {"Bb7", CKeyEnh_Bb, none, {.mBIsBFlat = true}},
        {"Bes", CKeyEnh_Bb, none, {.mBIsBFlat = true}},
        {"Sol#m7", CKeyEnh_Gis, none, {.mSolfege = true}},
        {"réb", CKeyEnh_Db, none, {.mSolfege = true}},
        {"Do7", CKeyEnh_C, none, {.mSolfege = true}},
        {"Do7", CKeyEnh_D, none, {}},
        {"Fadd9", CKeyEnh_F, none, {.mSolfege = true}},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        const CChordLite chord = ChordOf(row.mText, row.mPrefs);
        CHECK(chord.mRootKeyEnh == row.mRoot);
        CHECK(chord.mBassKeyEnh == row.mBass);
    }
    CHECK(ChordOf("am").mSemitones == ChordOf("a", {.mLowerCaseIsMinor = true}).mSemitones);
    CHECK(ChordOf("a").mSemitones == ChordOf("A", {.mLowerCaseIsMinor = true}).mSemitones);
    CHECK(NormaliseChordSymbol("B°/H", {.mBIsBFlat = true}) == "Bdim/H");
}

TEST_CASE("Some texts stand for no chord or for the one before") {
    for (const char* text : {"N", "N.C.", "no chord", "tacet", "X", "[N.C.]"}) {
        CAPTURE(text);
        const CChordTextReading reading = ReadChordText(text);
        CHECK(reading.mKind == TChordText_NoChord);
        CHECK(reading.mChord == CChordLite_NoChordYield);
        CHECK(reading.mParserText == "NoChord");
    }
    CHECK(ReadChordText("No Chord Force").mChord == CChordLite_NoChordForce);
    CHECK(ReadChordText("undef").mChord == CChordLite_Undef);
    for (const char* text : {"%", "/", "////", "./.", "-", "x", "sim.", "÷", "\U0001D10E"}) {
        CAPTURE(text);
        CHECK(ReadChordText(text).mKind == TChordText_Repeat);
        CHECK_FALSE(NormaliseChordSymbol(text));
    }
    CHECK(ReadChordText("W").mKind == TChordText_NotUnderstood);
}

TEST_CASE("What is not understood is told with its place") {
    struct CRow {
        const char* mText;
        int mPos;
        const char* mFault;
    };
    const CRow rows[] = {
        {"Cm7x9", 4, R"("x" at 4 is not understood)"},
        {"Hello", 2, R"("ello" at 2 is not understood)"},
        {"Csos4", 2, R"("sos" at 2 is not understood)"},
        {"Cb7b4x", 6, R"("x" at 6 is not understood)"},
        {"Z7", 1, R"(a chord begins with a note A to H, "Z7" at 1 is none)"},
        {"7", 1, R"(a chord begins with a note A to H, "7" at 1 is none)"},
        {"", 1, "the text is empty"},
        {"C8", 2, R"("8" at 2 is no degree of a chord (2 3 4 5 6 7 9 11 13))"},
        {"C12", 2, R"("12" at 2 is no degree of a chord (2 3 4 5 6 7 9 11 13))"},
        {"C###", 4, R"("#" at 4 is one accidental too many)"},
        {"EB7", 2, R"("B" at 2 is not understood; a flat is a small b)"},
        {"C7#", 3, R"("#" at 3 needs a number behind it)"},
        {"Cmaj7b", 6, R"("b" at 6 needs a number behind it)"},
        {"Cadd", 2, R"("add" at 2 needs a degree behind it)"},
        {"Cno", 2, R"("no" at 2 needs a degree behind it)"},
        {"C7(b9))", 7, "\")\" at 7 closes no bracket"},
        {"C/", 2, "the slash at 2 has no bass note behind it"},
        {"C/J", 3, R"("J" at 3 is no bass note)"},
        {"Am7/Gq", 5, R"("Gq" at 5 is no bass note)"},
        {"C/E/G", 3, R"("E" at 3: a chord has one bass note, behind the last slash)"},
        {"C/b/G", 3, R"("b" at 3: a chord has one bass note, behind the last slash)"},
        {"CM7 Dm7", 5, R"("Dm" at 5 begins a second chord)"},
        {"C7(Db7)", 4, R"("Db" at 4 begins a second chord)"},
        {"C E G", 3, R"("E" at 3 begins a second chord)"},
        // The place counts characters, not bytes, of what was typed.
        {" F♯m7♭5?", 8, R"("?" at 8 is not understood)"},
        {"[C♯é]", 4, R"("é" at 4 is not understood)"},
        {"C/E G", 5, R"("G" at 5 begins a second chord)"},
        {"C7add8", 6, R"("8" at 6 is no degree of a chord (2 3 4 5 6 7 9 11 13))"},
        {"Cbb:min/b3", 9, R"("b" at 9 is one accidental too many)"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        const CChordTextReading reading = ReadChordText(row.mText);
        CHECK(reading.mKind == TChordText_NotUnderstood);
        CHECK(reading.mFault == row.mFault);
        CHECK(reading.mFaultPos == row.mPos);
        CHECK(reading.mParserText.empty());
        CHECK(reading.mChord == CChordLite_Undef);
    }
}

TEST_CASE("Every chord that a symbol can say is written and read back the same") {
    int exact = 0;
    for (std::uint64_t mask = 1; mask < 4096; mask += 2) {
        const CSemitones semitones(mask);
        // A spelling that the parser of symbols cannot read.
        std::string text = "F♯:(";
        for (int tone = 0; tone < 12; ++tone) {
            constexpr const char* kDegrees[] = {"1",  "b2", "2",  "b3", "3",  "4",
                                                "b5", "5",  "#5", "6",  "b7", "7"};
            if (!semitones.HasIntvl(tone)) continue;
            text += (text.back() == '(' ? "" : ",") + std::string(kDegrees[tone]);
        }
        text += ')';
        for (const char* bass : {"", "/E♭", "/B", "/A"}) {
            const CChordTextReading reading = ReadChordText(text + bass);
            CAPTURE(reading.mParserText);
            CHECK(reading.mChord.mSemitones == semitones);
            const CChordTextReading again = ReadChordText(reading.mParserText);
            const CChordLite parsed(reading.mParserText, {});
            CHECK(again.mChord == parsed);
            CHECK(again.mParserText == reading.mParserText);
            CHECK((parsed == reading.mChord) == reading.mParserTextIsExact);
            exact += reading.mParserTextIsExact && *bass == '\0';
        }
    }
    CHECK(exact == 1344);
}

TEST_CASE("A normalised symbol stays as it is") {
    CSymbolMaker maker(20);
    const CChordTextOptions styles[] = {
        {}, {.mBIsBFlat = true}, {.mSolfege = true}, {.mLowerCaseIsMinor = true}};
    int understood = 0;
    for (int i = 0; i < 100'000; ++i) {
        const std::string text = maker.Make();
        const CChordTextOptions& prefs = styles[static_cast<std::size_t>(i) % 4];
        const auto once = NormaliseChordSymbol(text, prefs);
        if (!once) continue;
        ++understood;
        const auto twice = NormaliseChordSymbol(*once, prefs);
        if (twice == once) continue;
        FAIL_CHECK(text << " gives " << *once << ", and that gives " << twice.value_or("a fault"));
    }
    CHECK(understood > 10'000);
}

TEST_CASE("Every printed name reads back") {
    const auto styles = [] {
        std::vector<CChordNamePrefs> all;
        for (int bits = 0; bits < 256; ++bits) {
            CChordNamePrefs prefs{.mNoSpaceBetweenNameParts = 0};
            prefs.mHForB = prefs.mBForBFlat = (bits & 1) != 0;
            prefs.mGermanNames = (bits & 2) != 0;
            prefs.mAsciiAccidentals = bits >> 2 & 1;
            prefs.mSolfege = (bits & 8) != 0;
            prefs.mLowerCaseMinorRoot = (bits & 16) != 0;
            prefs.mCommaParts = (bits & 32) != 0;
            prefs.mOptionBrackets = bits >> 6 & 1;
            prefs.mNoSpaceAroundSlash = bits >> 7 & 1;
            prefs.mChordPrefC = bits % 3;
            all.push_back(prefs);
        }
        return all;
    }();
    constexpr std::size_t kKeyCount = CKeyEnh_AllUpToOneAccidental.size();
    std::size_t key = 0;
    for (const CChordNamePrefs& style : styles) {
        const CChordTextOptions prefs{
            .mBIsBFlat = style.mHForB, .mSolfege = style.mSolfege, .mOwnName = true};
        // Each style has its share of the sets, and each set comes in eight of them.
        const std::uint64_t first = 1 + 2 * (static_cast<std::uint64_t>(&style - &styles[0]) % 32);
        for (std::uint64_t mask = first; mask < 4096; mask += 64) {
            key = (key + 1) % kKeyCount;
            const CChordLite chord(CKeyEnh_AllUpToOneAccidental[key], CKeyEnh_Undef,
                                   CSemitones(mask));
            const std::string name = chord.ToChordHeavy(24).NameWithSlash(style);
            const CChordTextReading reading = ReadChordText(name, prefs);
            if (reading.mChord.mSemitones == chord.mSemitones) continue;
            if (reading.mKind == TChordText_Chord &&
                reading.mChord.ToChordHeavy(24).NameWithSlash(style) == name) {
                continue;
            }
            FAIL_CHECK(name << " of " << TonesText(chord.mSemitones) << " reads as "
                            << TonesText(reading.mChord.mSemitones) << " " << reading.mFault);
        }
    }
}

TEST_CASE("The built-in chord types read back from their printed names") {
    const CChordTypes types;
    for (const CChordType& type : types.BuiltIn()) {
        CSemitones semitones;
        semitones.SetFromIntvlSet(type.mIntvls);
        const CChordLite chord(CKeyEnh_Eb, CKeyEnh_Undef, semitones);
        const std::string name = chord.ToChordHeavy(24).NameWithSlash({});
        CAPTURE(name);
        CHECK(ChordOf(name, {.mOwnName = true}) == chord);
    }
}

TEST_CASE("Long texts are read in time that grows with their length") {
    const char* const pieces[] = {"add9 ", "/", "(", " ", "on", "♯", "no3,5", "7sus ", ":(b", "b"};
    for (const char* piece : pieces) {
        CAPTURE(piece);
        const auto seconds = [&](std::size_t length) {
            std::string text = "C";
            while (text.size() < length) text += piece;
            const auto start = std::chrono::steady_clock::now();
            static_cast<void>(ReadChordText(text));
            const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - start;
            return taken.count();
        };
        constexpr std::size_t kLength = 16 * 1024;
        seconds(kLength);
        CHECK(seconds(16 * kLength) < 0.5 + 64 * seconds(kLength));
    }
}
