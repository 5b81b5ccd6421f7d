// SPDX-License-Identifier: MIT
#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"

#include "brindle/analysis/ModalCenters.h"
#include "brindle/analysis/ProgressionFinder.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <iterator>

namespace brindle {

// Each match of a progression grows over the neighbouring chords that its center tolerates, and
// in a piece that stays in one key every match grows over all of it. So growing chord by chord
// would cost the square of the length. There are only 24 centers (and one without a scale), so two
// walks over the chords find all ranges: the first one, from the front, knows for each center where
// the present run of tolerated chords began, which is where a match that starts here begins; the
// second, from the back, knows for each center the next chord that it does not tolerate, which is
// where a match that ends here ends. Each walk costs a step per chord and center that breaks off.

namespace {

using ModalCenters::TCenters;

bool HasOneDifferentNonUndefChord(const CHarmAnlsChords& chords) {
    const auto isReal = [](const CChordLite& chord) { return !chord.IsUndef(); };
    const auto first = std::find_if(chords.begin(), chords.end(), isReal);
    return first != chords.end() &&
           std::all_of(first, chords.end(), [&](const CHarmAnlsChord& chord) {
               return chord.IsUndef() || !(*first < chord || chord < *first);
           });
}

/// For each center a place in the chord list, moved by every chord that the center does not
/// tolerate.
class CPlaceForEachCenter {
public:
    explicit CPlaceForEachCenter(std::size_t start) { mPlaces.fill(start); }

    void MoveOthers(TCenters tolerating, std::size_t place) {
        for (std::size_t center = 0; center < mPlaces.size(); ++center) {
            if ((tolerating >> center & 1) == 0) mPlaces[center] = place;
        }
    }
    [[nodiscard]] std::size_t Of(const CHarmCenterLite& center) const {
        return mPlaces[static_cast<std::size_t>(ModalCenters::PlaceOf(center))];
    }

private:
    std::array<std::size_t, ModalCenters::kCount> mPlaces{};
};

/// The readings whose ranges end at a chord before they grow, for each chord.
class CReadingsByEnd {
public:
    explicit CReadingsByEnd(std::size_t chordCount) : mLastAtEnd(chordCount + 1, kNone) {}

    /// Adds the next reading.
    void Append(std::size_t end) {
        mPrevious.push_back(mLastAtEnd[end]);
        mLastAtEnd[end] = mPrevious.size() - 1;
    }
    template <class Visit>
    void ForEachAt(std::size_t end, Visit visit) const {
        for (std::size_t n = mLastAtEnd[end]; n != kNone; n = mPrevious[n]) visit(n);
    }

private:
    static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

    std::vector<std::size_t> mLastAtEnd;
    std::vector<std::size_t> mPrevious;
};

/// The two walks over a list that has chords.
class CSweeps {
public:
    CSweeps(const CHarmAnlsChords& chords, CHarmAnlsCenterAlternatives& alternatives)
        : mChords(chords),
          mAlternatives(alternatives),
          mTolerating(chords.size()),
          mReadings(chords.size()) {}

    /// From the front: adds all readings, grown over the chords before their match.
    void FindReadings(const CHarmAnlsProgressions& progressions) {
        CProgressionFinder finder(progressions, mChords);
        CPlaceForEachCenter runBegin(0);
        for (std::size_t n = 0; n < mChords.size(); ++n) {
            const auto bestRows = finder.BestRowsAt(n);
            const double probability = 1.0 / static_cast<double>(bestRows.size());
            for (const CHarmAnlsProgression* row : bestRows) {
                AddReading(*row, n, probability, runBegin);
            }
            mTolerating[n] = ModalCenters::CentersTolerating(mChords[n]);
            runBegin.MoveOthers(mTolerating[n], n + 1);
        }
    }

    /// From the back: grows the readings over the chords behind their match. The last chord of the
    /// list, as a rule the end marker, is never taken in.
    void GrowToTheirEnds() {
        CPlaceForEachCenter nextBreak(mChords.size() - 1);
        for (std::size_t n = mChords.size() - 1; n-- > 0;) {
            nextBreak.MoveOthers(mTolerating[n], n);
            mReadings.ForEachAt(n, [&](std::size_t reading) {
                CHarmAnlsCenterInChords& center = mAlternatives[reading].mCenters.front();
                center.mEnd = At(nextBreak.Of(center.mCenter));
            });
        }
    }

private:
    [[nodiscard]] CHarmAnlsChords::const_iterator At(std::size_t n) const {
        return mChords.cbegin() + static_cast<std::ptrdiff_t>(n);
    }
    void AddReading(const CHarmAnlsProgression& row, std::size_t n, double probability,
                    const CPlaceForEachCenter& runBegin) {
        const CHarmCenterLite center =
            row.HarmCenterCalculatedFromFoundProgressionLastChord(At(n), mChords);
        const std::size_t end = n + row.size();
        mAlternatives.push_back({probability, {{center, At(runBegin.Of(center)), At(end)}}});
        mReadings.Append(end);
    }

    const CHarmAnlsChords& mChords;
    CHarmAnlsCenterAlternatives& mAlternatives;
    std::vector<TCenters> mTolerating;
    CReadingsByEnd mReadings;
};

}  // namespace

CAnalyseHarmCenterAlternatives::CAnalyseHarmCenterAlternatives(const CHarmAnlsChords& chords)
    : mChords(chords), mProgressions(CHarmAnlsProgressions::TonicProgressions()) {
    AnalyseResult();
}

void CAnalyseHarmCenterAlternatives::AnalyseResult() {
    mAlternatives.clear();
    if (HasOneDifferentNonUndefChord(mChords)) {
        _AnalyseSingleChord();
    } else {
        _AnalyseSeveralChords();
    }
    mAlternatives.RemoveShorterContainedAlternatives();
    mAlternatives.Deduplication();
    mAlternatives.RemoveNonSureAlternativesWithSameRangeAsSureAlternative();
}

CHarmAnlsCenters CAnalyseHarmCenterAlternatives::BestResults() const {
    CHarmAnlsCenters centers;
    centers.reserve(mAlternatives.size());
    for (const CHarmAnlsCenterAlternative& alternative : mAlternatives) {
        _StoreAlternativeInResult(alternative, centers);
    }
    return centers;
}

void CAnalyseHarmCenterAlternatives::_StoreAlternativeInResult(
    const CHarmAnlsCenterAlternative& alternative, CHarmAnlsCenters& centers) const {
    for (const CHarmAnlsCenterInChords& center : alternative.mCenters) {
        centers.push_back(center.ToHarmAnlsCenter(mChords));
        centers.back().mProbability = alternative.mProbability;
    }
}

void CAnalyseHarmCenterAlternatives::_AnalyseSingleChord() {
    const auto chord = mChords.cbegin();
    const bool isMinor = ChordPattern::Minor.Matches(chord->mSemitones) ||
                         ChordPattern::Diminished.Matches(chord->mSemitones);
    const CHarmCenterLite center(chord->mRootKeyEnh,
                                 isMinor ? kSemitonesNaturalMinor : kSemitonesMajor);
    mAlternatives.push_back({1.0, {{center, chord, std::next(chord)}}});
}

void CAnalyseHarmCenterAlternatives::_AnalyseSeveralChords() {
    if (mChords.empty()) return;
    CSweeps sweeps(mChords, mAlternatives);
    sweeps.FindReadings(mProgressions);
    sweeps.GrowToTheirEnds();
}

}  // namespace brindle
