// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace brindle {

struct CSong;
struct CSongReading;

/// What a lead sheet shows, as JSON, for hosts that draw it themselves: the bars as they are
/// written with their signs, the chords with the pieces of their symbols and numerals, arrows,
/// brackets, and keys with their colors; see docs/json.md. It is what LeadSheetSvg draws, before it
/// is laid out. `reading` is that of the chords of the song; what it lacks is left out. Linear in
/// the length of the song.
[[nodiscard]] std::string SheetJson(const CSong& song, const CSongReading& reading);

/// How a chord symbol or a numeral is set there, "Bbm7" or "V7/ii", as a JSON array of its pieces:
/// text, size, and base line above that of the whole, both in em.
[[nodiscard]] std::string TextRunsJson(std::string_view text, bool isNumeral);

}  // namespace brindle
