// SPDX-License-Identifier: MIT
// The debugging prints: property lists on one line.
#include "brindle/guitarchords/GChBasicChord.h"
#include "brindle/guitarchords/GChChord.h"
#include "brindle/guitarchords/GChChordElem.h"
#include "brindle/guitarchords/GChTuningDescr.h"
#include "brindle/platform/PlainText.h"

#include <nlohmann/json.hpp>

#include <ostream>

namespace brindle {

namespace {

/// Bytes that are no UTF-8 become U+FFFD.
std::ostream& Print(std::ostream& stream, const nlohmann::json& propertyList) {
    PlainText::Write(stream,
                     propertyList.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace));
    return stream;
}

}  // namespace

std::ostream& operator<<(std::ostream& stream, const GChChordElem& elem) {
    return Print(stream, elem.propertyList());
}

std::ostream& operator<<(std::ostream& stream, const GChBasicChord& chord) {
    return Print(stream, chord.propertyList());
}

std::ostream& operator<<(std::ostream& stream, const GChChord& chord) {
    return Print(stream, chord.propertyList());
}

std::ostream& operator<<(std::ostream& stream, const GChTuningDescr& tuning) {
    return Print(stream, tuning.propertyList());
}

}  // namespace brindle
