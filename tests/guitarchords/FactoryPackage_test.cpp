// SPDX-License-Identifier: MIT
// The fingerings that come with the library are what they say they are, and a hand can hold them.
#include "brindle/chords/CChordTypes.h"
#include "brindle/guitarchords/GChChordTypes.h"
#include "brindle/guitarchords/GChDatabase.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <map>
#include <set>

using namespace brindle;

namespace {

std::vector<GChChord> FactoryChords() {
    static GChDatabase database;
    if (database.tunings().empty()) {
        database.readFromDbPackageAtPath(BRINDLE_SOURCE_DIR "/data/" +
                                         std::string(kGChFactoryPackagePath));
    }
    std::vector<GChChord> chords;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
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

std::set<int> TonesOfType(CChordTypeId id) {
    std::set<int> tones;
    for (const int intvl : _s_chordTypes().ChordTypeBuiltInFromId(id)->mIntvls) {
        tones.insert(intvl % 12);
    }
    return tones;
}

constexpr int kFifth = 7;

}  // namespace

TEST_CASE("Each fingering sounds the chord that it says it is") {
    const auto chords = FactoryChords();
    CHECK(chords.size() >= 200);
    for (const GChChord& chord : chords) {
        INFO(Description(chord));
        REQUIRE_FALSE(GChChordTypeNameForId(chord.chordType()).empty());
        std::set<int> wanted = TonesOfType(chord.chordType());
        const std::set<int> sounding = TonesOf(chord);
        // Guitarists leave out the fifth of a chord of four tones first.
        if (wanted.size() > 3 && sounding.count(kFifth) == 0) wanted.erase(kFifth);
        CHECK(sounding == wanted);
    }
}

TEST_CASE("The root is the lowest note of each fingering") {
    for (const GChChord& chord : FactoryChords()) {
        INFO(Description(chord));
        int lowest = 0;
        while (chord.pitchForStringIndex(lowest, 0) < 0) ++lowest;
        CHECK(chord.pitchForStringIndex(lowest, 0) % 12 == chord.rootNote(0));
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
            CHECK(count >= 3);
        }
    }
}
