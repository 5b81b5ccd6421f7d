// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <array>
#include <span>

namespace brindle {

/// One name for each key number in a progression, as roots and as basses, so that no Gbmaj7 stands
/// beside an F#7 and no E7/G# beside an Abm. For chords that come from songs in different keys.
///
/// A name is that of the line of fifths around the tonic: from the lowered second to the raised
/// fourth in major, C has Db to F#; from the lowered fifth to the leading tone in minor, A minor
/// has Eb to G#. Nobody types double signs, and Cb, Fb, E# and B# are roots only in keys that have
/// them: in Ab the lowered sixth is E.
///
/// Another name is taken where all chords with this key agree on it: diminished chords that lead
/// upwards (C#o7 in C), and basses that their chord has, or that are its seventh (A/C#, Db/Cb).
class CProgressionSpelling {
public:
    /// Changes nothing.
    CProgressionSpelling() = default;
    /// The names for these chords, undefined ones among them left out, in a key; an undefined key
    /// changes nothing. Without chords each name is that of the key.
    explicit CProgressionSpelling(const CSignKeyLite& key, std::span<const CChordLite> chords = {});

    /// The chord with the names of the progression.
    [[nodiscard]] CChordLite Spelled(const CChordLite& chord) const;

private:
    /// By key number; undefined ones change nothing.
    std::array<CKeyEnh, 12> mNames{};
};

}  // namespace brindle
