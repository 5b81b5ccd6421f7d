// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/FindFingerings.h"

#include "brindle/guitarchords/NameFingering.h"
#include "brindle/guitarchords/internal/FingeringSearch.h"
#include "brindle/guitarchords/internal/HandOf.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr int kRootTone = 0;
constexpr int kMostCapo = 12;
constexpr std::size_t kMostFingerings = 1000;

/// Bits of key numbers from bits above a root.
std::uint32_t KeysOf(CSemitones semitones, int root) {
    CSemitones keys = semitones;
    keys.RotateRootToIx(FoldIntoOctave(-root));
    return static_cast<std::uint32_t>(keys.Mask());
}

/// Of a diminished seventh or an augmented triad each tone may be the root.
bool IsSymmetric(CSemitones semitones) {
    for (int turn = 1; turn < 12; ++turn) {
        CSemitones turned = semitones;
        turned.RotateRootToIx(turn);
        if (turned == semitones) return true;
    }
    return false;
}

CSemitones MayBeOmitted(CSemitones semitones, int strings, const CFingeringOptions& options) {
    CSemitones tones;
    if (options.mMayOmitTones) tones = OmittableTones(semitones);
    // Somebody else plays the root, or there is no string for it.
    const bool isCrowded = options.mMayOmitTones && (semitones - tones).size() > strings;
    if (semitones.size() > 2 && (options.mMayOmitRoot || isCrowded)) tones.AddIntvl(kRootTone);
    return tones;
}

}  // namespace

std::vector<CFingering> FindFingerings(const CChordLite& chord, const GChShortTuning& tuning,
                                       const CFingeringOptions& options) {
    const int strings = GChNumberOfStringsInShortTuning(tuning);
    if (chord.IsUndef() || chord.mSemitones.IsEmpty() || !GChIsValidShortTuning(tuning) ||
        strings > kFingeringMostStrings) {
        return {};
    }
    const int root = FoldIntoOctave(chord.mRootKeyEnh.mKeyNr);
    const bool hasBass = chord.IsSlashChord();
    CFingeringTask task;
    task.mTuning = tuning;
    task.mStrings = strings;
    task.mCapo = std::clamp(options.mCapo, 0, kMostCapo);
    task.mRoot = root;
    task.mBass = hasBass ? FoldIntoOctave(chord.mBassKeyEnh.mKeyNr) : root;
    task.mSemitones = chord.mSemitones;
    task.mMayBeOmitted = MayBeOmitted(chord.mSemitones, strings, options);
    const bool isReentrant = IsReentrant(tuning);
    const bool isUsual = options.mBass == TFingeringBass::Usual;
    task.mBassIsRequired =
        options.mBass == TFingeringBass::Required || (isUsual && hasBass && !isReentrant);
    task.mBassCounts = options.mBass != TFingeringBass::Free && !(isUsual && isReentrant);
    task.mKeys = KeysOf(chord.mSemitones, root) | 1U << task.mBass;
    task.mNeededKeys = KeysOf(chord.mSemitones - task.mMayBeOmitted, root);
    if (hasBass) task.mNeededKeys |= 1U << task.mBass;
    task.mIsSymmetric = IsSymmetric(chord.mSemitones);
    task.mOptions = options;
    task.mOptions.mLimit = std::min(options.mLimit, kMostFingerings);
    std::vector<CFingering> found = SearchFingerings(task);
    std::sort(found.begin(), found.end(), IsBetterFingering);
    found.resize(std::min(task.mOptions.mLimit, found.size()));
    return found;
}

std::optional<CFingering> FingeringOfFrets(std::span<const int> frets, const GChShortTuning& tuning,
                                           int capo) {
    const int strings = GChNumberOfStringsInShortTuning(tuning);
    if (static_cast<int>(frets.size()) != strings || strings == 0) return std::nullopt;
    CFingering fingering;
    fingering.mTuning = tuning;
    fingering.mCapo = capo;
    fingering.mStringCount = strings;
    for (std::size_t i = 0; i < frets.size(); ++i) {
        const int fret = std::clamp(frets[i], kMutedString, kGChFrets);
        fingering.mFrets[i] = static_cast<std::int8_t>(fret);
    }
    const auto hand = HandOf(fingering.Frets());
    if (!hand) return std::nullopt;
    fingering.mFingers = hand->mPlaces;
    fingering.mFingerCount = hand->mCount;
    fingering.mDifficulty = DifficultyOf(*hand);
    return fingering;
}

}  // namespace brindle
