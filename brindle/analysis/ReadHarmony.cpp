// SPDX-License-Identifier: MIT
// One reading of a song in four steps: the key of the song, the path of keys through its chords,
// the tree of which chord prepares which, and, from the last chord to the first, their names.
// Chords that are written twice are one here, and are told apart again in the end.

#include "brindle/analysis/ReadHarmony.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/internal/HarmonyChain.h"
#include "brindle/analysis/internal/HarmonyRules.h"
#include "brindle/analysis/internal/SongKeys.h"

#include <array>

namespace brindle {
namespace {

constexpr int kMinorSeventhUp = 10;
constexpr int kLetterCount = 7;

// A to G, 0 is C; -1 for a key that is no letter with its accidental.
int LetterOfKey(const CKeyEnh& keyEnh) {
    if (keyEnh.IsUndef() || keyEnh.mEnh == TEnh_Undef) return -1;
    constexpr std::array<int, 12> letters{0, -1, 1, -1, 2, 3, -1, 4, -1, 5, -1, 6};
    const int natural = FoldIntoOctave(std::int64_t{keyEnh.mKeyNr} - EnhToSemitone(keyEnh.mEnh));
    return letters[static_cast<std::size_t>(natural)];
}

// Behind the last place at which a chord is written.
std::size_t EndOf(std::span<const CKeyChord> heard, std::size_t ix, std::size_t count) {
    return ix + 1 < heard.size() ? heard[ix + 1].mBegin : count;
}

// The spelling that one of the times tells at which the chord is written.
std::vector<TSeventhSpelling> SeventhsOf(const CHarmAnlsChords& chords,
                                         std::span<const CKeyChord> heard,
                                         std::span<const TSeventhSpelling> stated) {
    std::vector<TSeventhSpelling> sevenths(heard.size(), TSeventhSpelling_Undef);
    for (std::size_t i = 0; i < heard.size(); ++i) {
        if (stated.empty() && !heard[i].mHasBass) continue;
        const std::size_t end = EndOf(heard, i, chords.size());
        for (std::size_t ix = heard[i].mBegin; ix < end; ++ix) {
            sevenths[i] = ix < stated.size() ? stated[ix] : TSeventhSpelling_Undef;
            if (sevenths[i] == TSeventhSpelling_Undef) {
                sevenths[i] = SeventhSpellingOf(chords[ix].mRootKeyEnh, chords[ix].mBassKeyEnh);
            }
            if (sevenths[i] != TSeventhSpelling_Undef) break;
        }
    }
    return sevenths;
}

// The reading of each chord stands at its first place in the list.
std::vector<CChordReading> ReadChords(std::size_t count, std::span<const CKeyChord> heard,
                                      const CSongKeys& keys, const CKeySpeller& speller,
                                      std::span<const TSeventhSpelling> sevenths) {
    std::vector<std::ptrdiff_t> targets = HarmonyChain(heard, keys.mKinds, keys.mTraits.mHome);
    std::vector<CChordReading> readings(count);
    NameHarmonies({heard, keys.mKeys, sevenths, keys.mTraits, speller, targets, readings});
    return readings;
}

// Gives chords that are written again the same reading.
void Spread(const CHarmAnlsChords& chords, std::span<const CKeyChord> heard,
            std::vector<CChordReading>& readings) {
    const std::size_t written = chords.size() - (chords.back().IsUndef() ? 1 : 0);
    if (heard.size() == written) return;
    for (std::size_t i = 0; i < heard.size(); ++i) {
        const std::size_t end = EndOf(heard, i, chords.size());
        for (std::size_t ix = heard[i].mBegin + 1; ix < end; ++ix) {
            if (!chords[ix].IsUndef()) readings[ix] = readings[heard[i].mBegin];
        }
    }
}

}  // namespace

TSeventhSpelling SeventhSpellingOf(const CKeyEnh& root, const CKeyEnh& seventh) {
    const int rootLetter = LetterOfKey(root);
    const int letter = LetterOfKey(seventh);
    if (rootLetter < 0 || letter < 0) return TSeventhSpelling_Undef;
    const int up = FoldIntoOctave(std::int64_t{seventh.mKeyNr} - root.mKeyNr);
    if (up != kMinorSeventhUp) return TSeventhSpelling_Undef;
    const int letters = (letter - rootLetter + kLetterCount) % kLetterCount;
    if (letters == 6) return TSeventhSpelling_MinorSeventh;
    return letters == 5 ? TSeventhSpelling_AugmentedSixth : TSeventhSpelling_Undef;
}

CSongReading ReadHarmony(const CHarmAnlsChords& chords, const CReadingOptions& options) {
    CSongReading song;
    const std::vector<CKeyChord> heard = KeyChordsOf(chords);
    if (heard.empty()) {
        song.mChords.resize(chords.size());
        return song;
    }
    const CSongKeys keys = FindSongKeys(heard, options.mKeys, NumberOfKey(options.mStatedKey));
    const CKeySpeller speller(chords, options.mStatedKey);
    const int home = keys.mTraits.mHome;
    song.mKey = speller.SignKeyOf(home);
    song.mConfidence = ConfidenceOf(keys.mScores, home);
    song.mRegions = KeyRegionsOf(chords, heard, keys.mKeys, speller);
    song.mChords = ReadChords(chords.size(), heard, keys, speller,
                              SeventhsOf(chords, heard, options.mSevenths));
    Spread(chords, heard, song.mChords);
    return song;
}

}  // namespace brindle
