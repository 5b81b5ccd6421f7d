// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlClef.h"
#include "brindle/musicxml/CMuxmlMeasure.h"
#include "brindle/musicxml/CMuxmlNote.h"
#include "brindle/musicxml/CMuxmlPart.h"
#include "brindle/musicxml/CMuxmlPartGatheredInfo.h"
#include "brindle/musicxml/CMuxmlSignKey.h"
#include "brindle/musicxml/CMuxmlSignTime.h"
#include "brindle/musicxml/CMuxmlTranspose.h"
#include "brindle/musicxml/CPositionedXMLElement.h"

#include <cstdint>
#include <functional>
#include <string_view>

namespace brindle {

/// How much there is to import.
struct TMuxmlProgressBarInfo {
    std::int32_t mPartCount = 0;  ///< in the list of a partwise score; 0 for a timewise one

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mPartCount", &TMuxmlProgressBarInfo::mPartCount));
    }
};

/// A tempo that holds from a position on.
struct CMuxmlTempoChange {
    std::int32_t mPositionAsMidiTicks = 0;  ///< ticks from the start of the part
    float mTempo = 0;                       ///< quarters a minute

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mPositionAsMidiTicks", &CMuxmlTempoChange::mPositionAsMidiTicks),
            MuxmlField("mTempo", &CMuxmlTempoChange::mTempo));
    }
};

/// What a host is told while a score is read. An empty member is a method that the host does not
/// have. Records, and the elements that they refer to, are valid during the call only.
///
/// In a well-formed file of parts the order is: document start; for each part the time signature
/// 4/4 if its first measure has none, the part start, then for each measure its start, its contents
/// in their order, and its end; then the part end; at last the document end. Notes that are tied
/// come once, when the last of them is read.
struct MusicXmlParserDelegate {
    /// First of all, once.
    std::function<void(const TMuxmlProgressBarInfo& info)>
        didEncounterDocumentStartWithProgressBarInfo;
    /// Last of all, once.
    std::function<void()> didEncounterDocumentEnd;
    /// A part begins; its positions count from 0.
    std::function<void(const CMuxmlPart& part)> didEncounterPartStart;
    /// The same part ends.
    std::function<void(const CMuxmlPartGatheredInfo& info)> didEncounterPartEnd;
    /// A bar begins, in ticks from the start of the part.
    std::function<void(std::int32_t barStartAsMidiTicks)> didEncounterMeasureStart;
    /// The same bar ends; only now its number and its attributes are told.
    std::function<void(const CMuxmlMeasure& measure)> didEncounterMeasureEnd;
    /// The element `time` has ended, or a part begins without one: then 4/4 that is not printed.
    std::function<void(const CMuxmlSignTime& signTime)> didEncounterSignTime;
    /// The element `key` has ended.
    std::function<void(const CMuxmlSignKey& signKey)> didEncounterSignKey;
    /// Kept: clefs are only told to a host that has didEncounterSignKey, too.
    std::function<void(const CMuxmlClef& clef)> didEncounterClef;
    /// The element `transpose` has ended.
    std::function<void(const CMuxmlTranspose& transpose)> didEncounterTranspose;
    /// A `sound` that tells a tempo has started.
    std::function<void(const CMuxmlTempoChange& tempoChange)> didEncounterTempoChange;
    /// `didEncounterInstrumentWithName:midiChannel:` Not sent.
    std::function<void(std::string_view name, std::int32_t midiChannel)>
        didEncounterInstrumentWithName;
    /// A note that sounds, cue notes and grace notes among them; rests are not told.
    std::function<void(const CMuxmlNote& note)> didEncounterNote;
    /// A note as it is heard, where and as long as it is written; one of tied notes has the length
    /// of all. Unlike didEncounterNote it joins only notes that adjoin, and it tells those whose
    /// ties do not end, at the latest before the end of the part.
    std::function<void(const CMuxmlNote& note)> didPlayNote;
    /// A note whose tie leads to no adjoining note, with the length of what is tied to it. Told
    /// before the end of the part, where it was told as a played one.
    std::function<void(const CMuxmlNote& note)> didLeaveTieOpen;
    /// A `direction` has started: words, dynamics, pedals, whatever stands between notes.
    std::function<void(const CPositionedXMLElement& direction)> didEncounterDirection;
    /// `didEncounterCtrChangePedal:pedalType:value:` Not sent.
    std::function<void(std::int32_t position, std::int32_t pedalType, std::int32_t value)>
        didEncounterCtrChangePedal;
    /// `didEncounterCtrChangeVol:midiChannel:value:` Not sent.
    std::function<void(std::int32_t position, std::int32_t midiChannel, std::int32_t value)>
        didEncounterCtrChangeVol;
    /// `didEncounterCtrChangeBank:midiChannel:value:` Not sent.
    std::function<void(std::int32_t position, std::int32_t midiChannel, std::int32_t value)>
        didEncounterCtrChangeBank;
    /// `didEncounterCtrChangePrg:midiChannel:value:` Not sent.
    std::function<void(std::int32_t position, std::int32_t midiChannel, std::int32_t value)>
        didEncounterCtrChangePrg;
};

/// A host that hands on what it is told to two others, first to `first`. It has the methods that
/// one of them has.
[[nodiscard]] MusicXmlParserDelegate TellBoth(const MusicXmlParserDelegate& first,
                                              const MusicXmlParserDelegate& second);

}  // namespace brindle
