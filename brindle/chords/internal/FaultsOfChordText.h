// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace brindle::ChordText {

class CUnifiedText;

/// What can be wrong with a chord text.
enum class TFault : std::uint8_t {
    None,
    NotUnderstood,
    NoNote,
    Empty,
    NoDegree,
    OneAccidentalTooMany,
    CapitalFlat,
    SignWithoutNumber,
    WordWithoutDegree,
    BracketTooMany,
    SlashWithoutBass,
    NoBassNote,
    TwoBassNotes,
    SecondChord,
};

/// A fault and where it begins in the folded text.
struct CFaultAt {
    TFault mFault = TFault::None;
    std::size_t mPos = 0;
    /// Characters that are shown; 0: as many as belong together.
    std::size_t mLength = 0;
};

/// The character of the input, from 1, in which byte `offset` lies.
[[nodiscard]] int CharacterPos(std::string_view input, std::size_t offset);

/// The sentence for people, `"x" at 4 is not understood`.
[[nodiscard]] std::string FaultText(const CFaultAt& fault, const CUnifiedText& text);

}  // namespace brindle::ChordText
