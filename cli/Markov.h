// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandLine.h"

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <optional>
#include <string>
#include <vector>

/// What the commands of `brindle markov` share.
namespace brindle::cli {

/// Longer histories than this are no music but a damaged file.
inline constexpr std::uint64_t kLongestOrder = 64;

/// Reads a model file. Nothing when that is none; then the error has been printed.
[[nodiscard]] std::optional<VariableLengthMarkovModel> ReadModel(const std::string& path);

/// Draws from the generator that the seed starts; without one from the operating system.
void SetSeed(VariableLengthMarkovModel& model, const std::optional<std::uint64_t>& seed);

/// A typed sequence such as (4,C);(8,U);(4,G7), blanks allowed. Nothing when it cannot be one; then
/// the error has been printed, with `option` as its place.
[[nodiscard]] std::optional<std::vector<CMarkovObject>> ReadSymbols(const std::string& option,
                                                                    const std::string& text);

void AddMarkovLearn(CCommand& markov);
void AddMarkovGenerate(CCommand& markov);
void AddMarkovFill(CCommand& markov);
void AddMarkovShow(CCommand& markov);

}  // namespace brindle::cli
