// SPDX-License-Identifier: MIT
#pragma once

#include <span>

namespace brindle {

/// A song of the built-in model as a chord text.
struct CBuiltInSongRow {
    const char* mStyle;
    const char* mTitle;
    const char* mMakers;
    /// Empty where the chords show it.
    const char* mKey;
    double mBeatsPerBar;
    /// Of a word; 0 for bars whose words share them evenly.
    double mBeatsPerChord;
    const char* mText;
};

[[nodiscard]] std::span<const CBuiltInSongRow> BuiltInSongRows();

}  // namespace brindle
