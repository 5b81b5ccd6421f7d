// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MusicXmlParserDelegate.h"

namespace brindle {
namespace {

/// One method that calls two.
template <class... Arguments>
std::function<void(Arguments...)> Both(const std::function<void(Arguments...)>& first,
                                       const std::function<void(Arguments...)>& second) {
    if (!first || !second) return first ? first : second;
    return [first, second](Arguments... arguments) {
        first(arguments...);
        second(arguments...);
    };
}

template <class... Methods>
MusicXmlParserDelegate Join(const MusicXmlParserDelegate& first,
                            const MusicXmlParserDelegate& second, Methods... methods) {
    MusicXmlParserDelegate both;
    ((both.*methods = Both(first.*methods, second.*methods)), ...);
    return both;
}

}  // namespace

MusicXmlParserDelegate TellBoth(const MusicXmlParserDelegate& first,
                                const MusicXmlParserDelegate& second) {
    using Host = MusicXmlParserDelegate;
    return Join(first, second, &Host::didEncounterDocumentStartWithProgressBarInfo,
                &Host::didEncounterDocumentEnd, &Host::didEncounterPartStart,
                &Host::didEncounterPartEnd, &Host::didEncounterMeasureStart,
                &Host::didEncounterMeasureEnd, &Host::didEncounterSignTime,
                &Host::didEncounterSignKey, &Host::didEncounterClef, &Host::didEncounterTranspose,
                &Host::didEncounterTempoChange, &Host::didEncounterInstrumentWithName,
                &Host::didEncounterNote, &Host::didPlayNote, &Host::didLeaveTieOpen,
                &Host::didEncounterDirection, &Host::didEncounterCtrChangePedal,
                &Host::didEncounterCtrChangeVol, &Host::didEncounterCtrChangeBank,
                &Host::didEncounterCtrChangePrg);
}

}  // namespace brindle
