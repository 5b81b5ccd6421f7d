// SPDX-License-Identifier: MIT
#include "brindle/present/internal/ReadingNotes.h"

#include "brindle/present/ShownNames.h"
#include "brindle/present/internal/CChordsAround.h"
#include "brindle/present/internal/ReadingBars.h"
#include "brindle/theory/KeyIntervals.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <utility>

namespace brindle {
namespace {

constexpr std::size_t kMostPlaces = 6;
/// Chords between a dominant and its tonic in one cadence.
constexpr std::size_t kMostDelays = 4;
/// Dominants in a row that are worth a word.
constexpr std::size_t kShortestChain = 3;

/// What was noted, and all its places.
struct CTakenNote {
    std::string mText;
    std::vector<CTimeRange> mPlaces;
};

// Two chords of a bar are one place.
std::string PlacesText(const std::vector<CTimeRange>& places, const CBars& bars) {
    std::string text;
    std::string before;
    std::size_t count = 0;
    for (const CTimeRange& place : places) {
        std::string words = BarsOf(place, bars);
        if (words == before) continue;
        if (++count <= kMostPlaces) text += (count > 1 ? ", " : "") + words;
        before = std::move(words);
    }
    if (count > kMostPlaces) text += fmt::format(" and {} more", count - kMostPlaces);
    return text;
}

bool IsDominant(const CChordReading& reading) {
    return reading.mRelation == TChordRelation_Dominant ||
           reading.mRelation == TChordRelation_SubstituteDominant;
}

class CNoteTaker {
public:
    CNoteTaker(const CSong& song, const CSongReading& reading)
        : mSong(song), mReading(reading), mAround(song, reading) {}

    [[nodiscard]] std::vector<CTakenNote> TakeNotes() {
        for (std::size_t ix = 0; ix < mReading.mChords.size(); ++ix) {
            if (!mAround.HasChord(ix) || mAround.IsRepeated(ix)) continue;
            NoteSecond(ix);
            NoteChain(ix);
            NoteColor(ix);
        }
        return std::move(mNotes);
    }

private:
    [[nodiscard]] const CChordReading& At(std::ptrdiff_t ix) const {
        return mReading.mChords[static_cast<std::size_t>(ix)];
    }
    [[nodiscard]] std::string Symbol(std::size_t ix) const {
        return mAround.Symbol(static_cast<std::ptrdiff_t>(ix));
    }

    // From the bar of one chord to the bar in which another begins.
    void Note(std::string text, std::size_t first, std::size_t last) {
        constexpr double barely = 1e-6;
        const CTimeRange place{mSong.mChords[first].mPosition,
                               mSong.mChords[last].mPosition + barely};
        const auto [known, isNew] = mNumbers.try_emplace(text, mNotes.size());
        if (isNew) mNotes.push_back({std::move(text), {}});
        // Of Dm7 G7 Dm7 G7 C, all of which lead to C, the last ones are told.
        std::vector<CTimeRange>& places = mNotes[known->second].mPlaces;
        if (!places.empty() && places.back().mEnd == place.mEnd) places.pop_back();
        places.push_back(place);
    }

    // ii V I, of which the I may be missing or have the other third.
    void NoteSecond(std::size_t ix) {
        const CChordReading& second = mReading.mChords[ix];
        const std::ptrdiff_t dominant = second.mResolvesTo;
        if (second.mRelation != TChordRelation_RelatedSecond || dominant < 0) return;
        const CSignKeyLite key = ServedKey(second);
        const int up = mAround.Root(static_cast<std::ptrdiff_t>(ix)) - key.mRootKeyEnh.mKeyNr;
        if (!IsDominant(At(dominant)) || FoldIntoOctave(up) != 2) return;
        const bool isSubstitute = At(dominant).mRelation == TChordRelation_SubstituteDominant;
        std::string text = isSubstitute ? "ii subV" : "ii V";
        std::ptrdiff_t last = dominant;
        const std::ptrdiff_t goal = GoalOf(dominant);
        const bool arrives = goal >= 0 && !IsDominant(At(goal)) &&
                             mAround.Root(goal) == FoldIntoOctave(key.mRootKeyEnh.mKeyNr) &&
                             IsOneCadence(dominant, goal);
        const bool hasOtherThird = arrives && mAround.HasOtherThird(goal, key);
        if (arrives) last = goal;
        if (arrives && !hasOtherThird) {
            text += key.mSignKeyType == TSignKeyType_Minor ? " i" : " I";
        }
        text += " of " + KeyInWords(key);
        if (hasOtherThird) text += ", to " + mAround.Symbol(goal);
        Note(std::move(text), ix, static_cast<std::size_t>(last));
    }

    // Behind the other forms of the dominant: of G7sus4 in G7sus4 G7 C that is C.
    [[nodiscard]] std::ptrdiff_t GoalOf(std::ptrdiff_t dominant) const {
        std::ptrdiff_t goal = At(dominant).mResolvesTo;
        for (std::size_t count = 0; count < kMostDelays; ++count) {
            const bool isForm =
                goal >= 0 && IsDominant(At(goal)) && At(goal).mServes == At(dominant).mServes;
            if (!isForm) break;
            goal = At(goal).mResolvesTo;
        }
        return goal;
    }

    // Whether all between a dominant and its goal is more of the same: Dm7 G7 or G7sus4. A tonic
    // that comes later, behind other chords, is not heard with it.
    [[nodiscard]] bool IsOneCadence(std::ptrdiff_t dominant, std::ptrdiff_t goal) const {
        std::ptrdiff_t between = dominant;
        for (std::size_t count = 0; count <= kMostDelays; ++count) {
            between = mAround.Next(static_cast<std::size_t>(between));
            if (between == goal) return true;
            const bool isSame =
                between >= 0 && At(between).mServes == At(dominant).mServes &&
                (IsDominant(At(between)) || At(between).mRelation == TChordRelation_RelatedSecond);
            if (!isSame) return false;
        }
        return false;
    }

    // E7 A7 D7 G7, without the G7 behind a G7sus4: told where it begins, so that each chord is
    // looked at once.
    void NoteChain(std::size_t ix) {
        if (ix < mChainEnd || !IsDominant(mReading.mChords[ix])) return;
        std::string text = Symbol(ix);
        std::size_t count = 1;
        std::size_t last = ix;
        bool hasSubstitutes = false;
        for (std::ptrdiff_t next = NextInChain(last); next >= 0; next = NextInChain(last)) {
            hasSubstitutes |= mReading.mChords[last].mRelation != TChordRelation_Dominant;
            last = static_cast<std::size_t>(next);
            if (++count <= 2 * kMostPlaces) text += ' ' + Symbol(last);
        }
        mChainEnd = last + 1;
        if (count < kShortestChain) return;
        if (count > 2 * kMostPlaces) text += " ...";
        text += ": each the dominant of the next";
        if (hasSubstitutes) text += ", or its substitute";
        Note(std::move(text), ix, last);
    }

    // A tonic ends a chain, also as the six-four chord of a cadence.
    [[nodiscard]] std::ptrdiff_t NextInChain(std::size_t ix) const {
        const std::ptrdiff_t next = mAround.Next(ix);
        if (next < 0 || mReading.mChords[ix].mResolvesTo != next) return kNoneAround;
        const int root = mAround.Root(next);
        const bool isTonic = root == mReading.mKey.mRootKeyEnh.mKeyNr ||
                             root == FoldIntoOctave(At(next).mKey.mRootKeyEnh.mKeyNr);
        const int up = FoldIntoOctave(root - mAround.Root(static_cast<std::ptrdiff_t>(ix)));
        const bool isLedTo = up == 5 || up == 11;
        return IsDominant(At(next)) && !isTonic && isLedTo ? next : kNoneAround;
    }

    void NoteColor(std::size_t ix) {
        const CChordReading& chord = mReading.mChords[ix];
        if (chord.mDeceptive) {
            const std::ptrdiff_t next = mAround.Next(ix);
            Note("deceptive cadence to " + mAround.Symbol(next), ix,
                 next < 0 ? ix : static_cast<std::size_t>(next));
        }
        const std::string text = ColorOf(ix);
        if (!text.empty()) Note(Symbol(ix) + ' ' + text, ix, ix);
    }

    [[nodiscard]] std::string ColorOf(std::size_t ix) const {
        const CChordReading& chord = mReading.mChords[ix];
        const std::string key = KeyInWords(chord.mKey);
        switch (chord.mRelation) {
            case TChordRelation_Borrowed:
                return "is borrowed from " + ParallelName(chord.mKey);
            case TChordRelation_SubstituteDominant:
                return "is a substitute dominant, " + chord.mNumeral + " of " + key;
            case TChordRelation_Backdoor:
                return chord.mFunction == THarmFunction_Dominant
                           ? "is the backdoor dominant of " + key
                           : std::string();
            case TChordRelation_Neapolitan:
                return (mAround.IsNeapolitanSixth(ix) ? "is the Neapolitan sixth of "
                                                      : "is the Neapolitan chord of ") +
                       key;
            case TChordRelation_AugmentedSixth:
                return SixthName(mAround.SixthChord(ix)) + " of " + KeyInWords(ServedKey(chord));
            case TChordRelation_Blues:
                return "has the seventh of the blues";
            default:
                return {};
        }
    }

    [[nodiscard]] static std::string SixthName(TSixthChord chord) {
        switch (chord) {
            case TSixthChord_German:
                return "is the German sixth";
            case TSixthChord_Italian:
                return "is the Italian sixth";
            case TSixthChord_French:
                return "is the French sixth";
        }
        return {};
    }

    [[nodiscard]] static std::string ParallelName(CSignKeyLite key) {
        const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
        key.mSignKeyType = isMinor ? TSignKeyType_Major : TSignKeyType_Minor;
        return KeyInWords(key);
    }

    const CSong& mSong;
    const CSongReading& mReading;
    CChordsAround mAround;
    std::vector<CTakenNote> mNotes;
    std::map<std::string, std::size_t> mNumbers;
    std::size_t mChainEnd = 0;
};

bool SoundsAlike(const CSignKeyLite& a, const CSignKeyLite& b) {
    return a.mRootKeyEnh.mKeyNr == b.mRootKeyEnh.mKeyNr && a.mSignKeyType == b.mSignKeyType;
}

}  // namespace

std::vector<std::string> ReadingNotes(const CSong& song, const CSongReading& reading,
                                      const CBars& bars) {
    std::vector<std::string> lines;
    for (const CTakenNote& note : CNoteTaker(song, reading).TakeNotes()) {
        lines.push_back(PlacesText(note.mPlaces, bars) + ": " + note.mText);
    }
    return lines;
}

std::vector<std::string> KeyContradictions(const CSong& song, const CSongReading& reading) {
    std::vector<std::string> lines;
    if (reading.mKey.IsUndef()) return lines;
    const CSignKeyLite found = FindKeys(song.mChords, {.mBeatsPerBar = song.mBeatsPerBar}).mKey;
    const std::string read = KeyInWords(reading.mKey);
    const std::string shown = KeyInWords(found);
    const bool isFound = SoundsAlike(found, reading.mKey);
    const bool isHeard = std::any_of(
        reading.mRegions.begin(), reading.mRegions.end(),
        [&](const CKeyRegion& region) { return SoundsAlike(region.mKey, reading.mKey); });
    if (!isHeard) {
        lines.push_back(
            fmt::format("No passage is heard in {} itself, only in keys around it.", read));
    }
    const bool isStated = song.mStatedKey && !song.mStatedKey->IsUndef();
    if (isStated && !SoundsAlike(*song.mStatedKey, reading.mKey)) {
        lines.push_back(fmt::format("The stated key is {}, but the chords show {}.",
                                    KeyInWords(*song.mStatedKey), read));
    }
    if (isFound) return lines;
    if (isStated && SoundsAlike(*song.mStatedKey, reading.mKey)) {
        lines.push_back(
            fmt::format("{} is the stated key; the chords alone would show {}.", read, shown));
    } else {
        lines.push_back(fmt::format(
            "Counted one by one the chords are in {}; what they circle around makes it {}.", shown,
            read));
    }
    return lines;
}

}  // namespace brindle
