// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CScaleLite.h"

namespace brindle {

/// Which chords a harmonic center tolerates when its range grows over its neighbours.
namespace ScaleLite {

/// Whether the chord is diatonic in the scale, or stands on its fifth degree (whatever its
/// quality), or is one of the borrowed chords below. A chord without notes is diatonic everywhere.
[[nodiscard]] bool ChordIsCompatibleWithScale(const CChordLite& chord, const CScaleLite& scale);

/// Whether the chord is one of three chords borrowed from minor that a major key forgives: the
/// major chords on the lowered third and seventh, and the minor subdominant (Eb, Bb, Fm in C).
[[nodiscard]] bool IsCompatibleOutlierChordOfScale(const CChordLite& chord,
                                                   const CScaleLite& scale);

}  // namespace ScaleLite
}  // namespace brindle
