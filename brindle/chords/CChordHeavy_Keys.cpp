// SPDX-License-Identifier: MIT
// Questions in which only the root's key and a set of semitones count, as for a compact chord.
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"

namespace brindle {

std::int64_t CChordHeavy::QuantizeToChord(std::int64_t noteNr, TQuantizeDirection direction) const {
    return CChordLite(RootKeyEnh(), {}, Semitones()).QuantizeToChord(noteNr, direction);
}

std::int64_t CChordHeavy::QuantizeToBasicChord(std::int64_t noteNr,
                                               TQuantizeDirection direction) const {
    return CChordLite(RootKeyEnh(), {}, {})
        ._QuantizeToSemitones(noteNr, direction, BasicChordSemitones());
}

int CChordHeavy::ChordKeyNrFromKeyNr(int keyNr) const {
    return CChordLite(RootKeyEnh(), {}, {}).ChordKeyNrFromKeyNr(keyNr);
}

int CChordHeavy::KeyNrFromChordKeyNr(int chordKeyNr) const {
    return CChordLite(RootKeyEnh(), {}, {}).KeyNrFromChordKeyNr(chordKeyNr);
}

}  // namespace brindle
