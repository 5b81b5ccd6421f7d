// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <string_view>

namespace brindle {

class CScaleHeavy;
struct CChordNamePrefs;
struct CScaleLite;

/// Reads a scale as people type it, "C dorian", "Bbm", "E♭ blues minor": a key, then the word of
/// a scale in any letter case. A bare key or a word that is not known means major. Without a key
/// the root stays undefined and the word is read from the start of the text.
void SetFromString(std::string_view text, CScaleLite& scale, const CChordNamePrefs& prefs);
/// The same for a full scale; a mask of the catalogue becomes that scale.
void SetFromString(std::string_view text, CScaleHeavy& scale, const CChordNamePrefs& prefs);

/// The mask of the scale word that is all of `text` from `pos` on, blanks apart; `pos` moves
/// behind it. 2741, the major scale, when there is nothing left or no word that is known: then
/// `pos` only moves past the blanks.
CSemitones _SemitonesScaleFromString(std::string_view text, int& pos);

}  // namespace brindle
