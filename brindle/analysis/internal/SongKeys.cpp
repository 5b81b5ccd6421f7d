// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/SongKeys.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/internal/LocalKeys.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

// Points beyond this bury everything else.
constexpr double kMostPoints = 1e6;

double PointsOrDefault(double points, double byDefault) {
    return std::isfinite(points) ? std::clamp(points, -kMostPoints, kMostPoints) : byDefault;
}

CKeyOptions Checked(CKeyOptions options) {
    const CKeyOptions byDefault;
    const bool isBar = std::isfinite(options.mBeatsPerBar) && options.mBeatsPerBar > 0.0;
    if (!isBar) options.mBeatsPerBar = byDefault.mBeatsPerBar;
    options.mHomeBonus = PointsOrDefault(options.mHomeBonus, byDefault.mHomeBonus);
    options.mChangeCost = PointsOrDefault(options.mChangeCost, byDefault.mChangeCost);
    if (options.mChangeCost < 0.0) options.mChangeCost = byDefault.mChangeCost;
    return options;
}

// Scores that differ by no more than the rounding of their sums are equal, so that no order of
// adding decides.
int LowestOfTheBest(const std::array<double, kKeyCount>& scores) {
    constexpr double rounding = 1e-9;
    const double least = *std::max_element(scores.begin(), scores.end()) - rounding;
    const auto winner = std::find_if(scores.begin(), scores.end(),
                                     [least](double score) { return score >= least; });
    return static_cast<int>(winner - scores.begin());
}

int HomeOf(std::span<const CKeyChord> chords, int bestScored, int statedKey) {
    if (statedKey >= 0) return statedKey;
    const int vamp = KeyOfVamp(chords);
    return vamp >= 0 ? vamp : bestScored;
}

CSignKeyLite CountedKeyWithLeastSigns(int key, TEnh enh) {
    CSignKeyLite signKey({TonicOfKey(key), enh},
                         IsMinorKey(key) ? TSignKeyType_Minor : TSignKeyType_Major);
    signKey.SetRootNoteEnhWithLeastSigns();
    return signKey;
}

// Counting signs builds scales, which for all 24 keys takes longer than reading a few chords.
CSignKeyLite KeyWithLeastSigns(int key, TEnh enh) {
    using TKeys = std::array<CSignKeyLite, kKeyCount>;
    constexpr std::size_t spellings = TEnh_Undef - TEnh_bbb + 1;
    static const auto counted = [] {
        std::array<TKeys, spellings> all{};
        for (std::size_t ix = 0; ix < spellings * kKeyCount; ++ix) {
            const int number = static_cast<int>(ix % kKeyCount);
            const auto ofIndex = static_cast<TEnh>(static_cast<int>(ix / kKeyCount) + TEnh_bbb);
            all[ix / kKeyCount][ix % kKeyCount] = CountedKeyWithLeastSigns(number, ofIndex);
        }
        return all;
    }();
    const int row = enh - TEnh_bbb;
    if (row < 0 || row >= static_cast<int>(spellings)) return CountedKeyWithLeastSigns(key, enh);
    return counted[static_cast<std::size_t>(row)][static_cast<std::size_t>(key)];
}

}  // namespace

CSongKeys FindSongKeys(std::span<const CKeyChord> chords, const CKeyOptions& options,
                       int statedKey) {
    CSongKeys found;
    found.mScores = KeyScores(chords);
    found.mBestScored = LowestOfTheBest(found.mScores);
    found.mTraits = SongTraitsOf(chords, HomeOf(chords, found.mBestScored, statedKey));
    found.mKinds = KeyChordKindsOf(chords);
    const int home = found.mTraits.mHome;
    if (found.mTraits.mIsVamp) {
        found.mKeys.assign(chords.size(), static_cast<std::uint8_t>(home));
        return found;
    }
    found.mKeys = LocalKeys(chords, found.mKinds, found.mTraits, Checked(options));
    TidyLocalKeys(chords, home, found.mKeys);
    return found;
}

// The softmax probability.
double ConfidenceOf(const std::array<double, kKeyCount>& scores, int key) {
    const double most = *std::max_element(scores.begin(), scores.end());
    double sum = 0.0;
    for (const double score : scores) sum += std::exp(score - most);
    return std::exp(scores[static_cast<std::size_t>(key)] - most) / sum;
}

CKeySpeller::CKeySpeller(const CHarmAnlsChords& chords, const CSignKeyLite& statedKey) {
    std::array<TEnh, 12> enhs;
    enhs.fill(TEnh_Undef);
    std::size_t missing = enhs.size();
    for (auto chord = chords.begin(); chord != chords.end() && missing > 0; ++chord) {
        if (chord->IsUndef()) continue;
        TEnh& enh = enhs[static_cast<std::size_t>(FoldIntoOctave(chord->mRootKeyEnh.mKeyNr))];
        if (enh != TEnh_Undef || chord->mRootKeyEnh.mEnh == TEnh_Undef) continue;
        enh = chord->mRootKeyEnh.mEnh;
        --missing;
    }
    for (int key = 0; key < kKeyCount; ++key) {
        const TEnh enh = enhs[static_cast<std::size_t>(TonicOfKey(key))];
        mSignKeys[static_cast<std::size_t>(key)] = KeyWithLeastSigns(key, enh);
    }
    const int stated = NumberOfKey(statedKey);
    if (stated >= 0) mSignKeys[static_cast<std::size_t>(stated)] = statedKey;
}

std::vector<CKeyRegion> KeyRegionsOf(const CHarmAnlsChords& chords,
                                     std::span<const CKeyChord> heard,
                                     std::span<const std::uint8_t> keys,
                                     const CKeySpeller& speller) {
    std::vector<CKeyRegion> regions;
    if (heard.empty()) return regions;
    regions.reserve(CountRuns(keys));
    for (std::size_t i = 0; i < heard.size(); ++i) {
        if (i > 0 && keys[i] == keys[i - 1]) continue;
        const std::size_t begin = heard[i].mBegin;
        const double position = chords[begin].mPosition;
        if (!regions.empty()) {
            regions.back().mEnd = begin;
            regions.back().mEndPosition = position;
        }
        regions.push_back({.mKey = speller.SignKeyOf(keys[i]),
                           .mBegin = begin,
                           .mEnd = chords.size(),
                           .mPosition = position,
                           .mEndPosition = chords.LastChordEndPos()});
    }
    if (chords.back().IsUndef()) {
        regions.back().mEnd = chords.size() - 1;
        regions.back().mEndPosition = chords.back().mPosition;
    }
    return regions;
}

}  // namespace brindle
