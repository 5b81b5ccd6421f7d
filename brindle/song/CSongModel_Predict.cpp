// SPDX-License-Identifier: MIT
#include "brindle/song/CSongModel.h"

#include <algorithm>

namespace brindle {
namespace {

// How much the level below counts for each chord that followed. Songs that were left out need the
// fewest bits with 8 among 2, 4, 8 and 16, the built-in ones as well as other lead sheets.
constexpr double kNewChords = 8.0;
constexpr double kRoots = 12.0;
constexpr double kKinds = 4096.0 * 12.0;
constexpr double kKeySteps = 24.0;

// What is counted of chords, as tags above the numbers of `mKindCounts`.
constexpr std::uint32_t kKindTag = 1U << 28U;
constexpr std::uint32_t kRootTag = 2U << 28U;
constexpr std::uint32_t kInKeyTag = 3U << 28U;
// Of each mode, how many chords there are, and how many different ones and roots.
constexpr std::uint32_t kTotalTag = 4U << 28U;
constexpr std::uint32_t kInKeyTypesTag = 5U << 28U;
constexpr std::uint32_t kRootTypesTag = 6U << 28U;
constexpr std::uint32_t kKindTypesTag = 7U << 28U;

std::uint32_t KindOf(const CRelativeChord& chord) {
    return kKindTag | (chord.Code() & 0xFFFFU);
}
std::uint32_t ModeOf(const CRelativeChord& chord) {
    return chord.mIsMinorKey ? 1U : 0U;
}
std::uint32_t RootOf(const CRelativeChord& chord) {
    return kRootTag | ModeOf(chord) << 4U | chord.mRoot;
}
std::uint32_t InKeyOf(const CRelativeChord& chord) {
    return kInKeyTag | (chord.Code() & 0x10FFFFFU);
}
std::uint32_t KeyStepOf(const CRelativeChord& chord) {
    return chord.Code() >> 20U;
}

double CountIn(const std::unordered_map<std::uint32_t, std::uint32_t>& counts,
               std::uint32_t value) {
    const auto found = counts.find(value);
    return found == counts.end() ? 0.0 : found->second;
}

/// A count among others, and what there was before anything was counted.
double Smoothed(double count, double total, double types, double before) {
    return total + types > 0.0 ? (count + types * before) / (total + types) : before;
}

/// Mixes the shares of `size` chords into the probabilities of shorter histories.
template <typename TIdOf, typename TShareOf>
void MixShares(std::size_t size, const TIdOf& idOf, const TShareOf& shareOf,
               std::vector<double>& probabilities) {
    double total = 0.0;
    double types = 0.0;
    for (std::size_t ix = 0; ix < size; ++ix) {
        total += shareOf(ix);
        types += shareOf(ix) > 0.0F ? 1.0 : 0.0;
    }
    if (total == 0.0) return;
    const double below = kNewChords * types;
    for (double& probability : probabilities) probability *= below / (total + below);
    for (std::size_t ix = 0; ix < size; ++ix) {
        probabilities[idOf(ix)] += shareOf(ix) / (total + below);
    }
}

}  // namespace

void CSongModel::CountKinds() {
    for (std::size_t id = 0; id < mVocabulary.size(); ++id) {
        const auto count = CountOf(static_cast<std::int32_t>(id));
        const CRelativeChord& chord = mVocabulary[id];
        const std::uint32_t mode = ModeOf(chord);
        mKindCounts[kTotalTag | mode] += count;
        mKeyCounts[KeyStepOf(chord)] += count;
        const auto add = [&](std::uint32_t value, std::uint32_t types) {
            std::uint32_t& known = mKindCounts[value];
            const bool isNew = known == 0;
            known += count;
            if (isNew) ++mKindCounts[types];
        };
        add(InKeyOf(chord), kInKeyTypesTag | mode);
        add(RootOf(chord), kRootTypesTag | mode);
        add(KindOf(chord), kKindTypesTag);
    }
}

/// Of a chord by its place in its key, or by its root and its tones alone if it was never there,
/// and of the step from key to key.
double CSongModel::KindProbability(const CRelativeChord& chord) const {
    const auto all = static_cast<double>(mByHistory.size());
    const std::uint32_t mode = ModeOf(chord);
    const double total = CountIn(mKindCounts, kTotalTag | mode);
    const double kind = Smoothed(CountIn(mKindCounts, KindOf(chord)), all,
                                 CountIn(mKindCounts, kKindTypesTag), 1.0 / kKinds);
    const double root = Smoothed(CountIn(mKindCounts, RootOf(chord)), total,
                                 CountIn(mKindCounts, kRootTypesTag | mode), 1.0 / kRoots);
    const double inKey = Smoothed(CountIn(mKindCounts, InKeyOf(chord)), total,
                                  CountIn(mKindCounts, kInKeyTypesTag | mode), root * kind);
    const double step = Smoothed(CountIn(mKeyCounts, KeyStepOf(chord)), all,
                                 static_cast<double>(mKeyCounts.size()), 1.0 / kKeySteps);
    return step * inKey;
}

bool CSongModel::HasBothModes() const {
    const auto hasAny = [](const std::vector<CSongShares>& shares) {
        return std::any_of(shares.begin(), shares.end(),
                           [](const CSongShares& of) { return of.mAll > 0.0F; });
    };
    return hasAny(mModeShares[0]) && hasAny(mModeShares[1]);
}

/// How common each chord is behind a chord in a mode, at such a place of the bar.
void CSongModel::PredictAlone() {
    std::vector<double> kinds;
    for (const CRelativeChord& chord : mVocabulary) kinds.push_back(KindProbability(chord));
    const auto idOf = [](std::size_t ix) { return ix; };
    // What is common in songs of one mode is said by that mode, and not twice.
    if (HasBothModes()) {
        MixShares(
            kinds.size(), idOf, [&](std::size_t id) { return mChordShares[id].mAll; }, kinds);
    }
    for (std::size_t mode = 0; mode < mAlone.size(); ++mode) {
        const std::vector<CSongShares>& shares = mModeShares[mode];
        std::vector<double> inMode = kinds;
        MixShares(
            kinds.size(), idOf, [&](std::size_t id) { return shares[id].mAll; }, inMode);
        for (std::size_t place = 0; place < kBarPlaceCount; ++place) {
            mAlone[mode][place] = inMode;
            MixShares(
                kinds.size(), idOf, [&](std::size_t id) { return shares[id].mAt[place]; },
                mAlone[mode][place]);
        }
    }
}

/// What followed one chord, and then what followed it at such a place.
void CSongModel::MixNearest(std::int32_t id, TBarPlace barPlace,
                            std::vector<double>& probabilities) const {
    const std::span<const CSuccessor> successors = SuccessorsOf(id);
    const auto idOf = [&](std::size_t ix) { return static_cast<std::size_t>(successors[ix].mId); };
    MixShares(
        successors.size(), idOf, [&](std::size_t ix) { return successors[ix].mShares.mAll; },
        probabilities);
    MixShares(
        successors.size(), idOf,
        [&](std::size_t ix) { return successors[ix].mShares.mAt[barPlace]; }, probabilities);
}

/// What followed a longer history; null for any place of the bar.
void CSongModel::MixRange(CRange range, const TBarPlace* barPlace,
                          std::vector<double>& probabilities) const {
    std::vector<float> shares(mVocabulary.size());
    std::vector<std::size_t> ids;
    for (std::size_t ix = range.mBegin; ix < range.mEnd; ++ix) {
        const CPlace& place = mPlaces[mByHistory[ix]];
        if (barPlace != nullptr && place.mBarPlace != *barPlace) continue;
        float& share = shares[static_cast<std::size_t>(place.mId)];
        if (share == 0.0F) ids.push_back(static_cast<std::size_t>(place.mId));
        share += mTripleShares[mByHistory[ix]];
    }
    MixShares(
        ids.size(), [&](std::size_t ix) { return ids[ix]; },
        [&](std::size_t ix) { return shares[ids[ix]]; }, probabilities);
}

void CSongModel::Predict(std::span<const std::int32_t> history, TBarPlace barPlace,
                         std::size_t order, std::vector<double>& probabilities) const {
    probabilities = mAlone[!history.empty() && IsInMinor(history.back())][barPlace];
    CRange range{0, mByHistory.size()};
    const std::size_t longest = std::min({order, history.size(), kLongestHistory});
    for (std::size_t back = 1; back <= longest; ++back) {
        const std::int32_t id = history[history.size() - back];
        // A chord that was never heard ends what is known of the history.
        if (id == UnknownId(false) || id == UnknownId(true)) return;
        range = Narrowed(range, id, back);
        if (range.mBegin == range.mEnd) return;
        if (back == 1) {
            MixNearest(id, barPlace, probabilities);
            continue;
        }
        MixRange(range, nullptr, probabilities);
        if (back == 2) MixRange(range, &barPlace, probabilities);
    }
}

double CSongModel::ProbabilityOf(const CRelativeChord& chord, std::span<const std::int32_t> history,
                                 TBarPlace barPlace, std::size_t order) const {
    std::vector<double> probabilities;
    Predict(history, barPlace, order, probabilities);
    const std::int32_t id = IdOf(chord);
    if (id >= 0) return probabilities[static_cast<std::size_t>(id)];
    // What the known chords leave over is shared by the others, each by its kind.
    double known = 0.0;
    double knownKinds = 0.0;
    for (std::size_t ix = 0; ix < probabilities.size(); ++ix) {
        known += probabilities[ix];
        knownKinds += KindProbability(mVocabulary[ix]);
    }
    return std::max(0.0, 1.0 - known) / std::max(1e-12, 1.0 - knownKinds) * KindProbability(chord);
}

}  // namespace brindle
