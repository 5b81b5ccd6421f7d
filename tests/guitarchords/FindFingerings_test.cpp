// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/chords/CChordTypes.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/guitarchords/NameFingering.h"
#include "brindle/guitarchords/Tunings.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <set>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

CChordLite ChordOf(const char* symbol) {
    const auto reading = ReadChordText(symbol);
    REQUIRE(reading.mKind == TChordText_Chord);
    return reading.mChord;
}

std::string Text(const CFingering& fingering) {
    std::string text;
    for (const int fret : fingering.Frets()) text += fret < 0 ? "x" : std::to_string(fret);
    return text;
}

std::string FingersText(const CFingering& fingering) {
    std::string text(static_cast<std::size_t>(fingering.mStringCount), '-');
    for (const CFingerPlace& place : fingering.Fingers()) {
        for (int i = place.mMinString; i <= place.mMaxString; ++i) {
            if (fingering.mFrets[static_cast<std::size_t>(i)] != place.mFret) continue;
            text[static_cast<std::size_t>(i)] = static_cast<char>('0' + place.mFinger);
        }
    }
    return text;
}

std::set<int> KeysOf(const CChordLite& chord, CSemitones tones) {
    std::set<int> keys;
    for (int tone = 0; tone < 12; ++tone) {
        if (tones.HasIntvl(tone)) keys.insert((chord.mRootKeyEnh.mKeyNr + tone) % 12);
    }
    return keys;
}

/// What sounds is the chord without what is said to be left out, and its bass.
void CheckSound(const CFingering& fingering, const CChordLite& chord,
                const CFingeringOptions& options) {
    std::set<int> wanted = KeysOf(chord, chord.mSemitones - fingering.mOmitted);
    if (chord.HasBassNote()) wanted.insert(chord.mBassKeyEnh.mKeyNr);
    std::set<int> sounding;
    int lowest = 1000;
    for (int string = 0; string < fingering.mStringCount; ++string) {
        const int fret = fingering.mFrets[static_cast<std::size_t>(string)];
        if (fret < 0) continue;
        const int pitch =
            fingering.mTuning[static_cast<std::size_t>(string)] + options.mCapo + fret;
        CHECK(fingering.Pitch(string) == pitch);
        CHECK(fret + options.mCapo <= options.mHighestFret);
        sounding.insert(pitch % 12);
        lowest = std::min(lowest, pitch);
    }
    CHECK(sounding == wanted);
    const int bass = chord.IsSlashChord() ? chord.mBassKeyEnh.mKeyNr : chord.mRootKeyEnh.mKeyNr;
    CHECK(fingering.mBassIsLowest == (lowest % 12 == bass));
    if (chord.IsSlashChord() && !IsReentrant(fingering.mTuning)) CHECK(fingering.mBassIsLowest);
}

/// One hand holds exactly the frets that are told.
void CheckHand(const CFingering& fingering, const CFingeringOptions& options) {
    std::vector<int> held(static_cast<std::size_t>(fingering.mStringCount), 0);
    int lastFinger = 0;
    int lowest = 100;
    int highest = 0;
    for (const CFingerPlace& place : fingering.Fingers()) {
        CHECK(place.mFinger > lastFinger);
        CHECK(place.mFinger <= 4);
        lastFinger = place.mFinger;
        lowest = std::min<int>(lowest, place.mFret);
        highest = std::max<int>(highest, place.mFret);
        for (int i = place.mMinString; i <= place.mMaxString; ++i) {
            const auto at = static_cast<std::size_t>(i);
            CHECK(fingering.mFrets[at] >= place.mFret);
            held[at] = std::max<int>(held[at], place.mFret);
        }
    }
    for (std::size_t i = 0; i < held.size(); ++i) {
        CHECK(held[i] == std::max<int>(0, fingering.mFrets[i]));
    }
    const int span = lowest >= 7 ? options.mSpanUpTheNeck : options.mSpan;
    CHECK(highest - lowest < span);
    CHECK(fingering.mDifficulty >= 0);
    CHECK(fingering.mDifficulty <= 9);
}

void CheckAll(const CChordLite& chord, const GChShortTuning& tuning,
              const CFingeringOptions& options) {
    const auto found = FindFingerings(chord, tuning, options);
    for (std::size_t i = 0; i < found.size(); ++i) {
        INFO(Text(found[i]));
        CheckSound(found[i], chord, options);
        CheckHand(found[i], options);
        if (i > 0) CHECK(found[i - 1].mCost <= found[i].mCost);
        for (std::size_t j = 0; j < i; ++j) CHECK(found[i].mFrets != found[j].mFrets);
    }
}

std::vector<CChordLite> ChordsOfAllTypes() {
    std::vector<CChordLite> chords;
    for (const CChordType& type : _s_chordTypes().BuiltIn()) {
        const CSemitones tones = type.mIntvls.ToSemitones();
        if (tones.size() < 2) continue;
        for (int root = 0; root < 12; ++root) {
            chords.emplace_back(CKeyEnh{root, TEnh_n}, CKeyEnh_Undef, tones);
        }
    }
    return chords;
}

constexpr auto kTenTunings = {"standard", "dadgad",   "open-g",           "7-string", "bass",
                              "ukulele",  "mandolin", "baritone-ukulele", "banjo",    "cavaquinho"};

TEST_CASE("Each fingering sounds what it says and one hand holds it, in all tunings") {
    CFingeringOptions options;
    options.mHighestFret = 6;
    options.mLimit = 12;
    for (const char* name : kTenTunings) {
        for (const CChordLite& chord : ChordsOfAllTypes()) {
            INFO(name << " " << chord);
            CheckAll(chord, *TuningOfName(name), options);
        }
    }
}

TEST_CASE("The same holds for slash chords, capos and other hands") {
    for (const char* symbol : {"C/E", "C/Bb", "Am/G", "D/F#", "Bb13/D", "F/C"}) {
        for (const int capo : {0, 3, 12}) {
            CFingeringOptions options;
            options.mCapo = capo;
            CheckAll(ChordOf(symbol), kGChStandardGuitar, options);
            options.mSpan = options.mSpanUpTheNeck = 3;
            options.mMostInnerMutes = 0;
            options.mHighestFret = 20;
            CheckAll(ChordOf(symbol), *TuningOfName("ukulele"), options);
        }
    }
}

TEST_CASE("The first fingering and its fingers are those of the books of each instrument") {
    struct CRow {
        const char* mTuning;
        const char* mSymbol;
        const char* mFrets;
        const char* mFingers;
    };
    for (const CRow& row : std::vector<CRow>{
             {"standard", "C", "x32010", "-32-1-"},
             {"standard", "Am", "x02210", "--231-"},
             {"standard", "E", "022100", "-231--"},
             {"standard", "Em", "022000", "-23---"},
             {"standard", "D7", "xx0212", "---213"},
             {"standard", "C7", "x32310", "-3241-"},
             {"standard", "B7", "x21202", "-213-4"},
             {"standard", "Dm", "xx0231", "---231"},
             {"standard", "D/F#", "200232", ""},
             {"standard", "Am/G", "302210", ""},
             {"standard", "Cmaj7", "x32000", ""},
             {"standard", "Fmaj7", "xx3210", ""},
             {"standard", "Bm7b5", "x20201", ""},
             {"standard", "F", "xx3211", "--3211"},      // the index lies over two strings
             {"standard", "Esus4", "022200", "-123--"},  // and not where an open one sounds above
             {"standard", "C/E", "032010", ""},
             // What a guitarist would call inversions are the usual shapes of small instruments.
             {"ukulele-low-g", "C", "0003", "---1"},
             {"ukulele", "Bb", "3211", "3211"},
             {"baritone-ukulele", "G", "0003", ""},
             {"baritone-ukulele", "C/E", "2010", ""},
             {"mandolin", "D", "2002", ""},
             {"cavaquinho", "G", "0000", ""},
             // A bass stands on its root.
             {"bass", "C", "x320", ""},
             {"EADG", "C", "x320", ""},
             // The short string of a banjo begins at the fifth fret.
             {"banjo", "A", "x2222", "-1111"},
             {"banjo", "E", "x2102", ""},
             {"banjo", "G", "00000", ""},
             {"gdgbd", "Em", "02002", ""},
         }) {
        auto tuning = TuningOfName(row.mTuning);
        if (!tuning) tuning = GChShortTuning{52, 57, 62, 67};
        const auto found = FindFingerings(ChordOf(row.mSymbol), *tuning);
        INFO(row.mTuning << " " << row.mSymbol);
        REQUIRE_FALSE(found.empty());
        CHECK(Text(found.front()) == row.mFrets);
        if (row.mFingers[0] != '\0') CHECK(FingersText(found.front()) == row.mFingers);
        if (!HasShortString(*tuning)) continue;
        for (const CFingering& fingering : found) CHECK(fingering.mFrets[0] <= 0);
    }
}

TEST_CASE("A tuning tells whether it bears a bass and has a short string") {
    struct CRow {
        const char* mTuning;
        bool mBearsBass;
        bool mHasShortString;
    };
    for (const auto& [name, bearsBass, hasShortString] : std::vector<CRow>{
             {"standard", true, false},
             {"7-string", true, false},
             {"bass", true, false},
             {"5-string-bass", true, false},
             {"ukulele", false, false},
             {"ukulele-low-g", false, false},
             {"mandolin", false, false},
             {"tenor-banjo", false, false},
             {"banjo", false, true},
         }) {
        const std::string logged(name);
        INFO(logged);
        CHECK(BearsBass(*TuningOfName(name)) == bearsBass);
        CHECK(HasShortString(*TuningOfName(name)) == hasShortString);
    }
}

TEST_CASE("A fingering that is handed in has the place that the search gives it") {
    for (const char* symbol : {"C", "F", "C13", "D/F#", "Am7"}) {
        for (const CFingering& found : FindFingerings(ChordOf(symbol), kGChStandardGuitar)) {
            const std::vector<int> frets(found.Frets().begin(), found.Frets().end());
            CHECK(FingeringForChord(frets, ChordOf(symbol), kGChStandardGuitar) == found);
        }
    }
    const std::vector<int> c{-1, 3, 2, 0, 1, 0};
    CHECK_FALSE(FingeringForChord(c, ChordOf("C/E"), kGChStandardGuitar));
    CHECK_FALSE(FingeringForChord(c, CChordLite_Undef, kGChStandardGuitar));
    CHECK_FALSE(FingeringForChord({c.data(), 5}, ChordOf("C"), kGChStandardGuitar));
}

TEST_CASE("The best few are the first of many") {
    CFingeringOptions few;
    few.mLimit = 3;
    CFingeringOptions many;
    many.mLimit = 1000;
    for (const char* symbol : {"C", "A11", "Em7", "F#m7b5", "G/F#", "Bbm(maj7)", "Cdim7", "B5"}) {
        for (const char* tuning : {"standard", "ukulele", "dadgad", "7-string"}) {
            INFO(symbol << " " << tuning);
            auto all = FindFingerings(ChordOf(symbol), *TuningOfName(tuning), many);
            const auto best = FindFingerings(ChordOf(symbol), *TuningOfName(tuning), few);
            REQUIRE(best.size() == std::min<std::size_t>(3, all.size()));
            all.resize(best.size());
            CHECK(all == best);
        }
    }
}

TEST_CASE("What a player minds lies behind what he does not") {
    struct CRow {
        const char* mSymbol;
        const char* mBefore;
        const char* mBehind;
        const char* mBecause;
    };
    for (const CRow& row : std::vector<CRow>{
             {"Am", "x02210", "577555", "it lies at the nut"},
             {"A", "x02220", "x02225", "the hand is narrow"},
             {"Em7", "022030", "020030", "the seventh sounds once"},
             {"G/F#", "220003", "220002", "the bass that is foreign sounds once"},
             {"Gaug", "321003", "x21003", "the root is lowest, though each tone may be the root"},
             {"C7", "x32310", "x3231x", "the treble sounds"},
             {"Dm7", "xx0211", "x00211", "the root is lowest"},
             {"G", "320003", "3x0003", "no string is muted inside"},
             {"B7", "x21202", "x2120x", "an open string need not be muted"},
             {"E6", "022120", "02212x", "nothing is muted"},
             {"Cm13", "x33345", "111213", "a thirteenth stands on its root"},
             {"C11", "x33333", "132333", "the eleventh rubs on the third"},
             {"C7", "x32310", "012010", "a fifth is missed less than the root below"},
             {"Cdim7", "xx1212", "x3424x", "each tone of it may be the bass"},
             {"C", "x35553", "x35050", "open strings lie far below the hand"},
         }) {
        CFingeringOptions options;
        options.mLimit = 1000;
        const auto found = FindFingerings(ChordOf(row.mSymbol), kGChStandardGuitar, options);
        const auto placeOf = [&](const char* frets) {
            return std::find_if(found.begin(), found.end(),
                                [&](const CFingering& each) { return Text(each) == frets; });
        };
        INFO(row.mSymbol << ": " << row.mBecause);
        REQUIRE(placeOf(row.mBehind) != found.end());
        CHECK(placeOf(row.mBefore) < placeOf(row.mBehind));
    }
}

TEST_CASE("A barre lies under all strings of F, and four fingers hold Bb") {
    const auto find = [](const char* symbol, const char* frets) {
        for (const CFingering& fingering : FindFingerings(ChordOf(symbol), kGChStandardGuitar)) {
            if (Text(fingering) == frets) return fingering;
        }
        return CFingering();
    };
    const CFingering f = find("F", "133211");
    REQUIRE(f.mFingerCount == 4);
    CHECK(f.mFingers[0] == CFingerPlace{1, 1, 0, 5});
    CHECK(FingersText(f) == "134211");
    const CFingering c = find("C", "x32010");
    CHECK(f.mDifficulty > c.mDifficulty);
    CHECK(c.mDifficulty > find("Em", "022000").mDifficulty);
    CHECK(FingersText(find("Cm7", "x35343")) == "-13121");
}

TEST_CASE("What may be left out is what players leave out") {
    const auto omittable = [](const char* symbol) {
        return OmittableTones(ChordOf(symbol).mSemitones);
    };
    CHECK(omittable("C") == CSemitones());
    CHECK(omittable("C5") == CSemitones());
    CHECK(omittable("C7") == CSemitones{7});
    CHECK(omittable("Cm7b5") == CSemitones());
    CHECK(omittable("C9") == CSemitones{7});
    CHECK(omittable("C11") == CSemitones{2, 4, 7});
    CHECK(omittable("Cm11") == CSemitones{2, 7});
    CHECK(omittable("C13") == CSemitones{2, 5, 7});
    CHECK(OmittableTones(CSemitones{0, 2, 9, 10}) == CSemitones());
    CFingeringOptions whole;
    whole.mMayOmitTones = false;
    for (const CFingering& c7 : FindFingerings(ChordOf("C7"), kGChStandardGuitar, whole)) {
        CHECK(c7.mOmitted.IsEmpty());
    }
    CHECK_FALSE(FindFingerings(ChordOf("C13"), *TuningOfName("ukulele")).empty());
}

TEST_CASE("Options say what may be muted and what is lowest") {
    CFingeringOptions options;
    options.mMutable = 0;
    for (const CFingering& g : FindFingerings(ChordOf("G"), kGChStandardGuitar, options)) {
        CHECK(Text(g).find('x') == std::string::npos);
    }
    options.mMutable = 1;
    options.mBass = TFingeringBass::Required;
    const auto a = FindFingerings(ChordOf("A"), kGChStandardGuitar, options);
    REQUIRE_FALSE(a.empty());
    for (const CFingering& fingering : a) {
        CHECK(fingering.mBassIsLowest);
        CHECK(Text(fingering).find('x', 1) == std::string::npos);
    }
    options = {};
    options.mMayOmitRoot = true;
    const auto withoutRoot = FindFingerings(ChordOf("C9"), kGChStandardGuitar, options);
    CHECK(std::any_of(withoutRoot.begin(), withoutRoot.end(),
                      [](const CFingering& c) { return c.mOmitted.HasIntvl(0); }));
}

TEST_CASE("What cannot be held has no fingering, and no search is without an end") {
    CHECK(FindFingerings(CChordLite_Undef, kGChStandardGuitar).empty());
    CHECK(FindFingerings(CChordLite_NoChordForce, kGChStandardGuitar).empty());
    CHECK(FindFingerings(ChordOf("C"), GChShortTuning{}).empty());
    CHECK(FindFingerings(ChordOf("C"), GChShortTuning{60, 64}).empty());
    GChShortTuning sixteen{};
    sixteen.fill(60);
    CHECK(FindFingerings(ChordOf("C"), sixteen).empty());
    CFingeringOptions silly;
    silly.mHighestFret = 1'000'000;
    silly.mSpan = silly.mSpanUpTheNeck = 1000;
    silly.mMostInnerMutes = 1000;
    silly.mCapo = -7;
    silly.mLimit = 1'000'000;
    const GChShortTuning twelve{40, 45, 50, 55, 59, 64, 69, 74, 79, 83, 88, 127};
    CHECK(FindFingerings(ChordOf("C13"), twelve, silly).size() <= 1000);
}

TEST_CASE("Tunings have names, however they are typed") {
    CHECK(TuningOfName("Drop D") == GChShortTuning{50, 57, 62, 67, 71, 76});
    CHECK(TuningOfName("DROP_D") == TuningOfName("dropd"));
    CHECK(TuningOfName("GCEA") == TuningOfName("ukulele"));
    CHECK_FALSE(TuningOfName("lute"));
    CHECK_FALSE(TuningOfName("-"));
    CHECK(TitleOfTuning(kGChStandardGuitar) == "Standard");
    CHECK(TitleOfTuning({60, 61, 62}).empty());
    for (const CNamedTuning& row : NamedTunings()) {
        INFO(row.mName);
        CHECK(TuningOfName(row.mTitle) == row.mTuning);
        CHECK(GChIsValidShortTuning(row.mTuning));
    }
}

}  // namespace
}  // namespace brindle::test
