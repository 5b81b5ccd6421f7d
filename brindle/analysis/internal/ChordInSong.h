// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/analysis/internal/KeyNumbers.h"
#include "brindle/analysis/internal/SongKeys.h"
#include "brindle/analysis/internal/SongTraits.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace brindle {

inline constexpr std::ptrdiff_t kNoChord = -1;

/// A song while its chords are named, from the last to the first.
struct CSongToName {
    std::span<const CKeyChord> mChords;
    std::span<const std::uint8_t> mKeys;
    std::span<const TSeventhSpelling> mSevenths;
    CSongTraits mTraits;
    const CKeySpeller& mSpeller;
    /// The chord that each is led to: by a rule, and before that the one that it stands under. A
    /// chord may resolve nowhere and be led all the same.
    std::span<std::ptrdiff_t> mTargets;
    /// By places in the list. Those of the later chords are done.
    std::span<CChordReading> mReadings;

    [[nodiscard]] CChordReading& ReadingOf(std::size_t ix) const {
        return mReadings[mChords[ix].mBegin];
    }
    /// The place in the list of a chord that is heard; -1 for none.
    [[nodiscard]] std::ptrdiff_t PlaceOf(std::ptrdiff_t ix) const {
        if (ix < 0) return kNoChord;
        return static_cast<std::ptrdiff_t>(mChords[static_cast<std::size_t>(ix)].mBegin);
    }
};

/// A chord to be named, with what its rules ask for. Degrees are semitones above the tonic of its
/// key, also those of other chords; -1 where there is no chord.
class CChordInSong {
public:
    CChordInSong(const CSongToName& song, std::size_t ix);

    [[nodiscard]] const CKeyChord& Chord() const { return mChord; }
    [[nodiscard]] TKeyChordClass Class() const { return mChord.mClass; }
    [[nodiscard]] bool Is(TKeyChordClass chordClass) const { return mChord.mClass == chordClass; }
    [[nodiscard]] bool Has(int intvl) const { return mChord.Has(intvl); }
    [[nodiscard]] int Key() const { return mKey; }
    [[nodiscard]] bool IsInMajor() const { return !IsMinorKey(mKey); }
    [[nodiscard]] bool IsAtHome() const { return mKey == mSong.mTraits.mHome; }
    [[nodiscard]] const CSongTraits& Traits() const { return mSong.mTraits; }
    [[nodiscard]] TSeventhSpelling Seventh() const { return mSong.mSevenths[Ix()]; }

    [[nodiscard]] int Degree() const { return mDegree; }
    [[nodiscard]] int BassDegree() const { return DegreeInKey(mChord.mBass, mKey); }
    [[nodiscard]] int DegreeOf(std::ptrdiff_t ix) const {
        return ix < 0 ? -1 : DegreeInKey(ChordAt(ix).mRoot, mKey);
    }
    [[nodiscard]] bool IsDiatonic() const { return IsInScale(mChord, mDegree, ScaleOfKey(mKey)); }
    [[nodiscard]] bool IsInParallelScale() const {
        return IsInScale(mChord, mDegree, ParallelScaleOfKey(mKey));
    }
    [[nodiscard]] bool IsDegreeOfScale(int degree) const {
        return ScaleOfKey(mKey).HasIntvl(FoldIntoOctave(degree));
    }

    [[nodiscard]] std::ptrdiff_t Index() const { return mIx; }
    [[nodiscard]] std::ptrdiff_t Next() const { return mNext; }
    [[nodiscard]] std::ptrdiff_t Previous() const { return mIx - 1; }
    [[nodiscard]] bool HasNext() const { return mNext >= 0; }
    [[nodiscard]] bool HasPrevious() const { return mIx > 0; }
    [[nodiscard]] std::size_t Count() const { return mSong.mChords.size(); }
    [[nodiscard]] const CKeyChord& ChordAt(std::ptrdiff_t ix) const {
        return mSong.mChords[static_cast<std::size_t>(ix)];
    }
    [[nodiscard]] const CChordReading& ReadingAt(std::ptrdiff_t ix) const {
        return mSong.ReadingOf(static_cast<std::size_t>(ix));
    }
    [[nodiscard]] int KeyAt(std::ptrdiff_t ix) const {
        return mSong.mKeys[static_cast<std::size_t>(ix)];
    }
    [[nodiscard]] std::ptrdiff_t TargetOf(std::ptrdiff_t ix) const {
        return mSong.mTargets[static_cast<std::size_t>(ix)];
    }
    /// The chord that it stands under, or that a rule has led it to.
    [[nodiscard]] std::ptrdiff_t Target() const { return TargetOf(mIx); }
    [[nodiscard]] int DegreeBehind() const { return mDegreeBehind; }

    /// The degree that a chord stands for: V for a tonic six-four chord, else that of its root.
    [[nodiscard]] int EffectiveDegree(std::ptrdiff_t ix) const;
    /// The same for the next chord.
    [[nodiscard]] int NextEffectiveDegree() const { return mNextEffectiveDegree; }
    /// How far the effective root of the next chord lies above the root, -1 without a next one.
    [[nodiscard]] int UpToNext() const { return mUpToNext; }
    /// How far the root lies above another one.
    [[nodiscard]] int UpFrom(const CKeyChord& other) const {
        return DegreeInKey(mChord.mRoot, other.mRoot);
    }

    /// The chord so many semitones up that this one leads to: the next, or the one that the next
    /// leads to.
    [[nodiscard]] std::ptrdiff_t Goal(int up) const;
    /// Behind its own second, Dm7 G7.
    [[nodiscard]] bool IsPrepared() const;

private:
    [[nodiscard]] std::size_t Ix() const { return static_cast<std::size_t>(mIx); }
    [[nodiscard]] bool IsHeardThrough(std::ptrdiff_t goal) const;

    const CSongToName& mSong;
    std::ptrdiff_t mIx;
    const CKeyChord& mChord;
    int mKey;
    int mDegree;
    std::ptrdiff_t mNext;
    int mDegreeBehind;
    int mNextEffectiveDegree = -1;
    int mUpToNext = -1;
};

}  // namespace brindle
