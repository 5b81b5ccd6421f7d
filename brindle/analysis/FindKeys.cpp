// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/KeyScores.h"
#include "brindle/theory/KeyIntervals.h"

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
    return options;
}

// The softmax probability of the winner.
double Confidence(const std::array<double, kKeyCount>& scores, double winner) {
    double sum = 0.0;
    for (const double score : scores) sum += std::exp(score - winner);
    return 1.0 / sum;
}

/// Keys as sign keys. Where two spellings have as many signs, F sharp and G flat major, the first
/// chord on the tonic decides.
class CKeySpeller {
public:
    explicit CKeySpeller(const CHarmAnlsChords& chords) {
        for (const CHarmAnlsChord& chord : chords) {
            if (chord.IsUndef()) continue;
            TEnh& enh = mEnhs[static_cast<std::size_t>(FoldIntoOctave(chord.mRootKeyEnh.mKeyNr))];
            if (enh == TEnh_Undef) enh = chord.mRootKeyEnh.mEnh;
        }
    }

    [[nodiscard]] CSignKeyLite SignKeyOf(int key) const {
        const int tonic = TonicOfKey(key);
        CSignKeyLite signKey({tonic, mEnhs[static_cast<std::size_t>(tonic)]},
                             ModeOfKey(key) == 0 ? TSignKeyType_Major : TSignKeyType_Minor);
        signKey.SetRootNoteEnhWithLeastSigns();
        return signKey;
    }

private:
    std::array<TEnh, 12> mEnhs = [] {
        std::array<TEnh, 12> enhs;
        enhs.fill(TEnh_Undef);
        return enhs;
    }();
};

std::vector<CKeyRegion> RegionsOf(const CHarmAnlsChords& chords, std::span<const TKeyChord> heard,
                                  const std::vector<std::uint8_t>& keys,
                                  const CKeySpeller& speller) {
    std::vector<CKeyRegion> regions;
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

}  // namespace

CKeyOfSong FindKeys(const CHarmAnlsChords& chords, const CKeyOptions& options) {
    CKeyOfSong found;
    const std::vector<TKeyChord> heard = KeyChordsOf(chords);
    if (heard.empty()) return found;
    found.mScores = KeyScores(heard);
    const auto winner = std::max_element(found.mScores.begin(), found.mScores.end());
    const auto home = static_cast<int>(winner - found.mScores.begin());
    const CKeySpeller speller(chords);
    found.mKey = speller.SignKeyOf(home);
    found.mConfidence = Confidence(found.mScores, *winner);
    found.mRegions = RegionsOf(chords, heard, LocalKeys(heard, home, Checked(options)), speller);
    return found;
}

}  // namespace brindle
