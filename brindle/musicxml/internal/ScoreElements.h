// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
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

inline constexpr std::size_t kLongestScoreElementName = 15;

/// The names in ascending order of length, and where those of each length begin: eight at most.
struct CScoreElementsByLength {
    std::array<CScoreElementName, kScoreElementNames.size()> mNames = kScoreElementNames;
    std::array<std::uint8_t, kLongestScoreElementName + 2> mBegin{};

    constexpr CScoreElementsByLength() {
        std::sort(mNames.begin(), mNames.end(),
                  [](const auto& a, const auto& b) { return a.mName.size() < b.mName.size(); });
        for (const CScoreElementName& row : mNames) {
            for (std::size_t i = row.mName.size() + 1; i < mBegin.size(); ++i) ++mBegin[i];
        }
    }
};

inline constexpr CScoreElementsByLength kScoreElementsByLength;
static_assert(kScoreElementsByLength.mBegin.back() == kScoreElementNames.size());

[[nodiscard]] constexpr TScoreElement ScoreElementOf(std::string_view name) {
    if (name.size() > kLongestScoreElementName) return TScoreElement::Other;
    const std::size_t end = kScoreElementsByLength.mBegin[name.size() + 1];
    for (std::size_t i = kScoreElementsByLength.mBegin[name.size()]; i < end; ++i) {
        const CScoreElementName& row = kScoreElementsByLength.mNames[i];
        // Most others differ in the first letter.
        if (row.mName.front() == name.front() && row.mName == name) return row.mElement;
    }
    return TScoreElement::Other;
}

/// Whether the text of an element is read, and not only its attributes or what is inside.
[[nodiscard]] constexpr bool IsTextRead(TScoreElement element) {
    switch (element) {
        using enum TScoreElement;
        case BassAlter:
        case BassStep:
        case BeatType:
        case Beats:
        case Creator:
        case DegreeAlter:
        case DegreeType:
        case DegreeValue:
        case Divisions:
        case Duration:
        case Ending:
        case Fifths:
        case Kind:
        case Mode:
        case MovementTitle:
        case Offset:
        case Rehearsal:
        case RootAlter:
        case RootStep:
        case Words:
        case WorkTitle:
            return true;
        default:
            return false;
    }
}

}  // namespace brindle
