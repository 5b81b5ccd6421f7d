// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChHarmonyStrings.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/guitarchords/GChChord.h"
#include "brindle/guitarchords/GChChordDescr.h"
#include "brindle/guitarchords/GChTuningDescr.h"
#include "brindle/platform/Utf8.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <boost/container/static_vector.hpp>

#include <algorithm>
#include <cstddef>

namespace brindle {

namespace {

/// The pitches of the strings that sound, from the string with the lowest index.
using TPitches = boost::container::static_vector<int, kGChMaxStrings>;

TPitches PitchesOf(const GChChord& chord, int capo) {
    TPitches pitches;
    for (int i = 0; i < chord.numberOfStrings(); ++i) {
        if (!chord.isMutedForStringIndex(i)) pitches.push_back(chord.pitchForStringIndex(i, capo));
    }
    return pitches;
}

TPitches PitchesOf(const GChChordDescr& chord, const GChTuningDescr& tuning) {
    TPitches pitches;
    for (int i = 0; i < std::min(tuning.numberOfStrings(), kGChMaxStrings); ++i) {
        if (!chord.isMutedForStringIndex(i)) {
            pitches.push_back(chord.pitchForStringIndex1(i, tuning));
        }
    }
    return pitches;
}

CChordNamePrefs PrefsForGrids(bool withCommas) {
    CChordNamePrefs prefs = CurrentChordNamePrefs;
    prefs.mChordPrefC = 2;
    prefs.mNoSpaceBetweenNameParts = 0;
    if (withCommas) prefs.mCommaParts = true;
    return prefs;
}

TEnh EnhOfType(int enhType) {
    if (enhType == 2) return TEnh_b;
    return enhType == 1 ? TEnh_s : TEnh_n;
}

std::optional<std::string> NameOf(const TPitches& pitches, int root, int enhType,
                                  const CChordNamePrefs& prefs) {
    if (root > 11) return std::nullopt;
    CChordHeavy chord(24);
    chord.SetRootNote(CNote(root, EnhOfType(enhType)));
    for (const int pitch : pitches) chord.AddNote(CNote(pitch, TEnh_n));
    return chord.Name(prefs);
}

int RootWithShortestName(const TPitches& pitches) {
    const CChordNamePrefs prefs = PrefsForGrids(false);
    int shortest = -1;
    std::size_t fewest = 0;
    for (int root = 0; root < 12; ++root) {
        const std::size_t count =
            CountUtf8Characters(NameOf(pitches, root, -1, prefs).value_or(""));
        if (shortest >= 0 && count >= fewest) continue;
        shortest = root;
        fewest = count;
    }
    return shortest;
}

std::optional<std::string> Name(const GChChord* chord, int root, int enhType, int capo,
                                bool withCommas) {
    if (chord == nullptr) return std::nullopt;
    return NameOf(PitchesOf(*chord, capo), root, enhType, PrefsForGrids(withCommas));
}

std::optional<std::string> Name(const GChChordDescr* chord, const GChTuningDescr* tuning, int root,
                                int enhType, bool withCommas) {
    if (chord == nullptr || tuning == nullptr) return std::nullopt;
    return NameOf(PitchesOf(*chord, *tuning), root, enhType, PrefsForGrids(withCommas));
}

}  // namespace

std::optional<std::string> GChHarmonyStringFromChord(const GChChord* chord, int root, int enhType,
                                                     int capo) {
    return Name(chord, root, enhType, capo, false);
}

std::optional<std::string> GChHarmonyCommaSeparatedStringFromChord(const GChChord* chord, int root,
                                                                   int enhType, int capo) {
    return Name(chord, root, enhType, capo, true);
}

std::optional<std::string> GChHarmonyStringFromChordDescr(const GChChordDescr* chordDescr,
                                                          const GChTuningDescr* tuningDescr,
                                                          int root, int enhType) {
    return Name(chordDescr, tuningDescr, root, enhType, false);
}

std::optional<std::string> GChHarmonyCommaSeparatedStringFromChordDescr(
    const GChChordDescr* chordDescr, const GChTuningDescr* tuningDescr, int root, int enhType) {
    return Name(chordDescr, tuningDescr, root, enhType, true);
}

int GChProposedRootNoteFromChord(const GChChord* chord, int capo) {
    return chord == nullptr ? -1 : RootWithShortestName(PitchesOf(*chord, capo));
}

int GChProposedRootNoteFromChordDescr(const GChChordDescr* chordDescr,
                                      const GChTuningDescr* tuningDescr) {
    if (chordDescr == nullptr || tuningDescr == nullptr) return -1;
    return RootWithShortestName(PitchesOf(*chordDescr, *tuningDescr));
}

}  // namespace brindle
