// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

struct CSong;
struct CSongReading;

/// What a lead sheet shows, as JSON, for hosts that draw it themselves: the bars as they are
/// written with their signs, the chords with the pieces of their symbols and numerals, arrows,
/// brackets, and keys with their colors; see docs/json.md. It is what LeadSheetSvg draws, before it
/// is laid out. `reading` is that of the chords of the song; what it lacks is left out. Linear in
/// the length of the song.
[[nodiscard]] std::string SheetJson(const CSong& song, const CSongReading& reading);

}  // namespace brindle
