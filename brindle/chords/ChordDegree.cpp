// SPDX-License-Identifier: MIT
#include "brindle/chords/ChordDegree.h"
#include "brindle/chords/internal/KeySpelling.h"

#include <cstdlib>

namespace brindle {

CKeyEnh CChordDegree::KeyOver(const CKeyEnh& root) const {
    if (root.IsUndef() || IsUndef()) return {};
    const int letter = (LetterOf(root) + mNumber - 1) % 7;
    const int keyNr = FoldIntoOctave(root.mKeyNr + Tone());
    const int signs = SmallestKeyIntvlBetween(KeyNrOfLetter(letter), keyNr);
    if (std::abs(signs) > 2) return {};
    return {keyNr, SemitoneToEnh(signs)};
}

std::string CChordDegree::Name() const {
    const auto count = static_cast<std::size_t>(std::abs(mSigns));
    return std::string(count, mSigns < 0 ? 'b' : '#') + std::to_string(mNumber);
}

}  // namespace brindle
