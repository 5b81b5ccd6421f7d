// SPDX-License-Identifier: MIT
#include "brindle/song/WriteChordText.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/song/HarmonySymbols.h"
#include "brindle/song/SheetTimes.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>

namespace brindle {
namespace {

// More steps than this are no song but a file of hundreds of megabytes.
constexpr double kMostTextSteps = 1e7;
constexpr int kBarsPerLine = 4;
constexpr std::string_view kHold = ".";
constexpr std::string_view kBarLine = "|";
// What a chord text calls a rest, as no chord symbol begins like this.
constexpr std::string_view kRest = "nochord";

bool IsWhole(double number) {
    return std::abs(number - std::round(number)) < 1e-6;
}

class CChordTextWriter {
public:
    explicit CChordTextWriter(const TMusicXMLDoc& sheet) : mSheet(sheet) {
        mResult.mBeatsPerBar = BeatsPerBarOf(mSheet);
        mUpbeat = Upbeat();
        mResult.mBeatsPerChord = Step();
    }

    [[nodiscard]] std::optional<CChordText> Write() {
        mEnd = StepOf(EndOf(mSheet));
        if (!(static_cast<double>(mEnd) < kMostTextSteps)) return std::nullopt;
        for (std::size_t i = 0; i < mSheet.Harmonies.size(); ++i) {
            const std::int64_t step = StepOf(mSheet.Harmonies[i].mPosition);
            const bool isLast = i + 1 == mSheet.Harmonies.size();
            // Of several chords at one place the last one sounds.
            if (!isLast && StepOf(mSheet.Harmonies[i + 1].mPosition) == step) continue;
            HoldUntil(step);
            Token(SymbolText(mSheet.Harmonies[i]));
            ++mStep;
        }
        HoldUntil(mEnd);
        if (!mResult.mText.empty()) mResult.mText += '\n';
        return std::move(mResult);
    }

private:
    // How far the first bar line inside the song is from the beginning of a whole bar.
    [[nodiscard]] double Upbeat() const {
        if (mSheet.HarmBarlines.size() < 2) return 0.0;
        const double first = mSheet.HarmBarlines[1].mPosition;
        return first > 0.0 && first < mResult.mBeatsPerBar ? mResult.mBeatsPerBar - first : 0.0;
    }

    // The longest step in which all chords and bars begin.
    [[nodiscard]] double Step() const {
        constexpr auto parts = std::to_array<int>({1, 2, 4, 3, 6, 8, 12, 16, 24, 48});
        const auto fits = [&](int count) {
            const auto isStep = [&](double position) {
                return IsWhole((position + mUpbeat) * count);
            };
            return isStep(mResult.mBeatsPerBar) &&
                   std::all_of(mSheet.Harmonies.begin(), mSheet.Harmonies.end(),
                               [&](const auto& harmony) { return isStep(harmony.mPosition); });
        };
        const auto found = std::find_if(parts.begin(), parts.end(), fits);
        return 1.0 / (found == parts.end() ? parts.back() : *found);
    }

    [[nodiscard]] std::int64_t StepOf(double position) const {
        return std::llround(std::min((position + mUpbeat) / mResult.mBeatsPerChord, 1e15));
    }

    static std::string SymbolText(const TMusicXMLHarmony& harmony) {
        const std::string symbol = HarmonySymbol(harmony);
        return symbol == kNoChordSymbol || symbol == "?" ? std::string(kRest) : symbol;
    }

    void HoldUntil(std::int64_t step) {
        for (; mStep < step && mStep < mEnd; ++mStep) Token(kHold);
    }

    void Token(std::string_view token) {
        const double bar =
            static_cast<double>(mStep) * mResult.mBeatsPerChord / mResult.mBeatsPerBar;
        std::string& text = mResult.mText;
        if (mStep > 0 && IsWhole(bar)) {
            ++mBarCount;
            text += ' ';
            text += kBarLine;
            if (mBarCount % kBarsPerLine == 0) text += '\n';
        }
        if (!text.empty() && text.back() != '\n') text += ' ';
        text += token;
    }

    const TMusicXMLDoc& mSheet;
    CChordText mResult;
    double mUpbeat = 0.0;
    std::int64_t mStep = 0;
    std::int64_t mEnd = 0;
    int mBarCount = 0;
};

}  // namespace

std::optional<CChordText> WriteChordText(const TMusicXMLDoc& sheet) {
    return CChordTextWriter(sheet).Write();
}

}  // namespace brindle
