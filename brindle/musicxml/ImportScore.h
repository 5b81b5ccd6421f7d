// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParserDelegate.h"
#include "brindle/platform/Error.h"

#include <cstdint>
#include <string_view>

namespace brindle {

/// Imports the bytes of a score as MusicXmlParser does, in memory alone; with `isContainer` those
/// of a compressed one. `ticksPerQuarter` is the unit of its times. False with the error when that
/// failed; what the host throws goes through.
[[nodiscard]] bool ImportScore(std::string_view bytes, bool isContainer,
                               std::int32_t ticksPerQuarter, const MusicXmlParserDelegate& host,
                               Error& error);

}  // namespace brindle
