// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetLines.h"

#include "brindle/chords/WriteChordSymbol.h"

#include <algorithm>
#include <numeric>
#include <span>

namespace brindle::LeadSheet {
namespace {

constexpr double kPadding = 7.0;
constexpr double kChordGap = 9.0;
constexpr double kSmallestScale = 0.78;
// A bar without chords, at least; and an upbeat against a whole bar.
constexpr double kNarrowestBar = 30.0;
constexpr double kUpbeatPart = 0.5;

std::string SymbolOf(const CSong& song, std::size_t chord) {
    const bool isWritten = chord < song.mSymbols.size() && !song.mSymbols[chord].empty();
    return isWritten ? song.mSymbols[chord] : WriteChordSymbol(song.mChords[chord]);
}

/// A bar, or the part of it that stands on one line, with the room that it needs.
struct CPart {
    CPlacedBar mPlaced;
    double mFixed = 0.0;   // does not shrink
    double mChords = 0.0;  // at full size, gaps included
    double mShare = 1.0;   // of a usual bar

    [[nodiscard]] double Need(double scale) const {
        return mPlaced.mChords.empty() ? std::max(kNarrowestBar, mFixed) : mFixed + scale * mChords;
    }
};

class CLineBreaker {
public:
    CLineBreaker(const CSheet& sheet, const std::vector<CChordTexts>& texts, double width,
                 std::size_t barsPerLine)
        : mSheet(sheet), mTexts(texts), mWidth(width), mBarsPerLine(barsPerLine) {}

    CSheetLines Break() {
        const auto& bars = mSheet.mBars;
        for (std::size_t begin = 0; begin < bars.size();) {
            const std::size_t end = EndOfGroup(begin);
            std::vector<CPart> group;
            for (std::size_t i = begin; i < end; ++i) group.push_back(PartOf(i));
            AddGroup(group, group.size() < mBarsPerLine);
            begin = end;
        }
        CSheetLines lines;
        lines.mScale = mScale;
        lines.mPlaces.resize(mTexts.size());
        for (CLine& line : mLines) lines.mLines.push_back(Spread(line));
        TellPlaces(lines);
        return lines;
    }

private:
    struct CLine {
        std::vector<CPart> mParts;
        bool mIsShort = false;  // keeps the width of its bars
    };

    [[nodiscard]] static bool BeginsLine(const CSheetBar& bar) {
        return bar.mBeginsSection || !bar.mRemark.empty() || bar.mSign == TSongSign_Coda;
    }

    // A full line of bars, or as many as there are before a section or the target of a jump.
    [[nodiscard]] std::size_t EndOfGroup(std::size_t begin) const {
        std::size_t end = begin + 1;
        std::size_t count = mSheet.mBars[begin].mIsUpbeat ? 0 : 1;
        while (end < mSheet.mBars.size() && count < mBarsPerLine &&
               !BeginsLine(mSheet.mBars[end])) {
            ++end;
            ++count;
        }
        return end;
    }

    [[nodiscard]] CPart PartOf(std::size_t index) const {
        const CSheetBar& bar = mSheet.mBars[index];
        CPart part;
        part.mPlaced.mBar = index;
        part.mFixed = LeftPadding(bar) + RightPadding(bar);
        part.mShare = bar.mIsUpbeat ? kUpbeatPart : 1.0;
        if (bar.mHeld != kNone) AddChord(part, {bar.mHeld, 0.0, true});
        for (std::size_t i = bar.mBegin; i < bar.mEnd; ++i) {
            if (!GoesOnInBar(bar, i)) AddChord(part, {i});
        }
        return part;
    }

    // Equal neighbours in a bar are written once.
    [[nodiscard]] bool GoesOnInBar(const CSheetBar& bar, std::size_t chord) const {
        return chord > bar.mBegin && mTexts[chord].mSymbol == mTexts[chord - 1].mSymbol &&
               mTexts[chord].mNumeral == mTexts[chord - 1].mNumeral;
    }

    void AddChord(CPart& part, const CPlacedChord& chord) const {
        if (!part.mPlaced.mChords.empty()) part.mChords += kChordGap;
        part.mChords += mTexts[chord.mChord].Width();
        part.mPlaced.mChords.push_back(chord);
    }

    [[nodiscard]] double Need(std::span<const CPart> parts) const {
        double need = 0.0;
        for (const CPart& part : parts) need += part.Need(kSmallestScale);
        return need;
    }

    void AddGroup(std::span<const CPart> group, bool isShort) {
        if (Need(group) <= mWidth) {
            AddLine({group.begin(), group.end()}, isShort);
        } else if (group.size() > 1) {
            const std::size_t half = (group.size() + 1) / 2;
            AddGroup(group.first(half), false);
            AddGroup(group.subspan(half), false);
        } else {
            AddPieces(group[0]);
        }
    }

    // A bar that is too full for a line.
    void AddPieces(const CPart& part) {
        CPart piece = EmptyPiece(part);
        for (const CPlacedChord& chord : part.mPlaced.mChords) {
            const double more = kChordGap + mTexts[chord.mChord].Width();
            const bool isEmpty = piece.mPlaced.mChords.empty();
            if (!isEmpty && piece.mFixed + kSmallestScale * (piece.mChords + more) > mWidth) {
                piece.mPlaced.mIsEnd = false;
                AddLine({piece}, false);
                piece = EmptyPiece(part);
                piece.mPlaced.mIsBegin = false;
            }
            AddChord(piece, chord);
        }
        AddLine({piece}, false);
    }

    [[nodiscard]] static CPart EmptyPiece(const CPart& part) {
        CPart piece;
        piece.mPlaced.mBar = part.mPlaced.mBar;
        piece.mFixed = part.mFixed;
        return piece;
    }

    // All lines shrink as much as the fullest needs it.
    void AddLine(std::vector<CPart> parts, bool isShort) {
        double fixed = 0.0;
        double chords = 0.0;
        for (const CPart& part : parts) {
            fixed += part.Need(0.0);
            chords += part.mChords;
        }
        if (chords > 0.0) {
            mScale = std::min(mScale, std::max(kSmallestScale, (mWidth - fixed) / chords));
        }
        mLines.push_back({std::move(parts), isShort});
    }

    // The width that the line has with bars of the usual width.
    [[nodiscard]] double WidthOfLine(const CLine& line) const {
        double need = 0.0;
        double usual = 0.0;
        for (const CPart& part : line.mParts) {
            need += part.Need(mScale);
            usual += part.mShare * mWidth / static_cast<double>(mBarsPerLine);
        }
        return line.mIsShort ? std::min(mWidth, std::max(need, usual)) : mWidth;
    }

    // The width of a usual bar for which the bars fill the line, fuller ones being wider.
    [[nodiscard]] double UsualWidth(const CLine& line, double width) const {
        std::vector<const CPart*> parts;
        for (const CPart& part : line.mParts) parts.push_back(&part);
        const auto level = [&](const CPart* part) { return part->Need(mScale) / part->mShare; };
        std::sort(parts.begin(), parts.end(),
                  [&](const CPart* one, const CPart* other) { return level(one) > level(other); });
        double shares = 0.0;
        for (const CPart* part : parts) shares += part->mShare;
        for (const CPart* part : parts) {
            if (width / shares >= level(part)) break;
            width -= part->Need(mScale);
            shares -= part->mShare;
            if (shares < 1e-9) return 0.0;
        }
        return width / shares;
    }

    [[nodiscard]] CSheetLine Spread(CLine& line) const {
        const double usual = UsualWidth(line, WidthOfLine(line));
        CSheetLine spread;
        double x = 0.0;
        for (CPart& part : line.mParts) {
            CPlacedBar& bar = part.mPlaced;
            bar.mX = x;
            bar.mWidth = std::max(part.Need(mScale), part.mShare * usual);
            PlaceChords(bar);
            x = bar.End();
            spread.mBars.push_back(std::move(bar));
        }
        return spread;
    }

    [[nodiscard]] double WidthOf(const CPlacedChord& chord) const {
        return mScale * mTexts[chord.mChord].Width();
    }

    // Each chord where its beat is, then away from its neighbours on the left, then on the right.
    void PlaceChords(CPlacedBar& placed) const {
        const CSheetBar& bar = mSheet.mBars[placed.mBar];
        const double left = placed.mX + LeftPadding(bar);
        const double right = placed.End() - RightPadding(bar);
        double free = left;
        for (CPlacedChord& chord : placed.mChords) {
            chord.mX = std::max(free, left + BeatPart(placed, chord.mChord) * (right - left));
            free = chord.mX + WidthOf(chord) + mScale * kChordGap;
        }
        double end = right;
        for (std::size_t i = placed.mChords.size(); i-- > 0;) {
            CPlacedChord& chord = placed.mChords[i];
            chord.mX = std::max(left, std::min(chord.mX, end - WidthOf(chord)));
            end = chord.mX - mScale * kChordGap;
        }
    }

    // 0 to 1: where in its bar, or in its piece of a bar, a chord begins.
    [[nodiscard]] double BeatPart(const CPlacedBar& placed, std::size_t chord) const {
        const CSheetBar& bar = mSheet.mBars[placed.mBar];
        double begin = bar.mPosition;
        double end = bar.mPosition + bar.mLength;
        if (!placed.mIsBegin) begin = mSheet.mPositions[placed.mChords.front().mChord];
        if (!placed.mIsEnd) end = mSheet.mPositions[placed.mChords.back().mChord + 1];
        if (!(end > begin)) return 0.0;
        return std::clamp((mSheet.mPositions[chord] - begin) / (end - begin), 0.0, 1.0);
    }

    // A chord that goes on in its bar has the place of the one that it goes on from.
    void TellPlaces(CSheetLines& lines) const {
        for (std::size_t i = 0; i < lines.mLines.size(); ++i) {
            for (const CPlacedBar& bar : lines.mLines[i].mBars) {
                for (const CPlacedChord& chord : bar.mChords) {
                    if (!chord.mIsHeld) lines.mPlaces[chord.mChord] = {i, chord.mX};
                }
            }
        }
        for (const CSheetBar& bar : mSheet.mBars) {
            for (std::size_t i = bar.mBegin; i < bar.mEnd; ++i) {
                if (GoesOnInBar(bar, i)) lines.mPlaces[i] = lines.mPlaces[i - 1];
            }
        }
    }

    const CSheet& mSheet;
    const std::vector<CChordTexts>& mTexts;
    double mWidth;
    std::size_t mBarsPerLine;
    double mScale = 1.0;
    std::vector<CLine> mLines;
};

}  // namespace

double CChordTexts::Width() const {
    return std::max(mSymbolWidth, mNumeralWidth);
}

std::vector<CChordTexts> MakeChordTexts(const CSong& song, const CSongReading& reading) {
    std::vector<CChordTexts> texts(CountChords(song));
    for (std::size_t i = 0; i < texts.size(); ++i) {
        CChordTexts& text = texts[i];
        text.mSymbol = SetSymbol(SymbolOf(song, i));
        if (i < reading.mChords.size()) text.mNumeral = SetNumeral(reading.mChords[i].mNumeral);
        text.mSymbolWidth = kSheetSymbolSize * LeadSheet::WidthOf(text.mSymbol);
        text.mNumeralWidth = kNumeralSize * LeadSheet::WidthOf(text.mNumeral);
    }
    return texts;
}

double LeftPadding(const CSheetBar& bar) {
    return kPadding + (bar.mTime.IsUndef() ? 0.0 : kTimeWidth) +
           (bar.mBeginsRepeat ? kRepeatWidth : 0.0);
}

double RightPadding(const CSheetBar& bar) {
    return kPadding + (bar.mEndsRepeat ? kRepeatWidth : 0.0);
}

CSheetLines BreakLines(const CSheet& sheet, const std::vector<CChordTexts>& texts, double width,
                       std::size_t barsPerLine) {
    return CLineBreaker(sheet, texts, width, barsPerLine).Break();
}

}  // namespace brindle::LeadSheet
