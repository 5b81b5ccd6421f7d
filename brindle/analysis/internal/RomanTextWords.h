// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <optional>
#include <string_view>

namespace brindle {

/// The measures that a line of RomanText speaks of: `m12`, `m12a`, `m12var1`, `m5-8`.
struct CMeasureRange {
    int mFirst = 0;
    int mLast = 0;
    /// Another reading of a measure that is read already.
    bool mIsVariant = false;
    /// `m8a`, `m8b`: endings under one number.
    bool mHasLetter = false;
};

/// Takes the measures that the text begins with; nothing, and nothing taken, if there are none.
[[nodiscard]] std::optional<CMeasureRange> TakeMeasures(std::string_view& text);

/// Whether a line begins as that of a measure does, so that it is no header.
[[nodiscard]] bool LooksLikeMeasure(std::string_view line);

/// The beat of `b2.5`, from 1; nothing for another word. Thirds and sixths are exact, however many
/// digits they are written with. `b1.66.5` is half a third behind `b1.66`.
[[nodiscard]] std::optional<double> BeatOf(std::string_view word);

/// The key of `Eb:` or `f#:`, or in words, `E flat:` and `a minor:`. Small letters are minor unless
/// a word says major. Nothing for another word.
[[nodiscard]] std::optional<CSignKeyLite> KeyOf(std::string_view word);

/// A time signature: `3/4`, `C`, `Cut`, `slow 6/8`.
struct CTimeSignature {
    int mBeats = 4;
    int mBeatValue = 4;
    /// 6/8 in six beats instead of two.
    bool mIsSlow = false;

    /// In quarter notes.
    [[nodiscard]] double BarLength() const { return mBeats * 4.0 / mBeatValue; }
    [[nodiscard]] double BeatLength() const;
};

[[nodiscard]] std::optional<CTimeSignature> TimeSignatureOf(std::string_view text);

/// Takes the next word and the white space before it; empty at the end. The words of a key are one.
[[nodiscard]] std::string_view TakeWord(std::string_view& text);

}  // namespace brindle
