// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TScaleType.h"

namespace brindle {

/// The mask of a named scale; empty for `st_custom`, `st_Undef` and any other value.
///
/// `BebopDominant` is 0 2 4 5 7 8 9 10 here, not the notes of its catalogue row: those belong to
/// `st_majaddb7`, so that each mask leads back to one type.
[[nodiscard]] CSemitones SemitonesFromScaleType(TScaleType type);

/// The named scale of a mask: `st_Undef` for the empty mask, `st_custom` for one without a name.
[[nodiscard]] TScaleType ScaleTypeFromSemitones(CSemitones semitones);

}  // namespace brindle
