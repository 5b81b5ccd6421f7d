// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetMarks.h"

#include <algorithm>

namespace brindle::LeadSheet {
namespace {

// An arrow leaves right of the middle of a symbol and arrives left of it, so that a chain of arrows
// is a chain to the eye.
constexpr double kLeavePart = 0.6;
constexpr double kArrivePart = 0.36;
constexpr double kWidestArrival = 13.0;

// How far a mark reaches beyond the end of a line that it crosses.
constexpr double kOverhang = 9.0;
constexpr double kLevelGap = 4.0;
constexpr std::size_t kMostLevels = 3;

class CMarks {
public:
    CMarks(const CSheetLines& lines, const std::vector<CChordTexts>& texts)
        : mLines(lines), mTexts(texts), mMarks(lines.mLines.size()) {}

    void AddArrow(const CSheetLink& link) {
        const double begin = Place(link.mFrom).mX + kLeavePart * SymbolWidth(link.mFrom);
        if (link.mTo == kNone) {
            const std::size_t line = Place(link.mFrom).mLine;
            mMarks[line].mArrows.push_back(
                {begin, EndOfBar(link.mFrom), false, false, true, link.mIsDotted});
            return;
        }
        const double end =
            Place(link.mTo).mX + std::min(kWidestArrival, kArrivePart * SymbolWidth(link.mTo));
        Add(link, begin, end, &CLineMarks::mArrows);
    }

    void AddBracket(const CSheetLink& link) {
        Add(link, Place(link.mFrom).mX, Place(link.mTo).mX + SymbolWidth(link.mTo),
            &CLineMarks::mBrackets);
    }

    void AddKeys(const CSongReading& reading) {
        CSignKeyLite key;
        for (std::size_t i = 0; i < mLines.mLines.size(); ++i) {
            std::vector<CKeyMark>& keys = mMarks[i].mKeys;
            keys.push_back({0.0, 0.0, key});
            for (const CPlacedBar& bar : mLines.mLines[i].mBars) {
                for (const CPlacedChord& chord : bar.mChords) AddKey(reading, bar, chord, keys);
            }
            keys.back().mEnd = mLines.mLines[i].Width();
            key = keys.back().mKey;
        }
    }

    std::vector<CLineMarks> Take() {
        for (CLineMarks& marks : mMarks) Level(marks.mArrows);
        return std::move(mMarks);
    }

private:
    [[nodiscard]] const CChordPlace& Place(std::size_t chord) const {
        return mLines.mPlaces[chord];
    }

    [[nodiscard]] double SymbolWidth(std::size_t chord) const {
        return mLines.mScale * mTexts[chord].mSymbolWidth;
    }

    [[nodiscard]] double EndOfBar(std::size_t chord) const {
        const auto& bars = mLines.mLines[Place(chord).mLine].mBars;
        const auto behind = std::find_if(bars.begin(), bars.end(), [&](const CPlacedBar& bar) {
            return bar.End() > Place(chord).mX;
        });
        return behind == bars.end() ? Place(chord).mX : behind->End();
    }

    void Add(const CSheetLink& link, double begin, double end,
             std::vector<CLinkMark> CLineMarks::*marks) {
        const std::size_t first = Place(link.mFrom).mLine;
        const std::size_t last = Place(link.mTo).mLine;
        if (first == kNone || last == kNone) return;
        if (first == last) {
            (mMarks[first].*marks).push_back({begin, end, false, false, false, link.mIsDotted});
            return;
        }
        const double lineEnd = mLines.mLines[first].Width() + kOverhang;
        (mMarks[first].*marks).push_back({begin, lineEnd, false, true, false, link.mIsDotted});
        (mMarks[last].*marks).push_back({-kOverhang, end, true, false, false, link.mIsDotted});
    }

    void AddKey(const CSongReading& reading, const CPlacedBar& bar, const CPlacedChord& chord,
                std::vector<CKeyMark>& keys) const {
        if (chord.mIsHeld || chord.mChord >= reading.mChords.size()) return;
        const CSignKeyLite& key = reading.mChords[chord.mChord].mKey;
        if (key.mRootKeyEnh.IsUndef() || key == keys.back().mKey) return;
        const bool isFirst = chord.mChord == bar.mChords.front().mChord;
        const bool isFirstKey = keys.back().mKey.mRootKeyEnh.IsUndef();
        const double x = isFirstKey ? 0.0 : isFirst ? bar.mX : chord.mX - kLevelGap;
        keys.back().mEnd = x;
        if (keys.back().mEnd <= keys.back().mBegin) keys.pop_back();
        keys.push_back({x, x, key, true});
    }

    // Arrows that share some of their way get levels of their own, the longer ones the higher.
    static void Level(std::vector<CLinkMark>& arrows) {
        std::vector<CLinkMark*> order;
        for (CLinkMark& arrow : arrows) order.push_back(&arrow);
        std::sort(order.begin(), order.end(), [](const CLinkMark* one, const CLinkMark* other) {
            return one->mEnd != other->mEnd ? one->mEnd < other->mEnd : one->mBegin > other->mBegin;
        });
        double ends[kMostLevels] = {};
        std::fill(std::begin(ends), std::end(ends), -1e9);
        for (CLinkMark* arrow : order) {
            const auto* const free = std::find_if(std::begin(ends), std::end(ends) - 1,
                                                  [&](double end) { return end <= arrow->mBegin; });
            arrow->mLevel = static_cast<std::size_t>(free - std::begin(ends));
            ends[arrow->mLevel] = arrow->mEnd;
        }
    }

    const CSheetLines& mLines;
    const std::vector<CChordTexts>& mTexts;
    std::vector<CLineMarks> mMarks;
};

}  // namespace

std::size_t CLineMarks::Levels() const {
    std::size_t levels = 0;
    for (const CLinkMark& arrow : mArrows) levels = std::max(levels, arrow.mLevel + 1);
    return levels;
}

std::vector<CLineMarks> MakeMarks(const CSheetLines& lines, const std::vector<CChordTexts>& texts,
                                  const CSongReading& reading, const CSheetLinks& links) {
    CMarks marks(lines, texts);
    for (const CSheetLink& arrow : links.mArrows) marks.AddArrow(arrow);
    for (const CSheetLink& bracket : links.mBrackets) marks.AddBracket(bracket);
    marks.AddKeys(reading);
    return marks.Take();
}

}  // namespace brindle::LeadSheet
