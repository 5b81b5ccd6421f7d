// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmCenterWeightAnalysis.h"

#include "brindle/analysis/ModalCenters.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/SignKeySigns.h"

#include <array>
#include <bit>
#include <cstddef>
#include <cstdlib>
#include <optional>
#include <ostream>
#include <span>

namespace brindle {

namespace {

using ModalCenters::kMinorOffset;
using ModalCenters::kTonalityCount;

/// From C major up to B major, then from C minor up to B minor: the places of ModalCenters, and
/// the order in which the keys compete.
using TWeights = std::array<double, kTonalityCount>;

CSignKeyLite SignKeyAt(std::size_t place) {
    constexpr TEnh enhs[] = {TEnh_n, TEnh_b, TEnh_n, TEnh_b, TEnh_n, TEnh_n,
                             TEnh_b, TEnh_n, TEnh_b, TEnh_n, TEnh_b, TEnh_n};
    const std::size_t keyNr = place % 12;
    return {{static_cast<int>(keyNr), enhs[keyNr]},
            place < kMinorOffset ? TSignKeyType_Major : TSignKeyType_Minor};
}

int SignsCountAbs(std::size_t place) {
    static const auto counts = [] {
        std::array<int, kTonalityCount> signs{};
        for (std::size_t n = 0; n < signs.size(); ++n) {
            const CSignKeyLite signKey = SignKeyAt(n);
            signs[n] = std::abs(SignsCountForSignKeyWithKeyEnhAndSignKeyType(signKey.mRootKeyEnh,
                                                                             signKey.mSignKeyType));
        }
        return signs;
    }();
    return counts[place];
}

/// Adds a chord to the keys that own it. The sums are those of single additions in the order of
/// the chords, since equal weights are told by exact comparison.
void AddChord(TWeights& weights, const CChordLite& chord, double length, bool isAtBorder) {
    const double bonus = 0.1 * length;
    auto owning = ModalCenters::CentersOwning(chord) & ((1u << kTonalityCount) - 1);
    for (; owning != 0; owning &= owning - 1) {
        const auto place = static_cast<std::size_t>(std::countr_zero(owning));
        double& weight = weights[place];
        weight += length;
        if (chord.mRootKeyEnh.mKeyNr != static_cast<int>(place % 12)) continue;
        weight += bonus;
        if (isAtBorder) weight += bonus;
    }
}

TWeights Weigh(const CHarmAnlsChords& chords) {
    TWeights weights{};
    for (std::size_t i = 0; i < chords.size(); ++i) {
        if (chords[i].IsUndef()) continue;
        const bool isLast = i + 1 == chords.size();
        const double length = isLast ? 1.0 : chords[i + 1].mPosition - chords[i].mPosition;
        AddChord(weights, chords[i], length, i == 0 || isLast);
    }
    return weights;
}

/// The place of the heaviest key, the first among equals.
std::optional<std::size_t> Heaviest(std::span<const double> weights, bool& isAmbiguous) {
    if (weights.empty()) return std::nullopt;
    std::size_t best = 0;
    isAmbiguous = false;
    for (std::size_t place = 1; place < weights.size(); ++place) {
        if (weights[place] > weights[best]) {
            best = place;
            isAmbiguous = false;
        } else if (weights[place] == weights[best] && SignsCountAbs(place) != SignsCountAbs(best)) {
            isAmbiguous = true;
        }
    }
    return best;
}

std::size_t CountOfKeysToWeigh(std::int32_t keysToWeigh) {
    if (keysToWeigh == 0) return kMinorOffset;
    return keysToWeigh == 1 ? kTonalityCount : 0;
}

}  // namespace

void CHarmCenterWeightAnalysis::DetectHarmCentersFromChords(const CHarmAnlsChords& chords,
                                                            CHarmAnlsCenters& centers) {
    centers.clear();
    mAmbiguous = false;
    if (chords.empty() || mNoSelection != 0) return;
    const TWeights weights = Weigh(chords);
    const auto best =
        Heaviest(std::span(weights).first(CountOfKeysToWeigh(mKeysToWeigh)), mAmbiguous);
    if (!best) return;
    const CSignKeyLite signKey = SignKeyAt(*best);
    CHarmAnlsCenter& center = centers.emplace_back();
    center.mPosition = chords.front().mPosition;
    center.mHarmCenter = {signKey.mRootKeyEnh, SemitonesFromSignKeyType(signKey.mSignKeyType)};
}

std::ostream& operator<<(std::ostream& stream, const CHarmCenterWeightAnalysis& /*analysis*/) {
    return stream << "CHarmCenterWeightAnalysis: todo define TraceStream";
}

}  // namespace brindle
