// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

#include <cstdint>

namespace brindle {

/// An element of a score and where it stands in time.
struct CPositionedXMLElement {
    /// In ticks from the start of the part. An `offset` inside the element is not applied.
    std::int32_t PositionAsMidiTicks = kMuxmlUndef;
    XmlNode XMLElement;                  ///< of the document of the import, which owns it
    std::uint64_t CurrentDivisions = 0;  ///< units of the file in a quarter, at this place

    CPositionedXMLElement() = default;
    /// `initWithPosition:andXMLElement:currentDivisions:`
    CPositionedXMLElement(std::int32_t position, XmlNode element, std::uint64_t divisions)
        : PositionAsMidiTicks(position), XMLElement(element), CurrentDivisions(divisions) {}

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("PositionAsMidiTicks", &CPositionedXMLElement::PositionAsMidiTicks),
            MuxmlField("XMLElement", &CPositionedXMLElement::XMLElement),
            MuxmlField("CurrentDivisions", &CPositionedXMLElement::CurrentDivisions));
    }
};

}  // namespace brindle
