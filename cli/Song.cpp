// SPDX-License-Identifier: MIT
#include "cli/Song.h"

#include "cli/ChordSymbols.h"
#include "cli/Names.h"

#include <algorithm>

namespace brindle::cli {
namespace {

class CSongMaker {
public:
    CSongMaker(const CHarmAnlsChords& chords, const CChordSymbols& symbols)
        : mChords(chords), mSymbols(symbols) {}

    [[nodiscard]] double End() const { return mChords.empty() ? 0.0 : mChords.back().mPosition; }

    [[nodiscard]] TShownCenter Show(const CHarmAnlsCenter& center) const {
        TShownCenter shown;
        shown.mHarmCenter = center.mHarmCenter;
        shown.mName = center.IsUndef() ? "unknown" : center.mHarmCenter.NameLong(NamePrefs());
        shown.mProbability = center.mProbability;
        for (const CHarmAnlsChordWithPos& chord : center.mChords) {
            // A center that was put together from several readings holds a chord once for each.
            const bool isRepeated =
                !shown.mChords.empty() && shown.mChords.back().mRange.mBegin == chord.mPosition;
            if (isRepeated || chord.mPosition >= End()) continue;
            shown.mChords.push_back(Show(chord));
            shown.mChords.back().mNumeral = NumeralOf(chord, center.mHarmCenter);
        }
        if (shown.mChords.empty()) {
            const double begin = std::clamp(center.mPosition, 0.0, End());
            shown.mRange = {begin, begin};
        } else {
            shown.mRange = {shown.mChords.front().mRange.mBegin, shown.mChords.back().mRange.mEnd};
        }
        return shown;
    }

    [[nodiscard]] TShownSignKey Show(const CHarmAnlsSignKey& signKey) const {
        TShownSignKey shown;
        shown.mSignKey = signKey.mSignKey;
        shown.mName = signKey.IsUndef() ? "unknown" : signKey.mSignKey.NameLong(NamePrefs());
        shown.mBegin = std::max(0.0, signKey.mPosition);
        for (const CHarmAnlsCenter& center : signKey.mHarmCenters) {
            shown.mCenters.push_back(Show(center));
        }
        return shown;
    }

    /// The chords of the text that no center of the song holds.
    [[nodiscard]] std::vector<TShownChord> LooseChords(const TSong& song) const {
        std::vector<double> held;
        ForEachChord(song, [&](const TShownChord& chord) { held.push_back(chord.mRange.mBegin); });
        std::sort(held.begin(), held.end());
        std::vector<TShownChord> loose;
        for (const CHarmAnlsChordWithPos& chord : mChords) {
            if (chord.mPosition >= End()) break;
            if (!std::binary_search(held.begin(), held.end(), chord.mPosition)) {
                loose.push_back(Show(chord));
            }
        }
        return loose;
    }

private:
    [[nodiscard]] TShownChord Show(const CHarmAnlsChordWithPos& chord) const {
        const auto next = std::upper_bound(
            mChords.begin(), mChords.end(), chord.mPosition,
            [](double position, const auto& other) { return position < other.mPosition; });
        const double end = next == mChords.end() ? End() : next->mPosition;
        return {{chord.mPosition, end},
                mSymbols.SymbolOf(chord),
                chord.mRootDistToHarmCenter,
                chord.mBassDistToHarmCenter,
                {}};
    }

    const CHarmAnlsChords& mChords;
    const CChordSymbols& mSymbols;
};

}  // namespace

TSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
               const CChordSymbols& symbols, double beatsPerBar) {
    const CSongMaker maker(analyse.mChords, symbols);
    TSong song;
    song.mBeatsPerBar = beatsPerBar;
    song.mEnd = maker.End();
    for (const CHarmAnlsSignKey& signKey : analyse.mSignKeys) {
        song.mSignKeys.push_back(maker.Show(signKey));
    }
    song.mLooseChords = maker.LooseChords(song);
    if (readings != nullptr) {
        song.mHasReadings = true;
        for (const CHarmAnlsCenter& reading : *readings) {
            song.mReadings.push_back(maker.Show(reading));
        }
        // From left to right, the longest of those that begin together first.
        std::stable_sort(song.mReadings.begin(), song.mReadings.end(),
                         [](const TShownCenter& a, const TShownCenter& b) {
                             if (a.mRange.mBegin != b.mRange.mBegin) {
                                 return a.mRange.mBegin < b.mRange.mBegin;
                             }
                             return a.mRange.mEnd > b.mRange.mEnd;
                         });
    }
    return song;
}

}  // namespace brindle::cli
