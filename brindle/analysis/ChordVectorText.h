// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// What a text says about the vector of a chord (see CHarmAnlsChordForMetro).
struct CChordVectorText {
    /// 46 places of 0.0 or 1.0; empty if the text is no vector.
    std::vector<float> mVector;
    /// What is wrong, for people; empty if nothing is.
    std::string mError;
    /// Where it is, in bytes from 0; 0 also where it is the fault of the whole text.
    std::size_t mColumn = 0;
};

/// Reads 46 digits 0 and 1 with any white space and commas between, or a JSON list of 46 numbers,
/// or the JSON object that CHarmAnlsChordForMetro writes.
[[nodiscard]] CChordVectorText ReadChordVector(std::string_view text);

/// Whether somebody who typed this meant a vector and no chord symbol.
[[nodiscard]] bool BeginsAsChordVector(std::string_view text);

/// The words of a row of vectors and chord symbols with the groups of each vector joined, which may
/// come as words of their own, as may the entries of a list in brackets.
[[nodiscard]] std::vector<std::string> JoinChordVectors(std::span<const std::string> words);

/// The digits in groups: special chords, root, basic chord, semitones, bass.
[[nodiscard]] std::string WriteChordVector(std::span<const float> vector);

}  // namespace brindle
