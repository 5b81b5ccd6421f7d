// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/PlayMarks.h"
#include "brindle/song/internal/SongTokens.h"

#include <cstddef>
#include <string_view>
#include <vector>

/// Words and signs in a text that steer its playing.
namespace brindle::SongText {

/// The bytes of the words that steer the playing at the begin of a text, "D.S. al Coda", "To Coda",
/// "Fine", "Segno", "(3x)", "[3x]", the sign of the segno or `$`; 0 if there are none.
[[nodiscard]] std::size_t LengthOfPlayWords(std::string_view text);

/// The bytes of the sign of the coda or `@` at the begin of a text; 0 if there is none.
[[nodiscard]] std::size_t LengthOfCodaSign(std::string_view text);

/// What such words say; `S` is the sign of the segno in charts.
void ReadPlayWordsOfText(std::string_view words, CPlayMarks& marks);

/// Words of a text and the bar that they steer.
struct CPlacedWords {
    std::string_view mText;
    std::size_t mBar = 0;
};

/// Notes of `list` about what words ask for and the song does not have, such as the segno of
/// "D.S."; each once, at the first words that ask for it. `bars` are the marks of all bars.
void TellLostWords(const std::vector<CPlacedWords>& words, const std::vector<CPlayMarks>& bars,
                   CTokenList& list);

}  // namespace brindle::SongText
