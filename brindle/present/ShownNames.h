// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TBasicChord.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {
class CChordLite;
struct CHarmCenterLite;
class CScaleHeavy;
struct CSignKeyLite;
}  // namespace brindle

namespace brindle {

/// How the program reads and writes names: letters with "#" and "b", as people type them.
[[nodiscard]] const CChordNamePrefs& NamePrefs();

/// A pitch class as it is spelled: "F#", "Bb"; "Undef" for none.
[[nodiscard]] std::string KeyName(const CKeyEnh& keyEnh);

/// A tonality as texts and pictures name it: "F# minor"; "Undef" for none.
[[nodiscard]] std::string KeyInWords(const CSignKeyLite& key);
/// The same of a center: "D dorian"; a mask that is no mode has its root alone.
[[nodiscard]] std::string KeyInWords(const CHarmCenterLite& center);

/// The scale degree that lies `distance` semitones above a tonic, in Roman numerals: "V" for 7,
/// "bIII" for 3. Empty for -1.
[[nodiscard]] std::string_view DegreeName(int distance);

/// The function of a chord in a center in Roman numerals: "V", "IIm". Empty where it has none.
[[nodiscard]] std::string_view NumeralOf(const CChordLite& chord, const CHarmCenterLite& center);

/// The semitones of a mask: "0 4 7".
[[nodiscard]] std::string SemitonesText(CSemitones semitones);

/// The pitch classes of a scale from its root up, as the scale spells them; one that it does not
/// spell is spelled from the root.
[[nodiscard]] std::vector<CKeyEnh> KeysOf(const CScaleHeavy& scale);
/// "D E F".
[[nodiscard]] std::string NotesText(const std::vector<CKeyEnh>& keys);

/// "3 sharps", "1 flat", "none".
[[nodiscard]] std::string SignsText(int signsCount);

/// "major", "sus4", "none".
[[nodiscard]] std::string_view BasicChordName(TBasicChord basicChord);

}  // namespace brindle
