// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/NumeralPieces.h"

#include "brindle/analysis/internal/NumeralDegree.h"
#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/platform/Ascii.h"

#include <algorithm>

namespace brindle {
namespace {

bool IsDigits(std::string_view text) {
    return !text.empty() && std::all_of(text.begin(), text.end(), Ascii::IsDigit);
}

// Whether the digits on both sides of a slash are one figure, 6/5. A Nashville number has no such
// figures: there 46/5 is a chord with a sixth over the fifth degree.
bool IsSlashedFigure(std::string_view before, std::string_view behind) {
    if (!IsDigits(behind) || behind.size() > 2 || ReadDegree(before).mIsDigit) return false;
    const std::size_t last = before.find_last_not_of("0123456789/");
    if (last == before.npos) return false;
    std::array<char, 4> digits;
    std::size_t count = 0;
    for (const std::string_view text : {before.substr(last + 1), behind}) {
        for (const char c : text) {
            if (c == '/') continue;
            if (count == digits.size()) return false;
            digits[count++] = c;
        }
    }
    const std::string_view figure(digits.data(), count);
    return std::find(kSlashedFigures.begin(), kSlashedFigures.end(), figure) !=
           kSlashedFigures.end();
}

// 7/5 is not a figure, but 7/5/3 is one.
std::string_view TakeFigureWithSlashes(std::string_view& text) {
    std::size_t end = std::min(text.find('/'), text.size());
    for (int more = 0; more < 2; ++more) {
        std::size_t next = end;
        for (std::size_t probe = end, count = 0; probe < text.size() && count < 2; ++count) {
            const std::size_t behind = std::min(text.find('/', probe + 1), text.size());
            const std::string_view digits = text.substr(probe + 1, behind - probe - 1);
            const bool isFigure = IsSlashedFigure(text.substr(0, probe), digits);
            if (isFigure) next = behind;
            if (!IsDigits(digits)) break;
            probe = behind;
        }
        if (next == end) break;
        end = next;
    }
    const std::string_view figure = text.substr(0, end);
    text.remove_prefix(end);
    return figure;
}

bool BeginsTarget(std::string_view piece) {
    const CReadDegree degree = ReadDegree(piece);
    return (degree.IsRead() && !degree.mIsDigit) || IsWordOfNeapolitan(piece);
}

void CutPiece(std::string_view piece, CNumeralPieces& pieces) {
    const bool isLast = !pieces.mBass.empty();
    if (piece.empty() || isLast) return pieces.Fail(kNoNumeralTarget, piece);
    if (BeginsTarget(piece)) {
        if (pieces.mTargetCount == CNumeralPieces::kMostTargets)
            return pieces.Fail(kNoNumeralTarget, piece);
        pieces.mTargets[pieces.mTargetCount++] = piece;
        return;
    }
    pieces.mIsExactBass = piece.front() == '^';
    if (pieces.mIsExactBass) piece.remove_prefix(1);
    if (piece.empty()) return pieces.Fail(kNoNumeralTarget, piece);
    pieces.mBass = piece;
}

}  // namespace

CNumeralPieces NumeralPiecesOf(std::string_view text) {
    CNumeralPieces pieces;
    pieces.mChord = TakeFigureWithSlashes(text);
    while (!text.empty() && pieces.mFault.empty()) {
        text.remove_prefix(1);
        const std::string_view piece = text.substr(0, text.find('/'));
        text.remove_prefix(piece.size());
        const bool isFirst = pieces.mTargetCount == 0 && pieces.mBass.empty();
        if (isFirst && piece.starts_with('o') && pieces.mSlashedTail.empty()) {
            pieces.mSlashedTail = piece;
        } else {
            CutPiece(piece, pieces);
        }
    }
    return pieces;
}

}  // namespace brindle
