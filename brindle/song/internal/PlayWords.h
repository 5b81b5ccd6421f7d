// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string_view>

namespace brindle {
struct CPlayMarks;
}

/// Words and signs in a text that steer its playing.
namespace brindle::SongText {

/// The bytes of the words that steer the playing at the begin of a text, "D.S. al Coda", "To Coda",
/// "Fine", "Segno", "(3x)" or the sign of the segno; 0 if there are none.
[[nodiscard]] std::size_t LengthOfPlayWords(std::string_view text);

/// The bytes of the sign of the coda at the begin of a text; 0 if there is none.
[[nodiscard]] std::size_t LengthOfCodaSign(std::string_view text);

/// What such words say; `S` is the sign of the segno in charts.
void ReadPlayWordsOfText(std::string_view words, CPlayMarks& marks);

}  // namespace brindle::SongText
