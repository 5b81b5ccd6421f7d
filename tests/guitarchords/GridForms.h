// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChChord.h"
#include "brindle/guitarchords/GChShortTuning.h"

#include <memory>
#include <nlohmann/json.hpp>
#include <vector>

/// The forms in which the files of tests/data/expected write fingerings.
namespace brindle::test {

/// [pitch of open string, ...]
inline GChShortTuning ShortTuningOf(const nlohmann::json& pitches) {
    GChShortTuning tuning{};
    GChPitchArrayToShortTuning(pitches.get<std::vector<int>>(), tuning);
    return tuning;
}

/// [fingerNumber, absFretIndex, coveredMinStr, coveredMaxStr, fingerPointType]
inline nlohmann::json FormOf(const GChChordElem& elem) {
    return {elem.fingerNumber(), elem.absFretIndex(), elem.coveredMinStr(), elem.coveredMaxStr(),
            elem.fingerPointType()};
}

inline nlohmann::json FormOf(const std::vector<GChChordElem>& elems) {
    nlohmann::json form = nlohmann::json::array();
    for (const GChChordElem& elem : elems) form.push_back(FormOf(elem));
    return form;
}

/// Adds them in their order; those that cannot exist are left out.
inline void AddElems(GChBasicChord& chord, const nlohmann::json& elems) {
    for (const auto& elem : elems) {
        chord.addChordElem(nullptr, elem.at(0), elem.at(1), elem.at(2), elem.at(3), elem.at(4));
    }
}

/// open strings, mute mask, elements
inline std::shared_ptr<GChBasicChord> BasicChordOf(const nlohmann::json& openStrings, int muteMask,
                                                   const nlohmann::json& elems) {
    auto chord = std::make_shared<GChBasicChord>(ShortTuningOf(openStrings));
    chord->setIsMutedMask(muteMask);
    AddElems(*chord, elems);
    return chord;
}

inline GChChord ViewOf(const std::shared_ptr<GChBasicChord>& chord) {
    return *GChChord::make(chord, 0);
}

}  // namespace brindle::test
