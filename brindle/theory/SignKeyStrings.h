// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/TSignKeyType.h"

#include <string_view>

namespace brindle {

class CSignKeyHeavy;
struct CChordNamePrefs;
struct CSignKeyLite;
struct CSignKeyNoEnh;

/// Reads a sign key as people type it, "C", "F# minor", "B♭m": a key, then the word of its type
/// in any letter case. A bare key or a word that is not known means major. Without a key the root
/// stays undefined and the type is read from the start of the text.
void SetFromString(std::string_view text, CSignKeyLite& signKey, const CChordNamePrefs& prefs);
/// The same, without the spelling.
void SetFromString(std::string_view text, CSignKeyNoEnh& signKey, const CChordNamePrefs& prefs);
/// The same, with its scale.
void SetFromString(std::string_view text, CSignKeyHeavy& signKey, const CChordNamePrefs& prefs);

/// The type whose word is all of `text` from `pos` on, blanks apart; `pos` moves behind it. Major
/// when there is nothing left or no word that is known: then `pos` only moves past the blanks.
TSignKeyType _SignKeyTypeFromString(std::string_view text, int& pos);

}  // namespace brindle
