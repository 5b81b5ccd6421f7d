// SPDX-License-Identifier: MIT
#include "brindle/present/MakeSong.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/CChordSymbols.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/HarmonySymbols.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>

namespace brindle {
namespace {

class CSongMaker {
public:
    CSongMaker(const CHarmAnlsChords& chords, const CChordSymbols& symbols)
        : mChords(chords), mSymbols(symbols) {}

    [[nodiscard]] double End() const { return mChords.empty() ? 0.0 : mChords.back().mPosition; }

    [[nodiscard]] CShownCenter Show(const CHarmAnlsCenter& center) const {
        CShownCenter shown;
        shown.mHarmCenter = center.mHarmCenter;
        shown.mName = center.IsUndef() ? "unknown" : KeyInWords(center.mHarmCenter);
        shown.mProbability = center.mProbability;
        for (const CHarmAnlsChordWithPos& chord : center.mChords) {
            // A center that was put together from several readings holds a chord once for each.
            if (chord.mPosition >= End()) continue;
            CShownChord next = Show(chord);
            const bool isRepeated = !shown.mChords.empty() &&
                                    shown.mChords.back().mRange.mBegin == next.mRange.mBegin &&
                                    shown.mChords.back().mSymbol == next.mSymbol;
            if (isRepeated) continue;
            next.mNumeral = NumeralOf(chord, center.mHarmCenter);
            shown.mChords.push_back(std::move(next));
        }
        if (shown.mChords.empty()) {
            const double begin = std::clamp(center.mPosition, 0.0, End());
            shown.mRange = {begin, begin};
        } else {
            shown.mRange = {shown.mChords.front().mRange.mBegin, shown.mChords.back().mRange.mEnd};
        }
        return shown;
    }

    [[nodiscard]] CShownSignKey Show(const CHarmAnlsSignKey& signKey) const {
        CShownSignKey shown;
        shown.mSignKey = signKey.mSignKey;
        shown.mName = signKey.IsUndef() ? "unknown" : KeyInWords(signKey.mSignKey);
        shown.mBegin = std::max(0.0, signKey.mPosition);
        for (const CHarmAnlsCenter& center : signKey.mHarmCenters) {
            shown.mCenters.push_back(Show(center));
        }
        return shown;
    }

    /// The chords of the text that no center of the song holds; a sign that no chord sounds is
    /// none.
    [[nodiscard]] std::vector<CShownChord> LooseChords(const CShownSong& song) const {
        std::vector<double> held;
        ForEachChord(song, [&](const CShownChord& chord) { held.push_back(chord.mRange.mBegin); });
        std::sort(held.begin(), held.end());
        std::vector<CShownChord> loose;
        for (const CHarmAnlsChordWithPos& chord : mChords) {
            if (chord.mPosition >= End()) break;
            if (std::binary_search(held.begin(), held.end(), chord.mPosition)) continue;
            CShownChord shown = Show(chord);
            if (shown.mSymbol != kNoChordSymbol) loose.push_back(std::move(shown));
        }
        return loose;
    }

private:
    // Of several chords at one place the last one sounds.
    [[nodiscard]] CShownChord Show(const CHarmAnlsChordWithPos& chord) const {
        const auto next = std::upper_bound(
            mChords.begin(), mChords.end(), chord.mPosition,
            [](double position, const auto& other) { return position < other.mPosition; });
        double end = next == mChords.end() ? End() : next->mPosition;
        const bool isAnother = next != mChords.begin() &&
                               (next - 1)->mPosition == chord.mPosition &&
                               mSymbols.SymbolOf(*(next - 1)) != mSymbols.SymbolOf(chord);
        if (isAnother) end = chord.mPosition;
        return {{chord.mPosition, end},
                mSymbols.SymbolOf(chord),
                chord.mRootDistToHarmCenter,
                chord.mBassDistToHarmCenter,
                {}};
    }

    const CHarmAnlsChords& mChords;
    const CChordSymbols& mSymbols;
};

std::string TimeName(const TMusicXMLTimeSignature& time) {
    return fmt::format("{}/{}", time.mNumerator, time.mDenominator);
}

}  // namespace

CShownScore MakeScore(const TMusicXMLDoc& sheet) {
    CShownScore score;
    score.mTitle = Printable(sheet.Title);
    for (const auto& time : sheet.TimeSignatures) {
        score.mTimes.push_back({time.mPosition, TimeName(time)});
    }
    for (const CHarmSection& section : sheet.HarmSections) {
        score.mSections.push_back(section.mPosition);
    }
    // A reading that tells no bar lines tells the places of its copies in another way.
    const auto& bars = sheet.HarmBarlines;
    for (const CHarmCopy& copy : sheet.HarmCopies) {
        const auto bar = std::lower_bound(
            bars.begin(), bars.end(), copy.mTargetPos,
            [](const CHarmBarline& line, double position) { return line.mPosition < position; });
        const auto source = (bar - bars.begin()) + copy.mSourceOffsetBars;
        if (bar == bars.end() || source < 0 || copy.mSourceOffsetBars >= 0) continue;
        score.mCopies.push_back({copy.mTargetPos, bars[static_cast<std::size_t>(source)].mPosition,
                                 static_cast<std::size_t>(copy.mLengthBars)});
    }
    return score;
}

CShownSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                    const CChordSymbols& symbols, double beatsPerBar) {
    const CSongMaker maker(analyse.mChords, symbols);
    CShownSong song;
    song.mBeatsPerBar = beatsPerBar;
    song.mEnd = maker.End();
    for (const CHarmAnlsSignKey& signKey : analyse.mSignKeys) {
        song.mSignKeys.push_back(maker.Show(signKey));
    }
    song.mLooseChords = maker.LooseChords(song);
    song.mKeys = MakeSongKeys(analyse.mChords, symbols, {.mBeatsPerBar = beatsPerBar});
    if (readings != nullptr) {
        song.mHasReadings = true;
        for (const CHarmAnlsCenter& reading : *readings) {
            song.mReadings.push_back(maker.Show(reading));
        }
        // From left to right, the longest of those that begin together first.
        std::stable_sort(song.mReadings.begin(), song.mReadings.end(),
                         [](const CShownCenter& a, const CShownCenter& b) {
                             if (a.mRange.mBegin != b.mRange.mBegin) {
                                 return a.mRange.mBegin < b.mRange.mBegin;
                             }
                             return a.mRange.mEnd > b.mRange.mEnd;
                         });
    }
    return song;
}

}  // namespace brindle
