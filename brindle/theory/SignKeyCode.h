// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/TSignKeyType.h"

#include <utility>
#include <vector>

namespace brindle {

/// A sign key in one byte, as events carry it.
///
/// 0 to 14 are the major keys from C flat with seven flats to C sharp with seven sharps, 16 to 30
/// the minor keys from A flat to A sharp: the code less 7 or 23 is the number of sharps, and bit 4
/// is set on all minors. 15 is undefined.
inline constexpr unsigned char kSignKeyCodeUndef = 15;

/// 15 gives undefined, bit 4 minor, anything else major, codes above 30 included.
[[nodiscard]] TSignKeyType ToSignKeyType(unsigned char code);
/// The mask of that type.
[[nodiscard]] CSemitones ToSemitones(unsigned char code);
/// Both undefined for 15 and for a code above 30.
[[nodiscard]] std::pair<CKeyEnh, TSignKeyType> ToRootKeyEnhAndSignKeyType(unsigned char code);
/// The same with the mask of the type.
[[nodiscard]] std::pair<CKeyEnh, CSemitones> ToRootKeyEnhAndSemitones(unsigned char code);

/// The code of a sign key. A root without a senseful spelling is spelled with the fewest signs
/// first; a key that has no code, G sharp major for instance, gives 15.
[[nodiscard]] unsigned char ToSignKeyInEv(CKeyEnh root, TSignKeyType type);
/// The same for a mask: 2741 is major, 1453 minor, any other undefined.
[[nodiscard]] unsigned char ToSignKeyInEv(CKeyEnh root, CSemitones semitones);
/// The code of the sign key in the spelling with the fewest signs: A flat major for G sharp major.
[[nodiscard]] unsigned char _ToSignKeyInEv_GuessEnhWithLeastSignes(CKeyEnh root, TSignKeyType type);
/// The older form: 255 for an undefined sign key, and a key without a code is respelled with the
/// fewest signs.
[[nodiscard]] unsigned char ToSignKeyInEvDeprecated(const CSignKeyLite& signKey);

/// The thirty sign keys that have a code, in its order.
[[nodiscard]] const std::vector<CSignKeyLite>& CSignKeyLite_AllSignKeysPossibleInThornbank();

}  // namespace brindle
