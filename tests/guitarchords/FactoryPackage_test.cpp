// SPDX-License-Identifier: MIT
// The fingerings that come with the library are what they say they are, and a hand can hold them.
#include "brindle/chords/CChordTypes.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/guitarchords/LookUpChord.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <map>
#include <set>

using namespace brindle;

namespace {

const GChDatabase& FactoryPackage() {
    static GChDatabase database;
    if (database.tunings().empty()) {
        database.readFromDbPackageAtPath(BRINDLE_SOURCE_DIR "/data/" +
                                         std::string(kGChFactoryPackagePath));
    }
    return database;
}

std::vector<GChChord> FactoryChords() {
    std::vector<GChChord> chords;
    for (const auto& library : FactoryPackage().allLibrariesForAnyTuning()) {
        for (const auto& chord : library->basicChords()) {
            chords.push_back(*GChChord::make(chord, 0));
        }
    }
    return chords;
}

std::string Description(const GChChord& chord) {
    return chord.chordName(0) + ": " + chord.stringFromPitches(0);
}

/// What sounds, in semitones above the root.
std::set<int> TonesOf(const GChChord& chord) {
    std::set<int> tones;
    for (int i = 0; i < chord.numberOfStrings(); ++i) {
        const int pitch = chord.pitchForStringIndex(i, 0);
        if (pitch >= 0) tones.insert((pitch - chord.rootNote(0) + 12) % 12);
    }
    return tones;
}

/// What a chord says it is, by its type, or by its name if it has none.
CSemitones StatedTonesOf(const GChChord& chord) {
    if (!chord.userName().empty()) return ReadChordText("C" + chord.userName()).mChord.mSemitones;
    const auto type = _s_chordTypes().ChordTypeBuiltInFromId(chord.chordType());
    REQUIRE(type != _s_chordTypes().BuiltIn().end());
    return type->mIntvls.ToSemitones();
}

int HighestFretOf(const GChChord& chord) {
    int highest = 0;
    for (const GChChordElem& elem : chord.chordElems()) {
        highest = std::max(highest, elem.absFretIndex() + 1);
    }
    return highest;
}

}  // namespace

TEST_CASE("Each fingering sounds the chord that it says it is") {
    const auto chords = FactoryChords();
    CHECK(chords.size() >= 200);
    for (const GChChord& chord : chords) {
        INFO(Description(chord));
        const CSemitones stated = StatedTonesOf(chord);
        const std::set<int> sounding = TonesOf(chord);
        std::set<int> wanted;
        for (int tone = 0; tone < 12; ++tone) {
            const bool isLeftOut =
                OmittableTones(stated).HasIntvl(tone) && sounding.count(tone) == 0;
            if (stated.HasIntvl(tone) && !isLeftOut) wanted.insert(tone);
        }
        if (chord.bassNote(0) >= 0)
            wanted.insert((chord.bassNote(0) - chord.rootNote(0) + 12) % 12);
        CHECK(sounding == wanted);
    }
}

TEST_CASE("The root, or what is told as the bass, is the lowest note of each fingering") {
    for (const GChChord& chord : FactoryChords()) {
        INFO(Description(chord));
        int lowest = 0;
        while (chord.pitchForStringIndex(lowest, 0) < 0) ++lowest;
        CHECK(chord.pitchForStringIndex(lowest, 0) % 12 ==
              (chord.bassNote(0) < 0 ? chord.rootNote(0) : chord.bassNote(0)));
    }
}

TEST_CASE("A hand can hold each fingering") {
    for (const GChChord& chord : FactoryChords()) {
        INFO(Description(chord));
        std::map<int, std::set<int>> fretsOfFinger;
        std::map<int, int> elemsOfFinger;
        int lowest = 31;
        int highest = 0;
        for (const GChChordElem& elem : chord.chordElems()) {
            CHECK(elem.fingerNumber() >= 1);
            CHECK(elem.fingerNumber() <= 4);
            fretsOfFinger[elem.fingerNumber()].insert(elem.absFretIndex());
            ++elemsOfFinger[elem.fingerNumber()];
            lowest = std::min(lowest, elem.absFretIndex());
            highest = std::max(highest, elem.absFretIndex());
        }
        CHECK(highest - lowest <= 3);
        CHECK(chord.difficultyLevel() >= (chord.chordElems().size() > 2 ? 1 : 0));
        for (const auto& [finger, frets] : fretsOfFinger) CHECK(frets.size() == 1);
        // A finger lies on one string, or as one barre.
        for (const auto& [finger, count] : elemsOfFinger) CHECK(count == 1);
    }
}

TEST_CASE("Major, minor and seventh chords stand on all twelve roots in each movable form") {
    const auto chords = FactoryChords();
    // Types: major, minor, 7, maj7, minor 7.
    for (const int type : {1, 9, 3, 20, 11}) {
        for (int root = 0; root < 12; ++root) {
            INFO("type " << type << ", root " << root);
            const auto count = std::count_if(chords.begin(), chords.end(), [&](const auto& chord) {
                return chord.chordType() == type && chord.rootNote(0) == root;
            });
            CHECK(count >= 2);
        }
    }
}

TEST_CASE("No root is without the chords that songs ask for") {
    const auto chords = FactoryChords();
    for (const char* suffix :
         {"",     "m",  "7",     "maj7",  "m7",   "dim", "dim7", "aug", "7sus4", "sus4",
          "sus2", "m9", "maj9",  "9",     "6/9",  "11",  "13",   "7b9", "7#9",   "7#5",
          "7b5",  "5",  "madd9", "mmaj7", "m7b5", "6",   "m6",   "add9"}) {
        const CSemitones tones = ReadChordText("C" + std::string(suffix)).mChord.mSemitones;
        for (int root = 0; root < 12; ++root) {
            INFO("suffix " << suffix << ", root " << root);
            CHECK(std::any_of(chords.begin(), chords.end(), [&](const auto& chord) {
                return chord.rootNote(0) == root && chord.bassNote(0) < 0 &&
                       StatedTonesOf(chord) == tones;
            }));
        }
    }
}

TEST_CASE("Above fret 12 stands only what cannot be held below it") {
    CFingeringOptions below;
    below.mHighestFret = 12;
    below.mBass = TFingeringBass::Required;
    for (const GChChord& high : FactoryChords()) {
        if (HighestFretOf(high) <= 12) continue;
        INFO(Description(high));
        const CKeyEnh root{high.rootNote(0), TEnh_n};
        const CChordLite chord(root, CKeyEnh_Undef, StatedTonesOf(high));
        CHECK(FindFingerings(chord, kGChStandardGuitar, below).empty());
    }
}

TEST_CASE("Who looks a chord up sees first what books print first") {
    struct CRow {
        const char* mSymbol;
        std::vector<int> mFrets;
    };
    constexpr int x = -1;
    for (const auto& [symbol, frets] : std::vector<CRow>{
             {"C", {x, 3, 2, 0, 1, 0}},
             {"F", {x, x, 3, 2, 1, 1}},
             {"C7", {x, 3, 2, 3, 1, 0}},
             {"Bb6", {x, 1, 3, 3, 3, 3}},
             {"Em9", {0, 2, 0, 0, 0, 2}},
             {"C7#9", {x, 3, 2, 3, 4, x}},
             {"Dm7b5", {x, x, 0, 1, 1, 1}},
             {"Am9", {x, 0, 2, 4, 1, 3}},
             {"Bm6", {x, 2, 0, 1, 0, 2}},
             {"Fadd9", {x, x, 3, 2, 1, 3}},
             {"Ebm6", {x, x, 1, 3, 1, 2}},
             {"Ab", {4, 6, 6, 5, 4, 4}},
         }) {
        const auto found =
            LookUpChord(FactoryPackage(), ReadChordText(symbol).mChord, kGChStandardGuitar, 0);
        const std::string logged(symbol);
        INFO(logged);
        REQUIRE_FALSE(found.empty());
        const GChChord first = *GChChord::make(found.front().mGrid, 0);
        std::vector<int> told;
        for (int i = 0; i < 6; ++i) told.push_back(first.maxAbsFretIndexPlusOneForStringIndex(i));
        CHECK(told == frets);
        for (std::size_t i = 1; i < found.size(); ++i) {
            CHECK(found[i - 1].mCost <= found[i].mCost);
        }
    }
}
