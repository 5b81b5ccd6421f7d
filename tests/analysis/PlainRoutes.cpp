// SPDX-License-Identifier: MIT
#include "tests/analysis/PlainRoutes.h"

#include "tests/analysis/PlainHarmony.h"

#include "brindle/theory/SignKeySigns.h"

#include <cstdlib>
#include <utility>
#include <vector>

namespace brindle::test {

namespace {

constexpr bool kIsBlackKey[] = {false, true,  false, true,  false, false,
                                true,  false, true,  false, true,  false};

CKeyEnh FlatKey(int keyNr) {
    return {keyNr, kIsBlackKey[keyNr] ? TEnh_b : TEnh_n};
}

auto At(const CHarmAnlsChords& chords, std::size_t n) {
    return chords.begin() + static_cast<std::ptrdiff_t>(n);
}

std::size_t FirstOfRange(const CHarmAnlsChords& chords, const CHarmCenterLite& center,
                         std::size_t at) {
    while (at > 0 && PlainIsCompatible(chords[at - 1], center)) --at;
    return at;
}

std::size_t LastOfRange(const CHarmAnlsChords& chords, const CHarmCenterLite& center,
                        std::size_t at) {
    while (at + 1 < chords.size() && PlainIsCompatible(chords[at + 1], center)) ++at;
    return at;
}

/// Changes the range of center n and returns the index that it has afterwards.
std::size_t ChangeRange(CHarmAnlsCenters& centers, std::size_t n, double start, double end) {
    const auto center = centers.ChangeRangeOfHarmCenter(
        centers.begin() + static_cast<std::ptrdiff_t>(n), start, end);
    return static_cast<std::size_t>(center - centers.begin());
}

/// The key that weighs most, with the position of the first chord.
CHarmCenterLite HeaviestKey(const CHarmAnlsChords& chords) {
    std::vector<std::pair<CSignKeyLite, double>> weights;
    for (const auto type : {TSignKeyType_Major, TSignKeyType_Minor}) {
        for (int key = 0; key < 12; ++key) weights.push_back({{FlatKey(key), type}, 0.0});
    }
    for (std::size_t i = 0; i < chords.size(); ++i) {
        const CHarmAnlsChordWithPos& chord = chords[i];
        if (chord.mRootKeyEnh.mKeyNr == 15) continue;
        const bool isLast = i + 1 == chords.size();
        const double length = isLast ? 1.0 : chords[i + 1].mPosition - chord.mPosition;
        const double bonus = 0.1 * length;
        for (auto& [signKey, weight] : weights) {
            if (!PlainIsInSignKey(chord, signKey)) continue;
            weight += length;
            if (chord.mRootKeyEnh.mKeyNr != signKey.mRootKeyEnh.mKeyNr) continue;
            weight += bonus;
            if (i == 0 || isLast) weight += bonus;
        }
    }
    auto best = weights.begin();
    for (auto entry = weights.begin(); entry != weights.end(); ++entry) {
        if (entry->second > best->second) best = entry;
    }
    return {best->first.mRootKeyEnh, SemitonesFromSignKeyType(best->first.mSignKeyType)};
}

}  // namespace

void CPlainAnalysis::AnalyseFromChords(const CHarmAnlsChords& chords,
                                       const CHarmAnlsSignKeys& signKeys, TAnalyse analyse) {
    mChords = chords;
    mSignKeys = signKeys;
    if (mSignKeys.empty()) mSignKeys.emplace_back();
    CHarmAnlsSignKey& last = mSignKeys.back();
    if (last.mHarmCenters.empty()) {
        CHarmAnlsCenter center;
        center.mPosition = last.mPosition;
        center.mHarmCenter = {last.mSignKey.mRootKeyEnh,
                              SemitonesFromSignKeyType(last.mSignKey.mSignKeyType)};
        last.mHarmCenters.push_back(center);
    }
    last.mHarmCenters.back().mChords = mChords;
    Analyse(analyse);
}

void CPlainAnalysis::Analyse(TAnalyse analyse) {
    for (const auto& signKey : mSignKeys) {
        for (const auto& center : signKey.mHarmCenters) mChordCount += center.mChords.size();
    }
    if (analyse == TAnalyse_TonicProgressions) {
        TonicRoute(CHarmAnlsProgressions::TonicProgressions());
    }
    if (analyse == TAnalyse_CadenceProgressions) {
        for (auto& signKey : mSignKeys) {
            CadenceWalk(signKey, CHarmAnlsProgressions::CadenceProgressions());
        }
    }
    if (analyse != TAnalyse_None) {
        for (auto& signKey : mSignKeys) WeightStep(signKey);
    }
    MergeSignKeys();
    for (auto& signKey : mSignKeys) MergeCenters(signKey.mHarmCenters);
    for (auto& signKey : mSignKeys) FillAndSetFunctions(signKey);
}

void CPlainAnalysis::TonicRoute(const CHarmAnlsProgressions& progressions) {
    if (mSignKeys.empty()) return;
    const CHarmAnlsCenters found = PlainBestResults(mChords);
    if (found.empty()) {
        for (auto& signKey : mSignKeys) TonicWalk(signKey, progressions);
        return;
    }
    CHarmAnlsSignKey& first = mSignKeys.front();
    first.mHarmCenters = found;
    first.IfUndefFillWithHarmAnlsCenter(found.front());
}

void CPlainAnalysis::TonicWalk(CHarmAnlsSignKey& signKey,
                               const CHarmAnlsProgressions& progressions) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    for (std::size_t n = 0; n < centers.size(); ++n) {
        if (n > mChordCount + 20) {
            mIsEndless = true;
            return;
        }
        centers[n].IfUndefFillWithHarmSignKey(signKey);
        std::size_t at = 0;
        while (at < centers[n].mChords.size()) {
            const CHarmAnlsChords chords = centers[n].mChords;
            const auto matches =
                progressions.FindAndSortForwardMatchingProgressions(At(chords, at), chords);
            if (matches.empty()) {
                ++at;
                continue;
            }
            const auto& row = matches.front();
            const auto scale = row.HarmCenterCalculatedFromFoundProgressionNthChord(
                row.size() - 1, At(chords, at), chords);
            centers[n].mHarmCenter = scale;
            if (centers[n].mPosition == kPosUndef) centers[n].mPosition = chords[at].mPosition;
            const std::size_t first = FirstOfRange(chords, scale, at);
            const std::size_t next = LastOfRange(chords, scale, at) + 1;
            const double end = next < chords.size() ? chords[next].mPosition : kPosEnd;
            n = ChangeRange(centers, n, chords[first].mPosition, end);
            at = next;
            signKey.IfUndefFillWithHarmAnlsCenter(centers[n]);
        }
    }
}

void CPlainAnalysis::CadenceWalk(CHarmAnlsSignKey& signKey,
                                 const CHarmAnlsProgressions& progressions) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    for (std::size_t n = 0; n < centers.size(); ++n) {
        centers[n].IfUndefFillWithHarmSignKey(signKey);
        const CHarmAnlsChords chords = centers[n].mChords;
        std::size_t at = 0;
        while (at < chords.size() && chords[at].IsUndef()) ++at;
        CHarmAnlsProgressions matches;
        for (; at < chords.size(); ++at) {
            for (const auto& row : progressions) {
                if (row.MatchesHarmChordsFrom(chords, At(chords, at))) matches.push_back(row);
            }
            if (!matches.empty()) break;
        }
        if (matches.empty()) continue;
        matches.SortBySizeAndPriority();
        const auto& row = matches.front();
        const int key =
            (chords[at].mRootKeyEnh.mKeyNr - row.front().mRootDistToHarmCenter + 12) % 12;
        centers[n].mHarmCenter = {FlatKey(key), SemitonesFromSignKeyType(row.mSignKeyType)};
        if (centers[n].mPosition == kPosUndef) centers[n].mPosition = chords[at].mPosition;
        const std::size_t first = FirstOfRange(chords, centers[n].mHarmCenter, at);
        n = ChangeRange(centers, n, chords[first].mPosition, kPosEnd);
        signKey.IfUndefFillWithHarmAnlsCenter(centers[n]);
    }
}

void CPlainAnalysis::WeightStep(CHarmAnlsSignKey& signKey) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    for (std::size_t n = 0; n < centers.size(); ++n) {
        if (centers[n].mChords.empty()) continue;
        const double start = centers[n].mChords.front().mPosition;
        centers[n].mHarmCenter = HeaviestKey(centers[n].mChords);
        if (centers[n].mPosition == kPosUndef) centers[n].mPosition = start;
        n = ChangeRange(centers, n, start, kPosEnd);
        signKey.IfUndefFillWithHarmAnlsCenter(centers[n]);
    }
}

void CPlainAnalysis::MergeSignKeys() {
    for (std::size_t n = 1; n < mSignKeys.size();) {
        if (mSignKeys[n].mSignKey == mSignKeys[n - 1].mSignKey) {
            for (const auto& center : mSignKeys[n].mHarmCenters) {
                mSignKeys[n - 1].mHarmCenters.push_back(center);
            }
            mSignKeys.erase(mSignKeys.begin() + static_cast<std::ptrdiff_t>(n));
        } else {
            ++n;
        }
    }
}

void CPlainAnalysis::MergeCenters(CHarmAnlsCenters& centers) {
    for (std::size_t n = 1; n < centers.size();) {
        if (centers[n].mHarmCenter == centers[n - 1].mHarmCenter) {
            for (const auto& chord : centers[n].mChords) centers[n - 1].mChords.push_back(chord);
            centers.erase(centers.begin() + static_cast<std::ptrdiff_t>(n));
        } else {
            ++n;
        }
    }
}

void CPlainAnalysis::FillAndSetFunctions(CHarmAnlsSignKey& signKey) {
    if (signKey.IsUndef()) {
        const CHarmCenterLite center = signKey.mHarmCenters.FindMostOccurentHarmCenter();
        signKey.mSignKey = {center.mRootKeyEnh, SignKeyTypeFromSemitones(center.mSemitones)};
    }
    for (auto& center : signKey.mHarmCenters) {
        center.IfUndefFillWithHarmSignKey(signKey);
        center.AnalyseHarmFunctionsOfChords();
    }
}

}  // namespace brindle::test
