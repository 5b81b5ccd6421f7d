// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/theory/CSemitones.h"

#include <string_view>

namespace brindle {

struct CNumeralOptions;

/// What the tones of a numeral are counted from: its degree, and whether the key is minor.
struct CNumeralRoot {
    CNumeralDegree mDegree;
    TSignKeyType mKeyType;
    bool mIsSmall;
};

/// The tones of a numeral above its root, and which of them is the bass: 1 for the root, 3 for the
/// third and so on.
struct CReadTones {
    CSemitones mSemitones;
    int mBassStep = 1;
};

/// The tones of what stands behind a degree: `7`, `o65`, `^7#11`, `sus`. Empty if it says nothing.
[[nodiscard]] CReadTones TonesOfTail(std::string_view tail, const CNumeralRoot& root,
                                     const CNumeralOptions& options);

/// Changes the tones by what stands in square brackets: `no5`, `add4`, `b3`. The tones that are
/// added are those of the key. False if it is not understood; then `group` begins with what is not.
[[nodiscard]] bool ApplyGroup(std::string_view& group, const CNumeralRoot& root, CReadTones& tones);

/// The interval from the root of a numeral to the tone of the key so many steps above it, 1 for the
/// root.
[[nodiscard]] int IntvlInKey(const CNumeralRoot& root, int step);

/// Semitones from the root to the tone of a step, -1 if the chord has none.
[[nodiscard]] int SemitoneOfStep(CSemitones semitones, int step);

/// The step of a tone above the root, 1 to 7: what is a minor third in one chord is an augmented
/// ninth, 2, in another.
[[nodiscard]] int StepOfSemitone(CSemitones semitones, int semitone);

}  // namespace brindle
