// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlNote.h"
#include "brindle/musicxml/CPositionedXMLElement.h"

#include <cstdint>
#include <vector>

namespace brindle {

/// A change of loudness at a position.
struct CVelocityFromDynamicsEl {
    std::int32_t mPositionAsMidiTicks = 0;  ///< from where it holds
    std::uint8_t mVelocity = 0;             ///< 0 to 127
};

/// The place of loudness that signs such as "mf" tell. They are not looked at: the list stays empty
/// and all notes are equally loud.
struct CVelocityFromDynamics : std::vector<CVelocityFromDynamicsEl> {
    /// A forte; MusicXML tells the loudness of notes in percent of it.
    static constexpr std::uint8_t kVelocity = 90;

    void Update(const CPositionedXMLElement&) {}  ///< changes nothing, whatever the direction says
    /// `kVelocity` for every note; accents count elsewhere.
    [[nodiscard]] std::uint8_t VelocityForNote(const CMuxmlNote&) const { return kVelocity; }
};

}  // namespace brindle
