// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/theory/CHarmCenterLite.h"

#include <iosfwd>

namespace brindle {

class CHarmAnlsSignKey;

/// A harmonic center, the chords that it governs, and where it begins. It holds until the next
/// center of its list begins; where that is in another tonality, the music modulates, or tonicizes
/// a degree for a few chords.
class CHarmAnlsCenter {
public:
    /// 0 to 1, more where equal readings were added up; `kPosUndef` when no route stated one.
    double mProbability = kPosUndef;
    /// Start in beats; `kPosUndef` when unknown.
    double mPosition = kPosUndef;
    CHarmCenterLite mHarmCenter;  ///< the tonic and its scale; undefined where none was found
    CHarmAnlsChords mChords;      ///< in the order of time, perhaps with an end marker

    /// True when there is no tonic.
    [[nodiscard]] bool IsUndef() const { return mHarmCenter.IsUndef(); }

    /// An undefined center takes key and mode of the sign key, and its position if its own is
    /// unknown.
    void IfUndefFillWithHarmSignKey(const CHarmAnlsSignKey& signKey);
    /// Sets the distances of all chords to this center. Nothing for an undefined center.
    void AnalyseHarmFunctionsOfChords();

    /// Writes an object with all fields. No strict JSON: its list of chords ends with a comma.
    void AppendJSONString(std::ostream& stream) const;

    /// Compares everything but the probability.
    friend bool operator==(const CHarmAnlsCenter& a, const CHarmAnlsCenter& b) {
        return a.mPosition == b.mPosition && a.mHarmCenter == b.mHarmCenter &&
               a.mChords == b.mChords;
    }
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsCenter& center);

}  // namespace brindle
