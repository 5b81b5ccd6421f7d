// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

#include <cstdint>

namespace brindle {

/// An element of a score and where it stands in time.
struct CPositionedXMLElement {
    std::int32_t PositionAsMidiTicks = kMuxmlUndef;
    XmlNode XMLElement;
    std::uint64_t CurrentDivisions = 0;  ///< units of the file in a quarter, at this place

    CPositionedXMLElement() = default;
    /// `initWithPosition:andXMLElement:currentDivisions:`
    CPositionedXMLElement(std::int32_t position, XmlNode element, std::uint64_t divisions)
        : PositionAsMidiTicks(position), XMLElement(element), CurrentDivisions(divisions) {}

    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("PositionAsMidiTicks", &CPositionedXMLElement::PositionAsMidiTicks),
            MuxmlField("XMLElement", &CPositionedXMLElement::XMLElement),
            MuxmlField("CurrentDivisions", &CPositionedXMLElement::CurrentDivisions));
    }
};

}  // namespace brindle
