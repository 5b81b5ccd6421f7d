// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string_view>

namespace brindle {

/// Which letter a key is named from, told by the accidental of the written note: D flat is
/// `TEnh_b`, C sharp is `TEnh_s`. The value 6 is not used.
enum TEnh : std::int8_t {
    TEnh_bbb = -1,
    TEnh_bb = 0,
    TEnh_b = 1,
    TEnh_n = 2,
    TEnh_s = 3,
    TEnh_ss = 4,
    TEnh_sss = 5,
    TEnh_Undef = 7,
};

/// The spelling of an exact lower-case word ("flat", "double sharp"); `TEnh_Undef` for any other
/// text, "undef" included.
[[nodiscard]] TEnh EnhFromStdString(std::string_view word);
/// The same for a C string; a null pointer gives `TEnh_Undef`.
[[nodiscard]] TEnh EnhFromString(const char* word);

/// Writes the word of the spelling, or "unknown TEnh " and its number.
std::ostream& operator<<(std::ostream& stream, TEnh enh);

}  // namespace brindle
