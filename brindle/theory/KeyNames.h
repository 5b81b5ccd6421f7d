// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/TEnh.h"

#include <span>
#include <string>
#include <string_view>

namespace brindle {

struct CChordNamePrefs;

/// The signs U+266F and U+266D in UTF-8.
inline constexpr std::string_view kUtf8Sharp = "\xE2\x99\xAF";
/// The flat sign.
inline constexpr std::string_view kUtf8Flat = "\xE2\x99\xAD";

/// The name of a key with its accidental: "Eb", "Es", "Mib". "Undef" for key 15; any other number
/// beyond 0 to 11 counts as the nearer end. Triple accidentals and `TEnh_Undef` give the name of
/// the natural or the usual black key.
[[nodiscard]] std::string KeyNrAndEnhToName(int keyNr, TEnh enh, const CChordNamePrefs& prefs);

/// The letter or syllable alone; `enh` selects which letter. German names keep their endings. The
/// key is 0 to 11, for any other number the result is "Undef".
[[nodiscard]] std::string KeyNrToNameIgnoringEnh(int keyNr, TEnh enh, const CChordNamePrefs& prefs);

/// "#" with `mAsciiAccidentals`, else `kUtf8Sharp`.
[[nodiscard]] std::string_view SharpAsUTF8OrNot(const CChordNamePrefs& prefs);
/// "b" with `mAsciiAccidentals`, else `kUtf8Flat`.
[[nodiscard]] std::string_view FlatAsUTF8OrNot(const CChordNamePrefs& prefs);

/// Replaces every `kUtf8Sharp` by "#" and every `kUtf8Flat` by "b", in place.
void ConvertUtf8SharpAndFlatToAscii(std::string& text);
/// The same on characters; gives those that are left, at the start of `text`.
std::span<char> ConvertUtf8SharpAndFlatToAscii(std::span<char> text);

/// A blank or nothing, by `mNoSpaceBetweenNameParts`.
[[nodiscard]] std::string_view OptionalSpaceBetweenNameParts(const CChordNamePrefs& prefs);
/// A blank or nothing, by `mNoSpaceAroundSlash`.
[[nodiscard]] std::string_view OptionalSpaceAroundSlash(const CChordNamePrefs& prefs);

}  // namespace brindle
