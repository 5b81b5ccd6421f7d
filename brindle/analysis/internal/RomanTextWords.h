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

/// The beat of `b2.5`, from 1; nothing for another word. Thirds and sixths are exact, however many
/// digits they are written with.
[[nodiscard]] std::optional<double> BeatOf(std::string_view word);

/// The key of `Eb:` or `f#:`, small letters minor; nothing for another word.
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

/// Takes the next word and the white space before it; empty at the end.
[[nodiscard]] std::string_view TakeWord(std::string_view& text);

}  // namespace brindle
