// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string>
#include <string_view>

namespace brindle {

/// Which of the enharmonic names a key has: the letter that it is named from, told by the
/// accidental of the written note: D flat is `TEnh_b`, C sharp is `TEnh_s`. The value 6 is not
/// used.
enum TEnh : std::int8_t {
    TEnh_bbb = -1,   ///< triple flat
    TEnh_bb = 0,     ///< double flat
    TEnh_b = 1,      ///< flat
    TEnh_n = 2,      ///< natural: the letter itself
    TEnh_s = 3,      ///< sharp
    TEnh_ss = 4,     ///< double sharp
    TEnh_sss = 5,    ///< triple sharp
    TEnh_Undef = 7,  ///< not spelled
};

/// By how many semitones the accidental raises the letter, -3 to 3; 0 for `TEnh_Undef`.
[[nodiscard]] constexpr int EnhToSemitone(TEnh enh) {
    return enh >= TEnh_bbb && enh <= TEnh_sss ? enh - TEnh_n : 0;
}

/// The accidental that raises a letter by so many semitones. Beyond -3 to 3 it stays at
/// `TEnh_bbb` or `TEnh_sss`.
[[nodiscard]] constexpr TEnh SemitoneToEnh(int semitones) {
    if (semitones < -3) return TEnh_bbb;
    return semitones > 3 ? TEnh_sss : static_cast<TEnh>(semitones + TEnh_n);
}

/// The spelling of an exact lower-case word ("flat", "double sharp"); `TEnh_Undef` for any other
/// text, "undef" included.
[[nodiscard]] TEnh EnhFromStdString(std::string_view word);
/// The same for a C string; a null pointer gives `TEnh_Undef`.
[[nodiscard]] TEnh EnhFromString(const char* word);

/// The enumerator's name as it stands in code: "TEnh_bb". A value without one gives the cast that
/// makes it: "TEnh(6)".
[[nodiscard]] std::string StringForInitializerList(TEnh enh);

/// Writes the word of the spelling, or "unknown TEnh " and its number.
std::ostream& operator<<(std::ostream& stream, TEnh enh);

}  // namespace brindle
