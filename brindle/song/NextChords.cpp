// SPDX-License-Identifier: MIT
#include "brindle/song/NextChords.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <map>
#include <tuple>

namespace brindle {
namespace {

// What stands further back says nothing about the next chord, and little about the key.
constexpr std::size_t kMostChords = 16;
// Nor does it tell what the next chord does.
constexpr std::size_t kReadChords = 3;
// No passage gains so many points by leaving the key.
constexpr double kStayInKey = 1e6;

CHarmAnlsChords ListOf(std::span<const CChordLite> chords) {
    CHarmAnlsChords list;
    for (const CChordLite& chord : chords) {
        list.emplace_back(chord, static_cast<double>(list.size()) * 4.0);
    }
    list.emplace_back(CChordLite_Undef, static_cast<double>(list.size()) * 4.0);
    return list;
}

std::vector<CChordLite> LastChords(std::span<const CChordLite> chords) {
    std::vector<CChordLite> last;
    for (std::size_t ix = chords.size(); ix-- > 0 && last.size() < kMostChords;) {
        const bool isHeld = !last.empty() && last.back().EqualWithoutEnh(chords[ix]);
        if (!chords[ix].IsUndef() && !isHeld) last.push_back(chords[ix]);
    }
    std::reverse(last.begin(), last.end());
    return last;
}

/// The numbers of the chords in the model, and the key that the last one is in.
struct CTypedHistory {
    std::vector<std::int32_t> mIds;
    CSignKeyLite mKey;
};

CTypedHistory HistoryOf(const CSongModel& model, std::span<const CChordLite> chords,
                        const CSignKeyLite& key, bool isWhole) {
    CTypedHistory history{{}, key};
    if (isWhole) {
        history.mIds.push_back(CSongModel::StartId(key.mSignKeyType == TSignKeyType_Minor));
    }
    for (const CChordLite& chord : chords) {
        history.mIds.push_back(
            model.HistoryIdOf(RelativeChordOf(chord, key, key.mRootKeyEnh.mKeyNr)));
    }
    return history;
}

/// The chord behind the others as a teacher reads it who stays in the key.
void SetReading(std::span<const CChordLite> before, const CSignKeyLite& key, CNextChord& next) {
    std::vector<CChordLite> chords(before.last(std::min(before.size(), kReadChords)).begin(),
                                   before.end());
    chords.push_back(next.mChord);
    CReadingOptions options;
    options.mStatedKey = key;
    options.mKeys.mHomeBonus = kStayInKey;
    const CSongReading reading = ReadHarmony(ListOf(chords), options);
    const CChordReading& last = reading.mChords[chords.size() - 1];
    next.mNumeral = last.mNumeral;
    next.mFunction = last.mFunction;
}

}  // namespace

CNextChords NextChords(const CSongModel& model, std::span<const CChordLite> chords,
                       const CNextChordOptions& options) {
    const std::vector<CChordLite> last = LastChords(chords);
    CNextChords next{options.mKey, {}};
    if (next.mKey.IsUndef()) next.mKey = FindKeys(ListOf(last)).mKey;
    if (next.mKey.IsUndef() || model.IsEmpty()) return next;
    const CTypedHistory history = HistoryOf(model, last, next.mKey, last.size() < kMostChords);
    std::vector<double> probabilities;
    model.Predict(history.mIds, options.mPlace, options.mOrder, probabilities);
    // The same chord may be known in several keys.
    std::map<std::tuple<int, int, int>, CNextChord> sums;
    for (std::size_t id = 0; id < probabilities.size(); ++id) {
        const CRelativeChord& relative = model.Chord(static_cast<std::int32_t>(id));
        const int root = FoldIntoOctave(relative.mShift + relative.mRoot);
        CNextChord& sum = sums[{root, relative.mBass, relative.mMask}];
        sum.mProbability += probabilities[id];
        if (sum.mChord.IsUndef() || relative.mShift == 0) {
            const CSignKeyLite key = KeyAbove(next.mKey, relative.mShift, relative.mIsMinorKey);
            sum.mChord = ChordInKey(relative, key);
        }
    }
    if (!last.empty()) {
        const CRelativeChord held =
            RelativeChordOf(last.back(), next.mKey, next.mKey.mRootKeyEnh.mKeyNr);
        sums.erase({held.mRoot, held.mBass, held.mMask});
    }
    double all = 0.0;
    for (auto& [sound, sum] : sums) {
        all += sum.mProbability;
        next.mChords.push_back(std::move(sum));
    }
    const auto isLikelier = [](const CNextChord& a, const CNextChord& b) {
        return a.mProbability > b.mProbability;
    };
    std::stable_sort(next.mChords.begin(), next.mChords.end(), isLikelier);
    next.mChords.resize(std::min(next.mChords.size(), options.mCount));
    for (CNextChord& chord : next.mChords) {
        chord.mProbability /= all;
        SetReading(last, next.mKey, chord);
    }
    return next;
}

}  // namespace brindle
