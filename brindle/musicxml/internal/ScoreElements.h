// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <array>
#include <cstdint>
#include <string_view>

namespace brindle {

/// The elements of a score that a lead sheet is read from.
enum class TScoreElement : std::uint8_t {
    Other,
    Backup,
    Barline,
    Bass,
    BassAlter,
    BassStep,
    BeatType,
    Beats,
    Chord,
    Coda,
    Creator,
    Degree,
    DegreeAlter,
    DegreeType,
    DegreeValue,
    Direction,
    Divisions,
    Duration,
    Ending,
    Fifths,
    Forward,
    Grace,
    Harmony,
    Key,
    Kind,
    Measure,
    Mode,
    MovementTitle,
    Note,
    Offset,
    Part,
    Rehearsal,
    Repeat,
    Root,
    RootAlter,
    RootStep,
    ScorePartwise,
    ScoreTimewise,
    Segno,
    Sound,
    Time,
    Words,
    WorkTitle,
};

struct CScoreElementName {
    std::string_view mName;
    TScoreElement mElement;
};

inline constexpr auto kScoreElementNames = std::to_array<CScoreElementName>({
    {"backup", TScoreElement::Backup},
    {"barline", TScoreElement::Barline},
    {"bass", TScoreElement::Bass},
    {"bass-alter", TScoreElement::BassAlter},
    {"bass-step", TScoreElement::BassStep},
    {"beat-type", TScoreElement::BeatType},
    {"beats", TScoreElement::Beats},
    {"chord", TScoreElement::Chord},
    {"coda", TScoreElement::Coda},
    {"creator", TScoreElement::Creator},
    {"degree", TScoreElement::Degree},
    {"degree-alter", TScoreElement::DegreeAlter},
    {"degree-type", TScoreElement::DegreeType},
    {"degree-value", TScoreElement::DegreeValue},
    {"direction", TScoreElement::Direction},
    {"divisions", TScoreElement::Divisions},
    {"duration", TScoreElement::Duration},
    {"ending", TScoreElement::Ending},
    {"fifths", TScoreElement::Fifths},
    {"forward", TScoreElement::Forward},
    {"grace", TScoreElement::Grace},
    {"harmony", TScoreElement::Harmony},
    {"key", TScoreElement::Key},
    {"kind", TScoreElement::Kind},
    {"measure", TScoreElement::Measure},
    {"mode", TScoreElement::Mode},
    {"movement-title", TScoreElement::MovementTitle},
    {"note", TScoreElement::Note},
    {"offset", TScoreElement::Offset},
    {"part", TScoreElement::Part},
    {"rehearsal", TScoreElement::Rehearsal},
    {"repeat", TScoreElement::Repeat},
    {"root", TScoreElement::Root},
    {"root-alter", TScoreElement::RootAlter},
    {"root-step", TScoreElement::RootStep},
    {"score-partwise", TScoreElement::ScorePartwise},
    {"score-timewise", TScoreElement::ScoreTimewise},
    {"segno", TScoreElement::Segno},
    {"sound", TScoreElement::Sound},
    {"time", TScoreElement::Time},
    {"words", TScoreElement::Words},
    {"work-title", TScoreElement::WorkTitle},
});

/// By length first: most names that are looked up differ in it, and need no look at their letters.
constexpr bool IsBefore(const CScoreElementName& a, const CScoreElementName& b) {
    if (a.mName.size() != b.mName.size()) return a.mName.size() < b.mName.size();
    return a.mName < b.mName;
}

constexpr auto kScoreElementsByLength = [] {
    auto sorted = kScoreElementNames;
    std::sort(sorted.begin(), sorted.end(), IsBefore);
    return sorted;
}();

[[nodiscard]] constexpr TScoreElement ScoreElementOf(std::string_view name) {
    const auto it = std::lower_bound(kScoreElementsByLength.begin(), kScoreElementsByLength.end(),
                                     CScoreElementName{name, TScoreElement::Other}, IsBefore);
    return it != kScoreElementsByLength.end() && it->mName == name ? it->mElement
                                                                   : TScoreElement::Other;
}

}  // namespace brindle
