// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/FindFingerings.h"

#include "brindle/guitarchords/Tunings.h"
#include "brindle/guitarchords/internal/FingeringCost.h"
#include "brindle/guitarchords/internal/FingeringSearch.h"
#include "brindle/guitarchords/internal/HandOf.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr int kRootTone = 0;
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

bool IsSearchable(const CChordLite& chord, const GChShortTuning& tuning) {
    return !chord.IsUndef() && !chord.mSemitones.IsEmpty() && GChIsValidShortTuning(tuning) &&
           GChNumberOfStringsInShortTuning(tuning) <= kFingeringMostStrings;
}

CFingeringTask TaskOf(const CChordLite& chord, const GChShortTuning& tuning,
                      const CFingeringOptions& options) {
    const int root = FoldIntoOctave(chord.mRootKeyEnh.mKeyNr);
    const bool hasBass = chord.IsSlashChord();
    CFingeringTask task;
    task.mTuning = tuning;
    task.mStrings = GChNumberOfStringsInShortTuning(tuning);
    task.mHasShortString = HasShortString(tuning);
    task.mCapo = std::clamp(options.mCapo, 0, kFingeringMostFrets);
    task.mRoot = root;
    task.mBass = hasBass ? FoldIntoOctave(chord.mBassKeyEnh.mKeyNr) : root;
    task.mSemitones = chord.mSemitones;
    task.mMayBeOmitted = MayBeOmitted(chord.mSemitones, task.mStrings, options);
    const bool isUsual = options.mBass == TFingeringBass::Usual;
    task.mBassIsRequired =
        options.mBass == TFingeringBass::Required || (isUsual && hasBass && !IsReentrant(tuning));
    task.mBassCounts = options.mBass == TFingeringBass::Required || (isUsual && BearsBass(tuning));
    task.mKeys = KeysOf(chord.mSemitones, root) | 1U << task.mBass;
    task.mNeededKeys = KeysOf(chord.mSemitones - task.mMayBeOmitted, root);
    if (hasBass) task.mNeededKeys |= 1U << task.mBass;
    task.mIsSymmetric = IsSymmetric(chord.mSemitones);
    task.mOptions = options;
    task.mOptions.mLimit = std::min(options.mLimit, kMostFingerings);
    return task;
}

/// Frets without fingers.
std::optional<CFingering> Laid(std::span<const int> frets, const GChShortTuning& tuning, int capo) {
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
    return fingering;
}

}  // namespace

std::vector<CFingering> FindFingerings(const CChordLite& chord, const GChShortTuning& tuning,
                                       const CFingeringOptions& options) {
    if (!IsSearchable(chord, tuning)) return {};
    const CFingeringTask task = TaskOf(chord, tuning, options);
    std::vector<CFingering> found = SearchFingerings(task);
    std::sort(found.begin(), found.end(), IsBetterFingering);
    found.resize(std::min(task.mOptions.mLimit, found.size()));
    return found;
}

std::optional<CFingering> FingeringOfFrets(std::span<const int> frets, const GChShortTuning& tuning,
                                           int capo) {
    auto fingering = Laid(frets, tuning, capo);
    const auto hand = fingering ? HandOf(fingering->Frets()) : std::nullopt;
    if (!hand) return std::nullopt;
    SetHand(*fingering, *hand);
    return fingering;
}

std::optional<CFingering> FingeringForChord(std::span<const int> frets, const CChordLite& chord,
                                            const GChShortTuning& tuning,
                                            const CFingeringOptions& options) {
    if (!IsSearchable(chord, tuning)) return std::nullopt;
    const CFingeringTask task = TaskOf(chord, tuning, options);
    auto fingering = Laid(frets, tuning, task.mCapo);
    if (!fingering || !SetSound(*fingering, task)) return std::nullopt;
    const auto hand = HandOf(fingering->Frets());
    if (!hand) return std::nullopt;
    SetHand(*fingering, *hand);
    fingering->mCost = CostOfSoundAndPlace(*fingering, task) + CostOfHand(*hand);
    return fingering;
}

}  // namespace brindle
