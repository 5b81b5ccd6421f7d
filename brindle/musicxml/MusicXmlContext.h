// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlMeasure.h"
#include "brindle/musicxml/CMuxmlNote.h"
#include "brindle/musicxml/CMuxmlPartGatheredInfo.h"
#include "brindle/musicxml/CMuxmlSignKey.h"
#include "brindle/musicxml/CMuxmlSignTime.h"
#include "brindle/musicxml/CPlayedTies.h"
#include "brindle/musicxml/CTiePendingInfos.h"
#include "brindle/musicxml/CVelocityFromDynamics.h"

#include <cstdint>
#include <vector>

namespace brindle {

/// The state of an import: the running position, the unit of time of the file, what is in force in
/// the part, and cursors into the elements of the document. All delegates of an import share one.
///
/// Three units of time are kept apart. `AsMidiTicks`: ticks from the start of the part.
/// `AsDuration`: the file's own unit, CurrentDivisionsPQN to the quarter. `AsDurDiv`: fractions of
/// a whole note. The fields may be read and set directly. Not for use by two threads at once.
class MusicXmlContext {
public:
    /// What is learned about the part that is read; told at its end.
    CMuxmlPartGatheredInfo mCurrentPartGatheredInfo;
    /// The one that ended last; while one is read, the default.
    CMuxmlMeasure CurrentMeasure;
    CMuxmlSignTime CurrentSignTime;    ///< in force; 4/4 at the start of a part
    CMuxmlSignKey CurrentSignKey;      ///< in force; C major at the start of a part
    CMuxmlClef CurrentClef;            ///< the last one read, of whichever staff
    CMuxmlTranspose CurrentTranspose;  ///< in force; none at the start of a part
    /// The last note that did not start together with the one before it.
    CMuxmlNote CurrentFirstChordNote;
    CTiePendingInfos TiePendingInfos;            ///< chains of tied notes whose end has not come
    CPlayedTies PlayedTies;                      ///< the same as they are heard
    CVelocityFromDynamics VelocityFromDynamics;  ///< says 90 for all notes
    bool InXMLElementBackup = false;             ///< the next duration moves the position back
    bool InXMLElementForward = false;            ///< the next duration moves it on
    bool InXMLElementSound = false;              ///< not used
    /// Goes into all notes; nothing sets it to another than 0.
    std::uint8_t CurrentMidiChannel = 0;
    std::int32_t TicksPerQuarter = 0;  ///< kept from part to part; below 1 all lengths are 0
    /// Cursors into the three lists below, from 0; -1 before the first element.
    std::int32_t CurrentPartMeasuresXMLIx = -1;
    std::int32_t CurrentPartMeasureNotesXMLIx = -1;       ///< likewise, of the measure
    std::int32_t CurrentPartMeasureDirectionsXMLIx = -1;  ///< likewise
    std::int32_t CurrentPosAsMidiTicks = 0;               ///< where the next note begins
    /// What an incomplete first bar lacks.
    std::int32_t ShiftNotePosInIncompleteFirstBarAsDuration = 0;
    /// The position before the last advance: where the first note of a chord began.
    std::int32_t LastPosAsMidiTicks = 0;
    /// The same as it is written, where the end of a tie has not moved it.
    std::int32_t WrittenChordPosAsMidiTicks = 0;
    std::int32_t MaxCurrentPosAsMidiTicks = 0;    ///< the farthest position of the part so far
    std::int32_t CurrentBarStartAsMidiTicks = 0;  ///< where the measure that is read begins
    std::int32_t CurrentPartMeasureCount = 0;     ///< not used
    /// Units of the file in a quarter; 0 makes all lengths 0.
    std::uint64_t CurrentDivisionsPQN = 1;
    XmlNode CurrentPartXML;                            ///< the first `part` with the identifier
    std::vector<XmlNode> CurrentPartMeasuresXMLs;      ///< its measures
    std::vector<XmlNode> CurrentPartMeasureNotesXMLs;  ///< all `note` below the measure
    std::vector<XmlNode> CurrentPartMeasureDirectionsXMLs;  ///< all `direction` below it
    /// From the bar line, an upbeat counted from where its full bar would begin. Kept: a `backup`
    /// makes it grow, too.
    std::int64_t CurrentPosInBarAsDuration = 0;

    /// `init`, with 0 ticks.
    MusicXmlContext() = default;
    /// `initWithTicksPerQuarter:`
    explicit MusicXmlContext(std::int32_t ticksPerQuarter) : TicksPerQuarter(ticksPerQuarter) {}

    /// Makes everything as new but for the ticks to the quarter.
    void resetCurrentPartMembers();

    /// The elements at the cursors; empty handles beside the lists.
    [[nodiscard]] XmlNode CurrentPartMeasureXML() const;
    /// One note, in spite of the name.
    [[nodiscard]] XmlNode CurrentPartMeasureNoteXMLs() const;
    /// Where the last `direction` began.
    [[nodiscard]] XmlNode CurrentPartMeasureDirectionXML() const;
    /// To be changed in place.
    [[nodiscard]] CMuxmlPartGatheredInfo* CurrentPartGatheredInfo() {
        return &mCurrentPartGatheredInfo;
    }

    /// Takes the divisions that are told first below the element, if there are any.
    /// `UpdateCurrentDivisionsPQNFromXmlElement:`
    void UpdateCurrentDivisionsPQNFromXmlElement(const XmlNode& element);

    /// `ConvertMuxmlDurationToMidiTicks:` Undefined stays undefined; fractions of a tick are cut
    /// off. 0 without ticks or divisions.
    [[nodiscard]] std::int32_t ConvertMuxmlDurationToMidiTicks(std::int32_t duration) const;
    /// `ConvertMuxmlDynamicsToMidiVelocity:` Percent of the velocity 90, limited to 1 to 127; 255,
    /// no value, if negative.
    [[nodiscard]] static std::uint8_t ConvertMuxmlDynamicsToMidiVelocity(std::int32_t dynamics);
    /// `ConvertMuxmlDynamicsToMidiRelVelocity:` The same, limited to 0 to 129.
    [[nodiscard]] static std::uint8_t ConvertMuxmlDynamicsToMidiRelVelocity(std::int32_t dynamics);

    /// `AdvanceCurrentPosByMidiTicks:andDuration:` Moves the position, back if negative, but not
    /// before the start of the bar.
    void AdvanceCurrentPosByMidiTicks(std::int32_t ticks, std::int32_t duration);
    /// `AdvanceCurrentPosEvenBeforeBarStartByMidiTicks:andDuration:` The same, but only not before
    /// the start of the part.
    void AdvanceCurrentPosEvenBeforeBarStartByMidiTicks(std::int32_t ticks, std::int32_t duration);
};

}  // namespace brindle
