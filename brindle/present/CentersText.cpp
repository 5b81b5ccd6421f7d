// SPDX-License-Identifier: MIT
#include "brindle/present/CentersText.h"

#include "brindle/present/CBars.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>

namespace brindle {
namespace {

std::string DistanceText(int distance) {
    return distance < 0 ? " -" : fmt::format("{:2} {}", distance, DegreeName(distance));
}

class CTextWriter {
public:
    CTextWriter(const CShownSong& song, const CPaint& paint)
        : mPaint(paint), mBars(song.mBeatsPerBar, song.mBarStarts), mSong(song) {}

    void WriteHeading() {
        mText += mPaint.Strong("Centers by progressions: ") +
                 "where stated progressions lead, each for itself.\n"
                 "A center may differ from the key above, which is that of the whole song.\n";
    }

    void Write(const CShownSignKey& signKey) {
        StartParagraph();
        mText += mPaint.Strong("Key signature " + signKey.mName);
        mText += mPaint.Faint(fmt::format(", from bar {}\n", mBars.BarOf(signKey.mBegin)));
        bool isAfterChords = true;
        for (const CShownCenter& center : signKey.mCenters) {
            const bool hasChords = !center.mChords.empty();
            if (!hasChords && !center.mHarmCenter.IsUndef() && !mSong.mHasReadings) continue;
            if (isAfterChords || hasChords) StartParagraph();
            WriteHead(center);
            if (hasChords) WriteChords(center.mChords);
            isAfterChords = hasChords;
        }
    }

    void WriteLooseChords(const std::vector<CShownChord>& chords) {
        if (chords.empty()) return;
        StartParagraph();
        mText += mPaint.Strong("Chords outside of every center") + "\n\n";
        WriteChords(chords);
    }

    void WriteReadings(const std::vector<CShownCenter>& readings) {
        StartParagraph();
        mText += mPaint.Strong("Readings") + "\n\n";
        if (readings.empty()) {
            mText += "    none found\n";
            return;
        }
        CTable table({"center", "where", "readings", "chords"});
        for (const CShownCenter& reading : readings) {
            table.AddRow({reading.mName, BarsOf(reading.mRange, mBars),
                          ShortNumber(reading.mProbability), SymbolsOf(reading)});
        }
        Write(table);
    }

    [[nodiscard]] std::string Text() && { return std::move(mText); }

private:
    void StartParagraph() {
        if (!mText.empty()) mText += '\n';
    }

    void WriteHead(const CShownCenter& center) {
        const bool hasChords = !center.mChords.empty();
        const std::string head =
            (hasChords || center.mHarmCenter.IsUndef() ? "Center " : "also heard: ") + center.mName;
        std::string details =
            ", " + (hasChords ? BarsOf(center.mRange, mBars) : WhereHeard(center));
        if (center.mProbability != kPosUndef && center.mProbability > 1.0) {
            details += fmt::format(", {} readings agree", ShortNumber(center.mProbability));
        }
        mText += "  " + mPaint.Accent(head) + mPaint.Faint(details) + '\n';
        if (hasChords) mText += '\n';
    }

    /// Where the reading is that has led to a center without chords.
    [[nodiscard]] std::string WhereHeard(const CShownCenter& center) const {
        const double begin = center.mRange.mBegin;
        const auto reading = std::find_if(
            mSong.mReadings.begin(), mSong.mReadings.end(), [&](const CShownCenter& other) {
                return other.mHarmCenter == center.mHarmCenter && other.mRange.mBegin <= begin &&
                       begin < other.mRange.mEnd;
            });
        return reading == mSong.mReadings.end() ? fmt::format("from bar {}", mBars.BarOf(begin))
                                                : BarsOf(reading->mRange, mBars);
    }

    [[nodiscard]] static std::string SymbolsOf(const CShownCenter& center) {
        std::vector<std::string> symbols;
        for (const CShownChord& chord : center.mChords) symbols.push_back(chord.mSymbol);
        return FirstAndLast(symbols);
    }

    void WriteChords(const std::vector<CShownChord>& chords) {
        CTable table({" bar", " beat", "chord", "function", "root", "bass"});
        long barBefore = 0;
        for (const CShownChord& chord : chords) {
            const long bar = mBars.BarOf(chord.mRange.mBegin);
            table.AddRow({bar == barBefore ? "" : fmt::format("{}", bar),
                          ShortNumber(mBars.BeatOf(chord.mRange.mBegin)), chord.mSymbol,
                          chord.mNumeral.empty() ? "-" : chord.mNumeral,
                          DistanceText(chord.mRootDist),
                          chord.mBassDist < 0 ? "" : DistanceText(chord.mBassDist)});
            barBefore = bar;
        }
        Write(table);
    }

    void Write(const CTable& table) { mText += table.Text(mPaint, "    "); }

    const CPaint& mPaint;
    CBars mBars;
    const CShownSong& mSong;
    std::string mText;
};

}  // namespace

std::string CentersText(const CShownSong& song, const CPaint& paint) {
    CTextWriter writer(song, paint);
    writer.WriteHeading();
    for (const CShownSignKey& signKey : song.mSignKeys) writer.Write(signKey);
    writer.WriteLooseChords(song.mLooseChords);
    if (song.mHasReadings) writer.WriteReadings(song.mReadings);
    return std::move(writer).Text();
}

}  // namespace brindle
