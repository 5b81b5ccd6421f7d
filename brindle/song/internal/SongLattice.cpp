// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongLattice.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr std::uint64_t kMinorSeventh = 1U << 10U;
constexpr std::uint64_t kMajorThird = 1U << 4U;
constexpr std::uint64_t kTriadTones = 0b10011001;
constexpr std::uint64_t kThirds = 0b11000;
// A chord that never ended a part in the songs may still end one.
constexpr double kRareEnd = 1e-3;
// What was heard so often or less says little about how often it ends a part.
constexpr double kFewTimes = 10.0;
// Somebody may wish for a first part that comes to rest.
constexpr double kRestInOpenPart = 1e-6;

/// Whether a song comes to rest on the chord: a triad, with a sixth or a major seventh or a ninth.
bool IsAtRest(std::uint64_t mask) {
    return std::popcount(mask & kTriadTones) == 3 && std::popcount(mask & kThirds) == 1;
}

bool IsDominant(std::uint64_t mask) {
    return (mask & kMajorThird) != 0 && (mask & kMinorSeventh) != 0;
}

}  // namespace

CSongLattice::CSongLattice(const CSongModel& model, const CSongStretch& stretch)
    : mModel(model),
      mStretch(stretch),
      mCandidates(model, stretch),
      mLengths(model, stretch.mBeatsPerBar) {
    FindAllowed();
    CountProgress();
    const std::size_t beats = stretch.mBeats;
    const std::size_t size = mCandidates.SlotCount() * mProgressCount;
    mBegins.assign(beats, std::vector<double>(size));
    mEnds.assign(beats + 1, std::vector<double>(size));
    mScales.assign(beats + 1, 0.0);
    SumEnd();
    for (std::size_t beat = beats; beat-- > 0;) {
        SumBegins(beat);
        SumSteps(beat);
    }
}

void CSongLattice::FindAllowed() {
    const std::size_t slots = mCandidates.SlotCount();
    std::vector<std::uint8_t> free(slots, 1);
    for (std::size_t slot = 0; slot < slots; ++slot) {
        for (const CWishedChord& never : mStretch.mNever) {
            if (mCandidates.Fits(slot, never)) free[slot] = 0;
        }
    }
    mAllowed = {free};
    mAllowedRow.assign(mStretch.mBeats, 0);
    for (std::size_t beat = 0; beat < mStretch.mBeats; ++beat) {
        if (beat >= mStretch.mWishes.size() || mStretch.mWishes[beat].empty()) continue;
        std::vector<std::uint8_t> row = free;
        for (std::size_t slot = 0; slot < slots; ++slot) {
            for (const CWishedChord& wish : mStretch.mWishes[beat]) {
                if (row[slot] != 0 && !mCandidates.Fits(slot, wish)) row[slot] = 0;
            }
        }
        mAllowedRow[beat] = mAllowed.size();
        mAllowed.push_back(std::move(row));
    }
}

void CSongLattice::CountProgress() {
    for (const auto& row : mStretch.mContains) mProgressCount *= row.size() + 1;
    const std::size_t slots = mCandidates.SlotCount();
    mNextProgress.resize(mProgressCount * slots);
    for (std::size_t progress = 0; progress < mProgressCount; ++progress) {
        for (std::size_t slot = 0; slot < slots; ++slot) {
            mNextProgress[progress * slots + slot] = NextProgress(progress, slot);
        }
    }
}

/// How many chords of each row were met: the digits of a number.
std::size_t CSongLattice::NextProgress(std::size_t progress, std::size_t slot) const {
    std::size_t next = 0;
    std::size_t unit = 1;
    for (const auto& row : mStretch.mContains) {
        std::size_t met = progress % (row.size() + 1);
        progress /= row.size() + 1;
        if (met < row.size()) {
            const bool goesOn = mCandidates.Fits(slot, row[met]);
            met = goesOn ? met + 1 : mCandidates.Fits(slot, row[0]) ? 1 : 0;
        }
        next += met * unit;
        unit *= row.size() + 1;
    }
    return next;
}

TBarPlace CSongLattice::PlaceAt(std::size_t beat) const {
    const auto place = static_cast<std::int32_t>(mStretch.mFirstBeat + beat);
    return BarPlaceOf(place * kTicksPerBar / mStretch.mBeatsPerBar);
}

/// Whether a song may end on it: a chord on the tonic, which in minor may be major. One with a
/// minor seventh is at rest only where somebody wishes for it or songs end on it, as in a blues.
bool CSongLattice::IsFinal(const CSongCandidates::CCandidate& candidate) const {
    const CRelativeChord& chord = candidate.mChord;
    const bool isMinor = mStretch.mHome.mSignKeyType == TSignKeyType_Minor;
    const bool isTonic = chord.mRoot == 0 && chord.mBass == 0 && chord.mIsMinorKey == isMinor &&
                         IsAtRest(chord.mMask) && (isMinor || (chord.mMask & kMajorThird) != 0);
    if (!isTonic || !IsDominant(chord.mMask)) return isTonic;
    const bool isWished = !mStretch.mWishes.empty() && !mStretch.mWishes.back().empty();
    return isWished || (candidate.mId >= 0 && mModel.FinalCountOf(candidate.mId) > 0);
}

double CSongLattice::EndWeight(std::size_t slot) const {
    const CSongCandidates::CCandidate& candidate = mCandidates[slot / kTonicCount];
    const CRelativeChord& chord = candidate.mChord;
    const std::size_t tonic = slot % kTonicCount;
    // Parts end in the key of the song, so that any other can come behind.
    if (mStretch.mEndsSection && tonic != 0) return 0.0;
    double weight = 1.0;
    if (candidate.mId < 0) {
        weight = kRareEnd;
    } else if (mStretch.mEndsOnTonic || mStretch.mEndsSection) {
        const double ends = mStretch.mEndsOnTonic ? mModel.FinalCountOf(candidate.mId)
                                                  : mModel.EndCountOf(candidate.mId);
        weight = kRareEnd + ends / (mModel.CountOf(candidate.mId) + kFewTimes);
    }
    if (mStretch.mEndsOnTonic && !IsFinal(candidate)) return 0.0;
    // A seventh on the tonic leads on.
    const bool isTonic = tonic == 0 && chord.mRoot == 0 && !IsDominant(chord.mMask);
    if (mStretch.mStaysOpen && isTonic) weight *= kRestInOpenPart;
    if (mStretch.mBehind.empty()) return weight;
    const CWrittenChord& next = mStretch.mBehind.front();
    if (CSongCandidates::TonicAfter(tonic, next.mChord) != static_cast<std::size_t>(next.mTonic)) {
        return 0.0;
    }
    const std::ptrdiff_t to = mCandidates.IndexOf(next.mId);
    const bool isStep =
        to >= 0 && mCandidates.HasStep(slot / kTonicCount, static_cast<std::size_t>(to));
    return weight * (isStep ? 1.0 : 1e-4);
}

/// A song comes to rest on a strong beat, as often as songs do.
double CSongLattice::EndingWeight(std::size_t beat, std::size_t length) const {
    const bool isEnding = beat + length == mStretch.mBeats && mStretch.mEndsOnTonic;
    if (!isEnding) return 1.0;
    // Twice, since the limit of quotes takes the plain ends away that many songs have.
    const double ratio = mModel.RestRatioAt(PlaceAt(beat));
    return ratio * ratio;
}

void CSongLattice::SumEnd() {
    for (std::size_t slot = 0; slot < mCandidates.SlotCount(); ++slot) {
        mEnds.back()[slot * mProgressCount + mProgressCount - 1] = EndWeight(slot);
    }
}

double CSongLattice::FromWithLength(std::size_t beat, std::size_t slot, std::size_t progress,
                                    std::size_t length) const {
    if (beat + length > mStretch.mBeats) return 0.0;
    for (std::size_t at = beat; at < beat + length; ++at) {
        if (!IsAllowed(at, slot)) return 0.0;
    }
    return EndingWeight(beat, length) * mEnds[beat + length][slot * mProgressCount + progress] *
           std::exp(mScales[beat + length] - mScales[beat]);
}

/// From the ends of chords to their begins on `beat`.
void CSongLattice::SumBegins(std::size_t beat) {
    const std::vector<double> weights = mLengths.WeightsAt(BeatInBar(beat), 0);
    const std::size_t longest = std::min(weights.size(), mStretch.mBeats - beat);
    double base = mScales[beat + 1];
    for (std::size_t length = 2; length <= longest; ++length) {
        base = std::max(base, mScales[beat + length]);
    }
    std::vector<double>& begins = mBegins[beat];
    for (std::size_t length = 1; length <= longest; ++length) {
        const double factor = weights[length - 1] * EndingWeight(beat, length) *
                              std::exp(mScales[beat + length] - base);
        const std::vector<double>& ends = mEnds[beat + length];
        for (std::size_t slot = 0; slot < mCandidates.SlotCount(); ++slot) {
            bool isAllowed = true;
            for (std::size_t at = beat; isAllowed && at < beat + length; ++at) {
                isAllowed = IsAllowed(at, slot);
            }
            if (!isAllowed) continue;
            const std::size_t first = slot * mProgressCount;
            for (std::size_t progress = 0; progress < mProgressCount; ++progress) {
                begins[first + progress] += factor * ends[first + progress];
            }
        }
    }
    const double largest = *std::max_element(begins.begin(), begins.end());
    mScales[beat] = base;
    if (largest == 0.0) return;
    for (double& sum : begins) sum /= largest;
    mScales[beat] += std::log(largest);
}

/// From the begins of chords on `beat` to the ends of the chords before them.
void CSongLattice::SumSteps(std::size_t beat) {
    if (beat == 0) return;
    const TBarPlace place = PlaceAt(beat);
    const auto from = [&](std::size_t to, std::size_t tonic, std::size_t progress) {
        const std::size_t slot =
            to * kTonicCount + CSongCandidates::TonicAfter(tonic, mCandidates[to].mChord);
        return From(beat, slot, ProgressWith(progress, slot));
    };
    for (std::size_t tonic = 0; tonic < kTonicCount; ++tonic) {
        for (std::size_t progress = 0; progress < mProgressCount; ++progress) {
            // A step to any chord, which is the same sum for all.
            double any = 0.0;
            for (std::size_t to = 0; to < mCandidates.size(); ++to) {
                any += mCandidates.Alone(to, place) * from(to, tonic, progress);
            }
            for (std::size_t index = 0; index < mCandidates.size(); ++index) {
                double sum = any;
                for (const CSongCandidates::CStep& step : mCandidates.StepsFrom(index)) {
                    sum +=
                        static_cast<double>(step.mWeights[place]) * from(step.mTo, tonic, progress);
                }
                mEnds[beat][(index * kTonicCount + tonic) * mProgressCount + progress] = sum;
            }
        }
    }
}

bool CSongLattice::IsPossible() const {
    const std::size_t tonic = TonicBefore();
    for (std::size_t to = 0; to < mCandidates.size(); ++to) {
        const std::size_t slot =
            to * kTonicCount + CSongCandidates::TonicAfter(tonic, mCandidates[to].mChord);
        if (From(0, slot, ProgressWith(0, slot)) > 0.0) return true;
    }
    return false;
}

std::size_t CSongLattice::TonicBefore() const {
    return mStretch.mBefore.empty() ? 0 : static_cast<std::size_t>(mStretch.mBefore.back().mTonic);
}

}  // namespace brindle
