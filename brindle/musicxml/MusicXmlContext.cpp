// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MusicXmlContext.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

#include <algorithm>

namespace brindle {

namespace {

// The percentages of dynamics are of this velocity, a forte.
constexpr std::int64_t kForte = 90;
constexpr std::uint8_t kVelocityNotTold = 255;

XmlNode At(const std::vector<XmlNode>& nodes, std::int32_t index) {
    if (index < 0 || static_cast<std::size_t>(index) >= nodes.size()) return {};
    return nodes[static_cast<std::size_t>(index)];
}

}  // namespace

void MusicXmlContext::resetCurrentPartMembers() {
    *this = MusicXmlContext(TicksPerQuarter);
}

XmlNode MusicXmlContext::CurrentPartMeasureXML() const {
    return At(CurrentPartMeasuresXMLs, CurrentPartMeasuresXMLIx);
}

XmlNode MusicXmlContext::CurrentPartMeasureNoteXMLs() const {
    return At(CurrentPartMeasureNotesXMLs, CurrentPartMeasureNotesXMLIx);
}

XmlNode MusicXmlContext::CurrentPartMeasureDirectionXML() const {
    return At(CurrentPartMeasureDirectionsXMLs, CurrentPartMeasureDirectionsXMLIx);
}

void MusicXmlContext::UpdateCurrentDivisionsPQNFromXmlElement(const XmlNode& element) {
    const XmlNode divisions = element.firstDescendant("divisions");
    if (divisions) CurrentDivisionsPQN = muxml::ReadUnsigned(divisions.stringValue());
}

std::int32_t MusicXmlContext::ConvertMuxmlDurationToMidiTicks(std::int32_t duration) const {
    if (TicksPerQuarter < 1 || CurrentDivisionsPQN == 0) return 0;
    if (duration == kMuxmlUndef) return duration;
    const std::int64_t ticks = muxml::WrappedProduct(TicksPerQuarter, duration);
    return static_cast<std::int32_t>(ticks / static_cast<std::int64_t>(CurrentDivisionsPQN));
}

std::uint8_t MusicXmlContext::ConvertMuxmlDynamicsToMidiVelocity(std::int32_t dynamics) {
    if (dynamics < 0) return kVelocityNotTold;
    return static_cast<std::uint8_t>(std::clamp<std::int64_t>(dynamics * kForte / 100, 1, 127));
}

std::uint8_t MusicXmlContext::ConvertMuxmlDynamicsToMidiRelVelocity(std::int32_t dynamics) {
    if (dynamics < 0) return kVelocityNotTold;
    return static_cast<std::uint8_t>(std::min<std::int64_t>(dynamics * kForte / 100, 129));
}

void MusicXmlContext::AdvanceCurrentPosEvenBeforeBarStartByMidiTicks(std::int32_t ticks,
                                                                     std::int32_t duration) {
    LastPosAsMidiTicks = CurrentPosAsMidiTicks;
    CurrentPosAsMidiTicks = std::max(0, muxml::WrappedSum(CurrentPosAsMidiTicks, ticks));
    MaxCurrentPosAsMidiTicks = std::max(MaxCurrentPosAsMidiTicks, CurrentPosAsMidiTicks);
    CurrentPosInBarAsDuration += duration;
}

void MusicXmlContext::AdvanceCurrentPosByMidiTicks(std::int32_t ticks, std::int32_t duration) {
    AdvanceCurrentPosEvenBeforeBarStartByMidiTicks(ticks, duration);
    if (CurrentPosAsMidiTicks >= CurrentBarStartAsMidiTicks) return;
    CurrentPosAsMidiTicks = CurrentBarStartAsMidiTicks;
    MaxCurrentPosAsMidiTicks = std::max(MaxCurrentPosAsMidiTicks, CurrentPosAsMidiTicks);
}

}  // namespace brindle
