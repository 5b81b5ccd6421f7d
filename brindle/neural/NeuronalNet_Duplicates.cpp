// SPDX-License-Identifier: MIT
// Patterns that contradict each other are found by sorting: patterns with equal inputs then stand
// together, and only these are held against each other. A group of k equal inputs with different
// outputs costs k * k, as many as the pairs that it can print.

#include "brindle/neural/NeuronalNet.h"

#include <fmt/core.h>

#include <algorithm>
#include <cmath>
#include <iostream>
#include <utility>

namespace brindle {

namespace {

using TIndexPair = std::pair<std::size_t, std::size_t>;

/// Indexes of the patterns in the order of their inputs, equal ones in the order of the patterns.
/// An input that is not a number equals nothing, so these patterns are left out.
std::vector<std::size_t> SortedByInputs(const std::vector<training_pattern>& patterns) {
    std::vector<std::size_t> order;
    for (std::size_t i = 0; i < patterns.size(); ++i) {
        const std::vector<double>& inputs = patterns[i].mInputs;
        const bool hasNumbers = std::none_of(inputs.begin(), inputs.end(),
                                             [](double input) { return std::isnan(input); });
        if (hasNumbers) order.push_back(i);
    }
    std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
        return patterns[a].mInputs < patterns[b].mInputs;
    });
    return order;
}

/// Adds the pairs of different outputs within a group of equal inputs.
void AddConflicts(const std::vector<training_pattern>& patterns, std::span<const std::size_t> group,
                  std::vector<TIndexPair>& conflicts) {
    const auto isLikeFirst = [&](std::size_t index) {
        return patterns[index].mOutputs == patterns[group.front()].mOutputs;
    };
    if (std::all_of(group.begin(), group.end(), isLikeFirst)) return;
    for (std::size_t i = 0; i < group.size(); ++i) {
        for (std::size_t j = i + 1; j < group.size(); ++j) {
            if (patterns[group[i]].mOutputs == patterns[group[j]].mOutputs) continue;
            conflicts.emplace_back(group[i], group[j]);
        }
    }
}

std::vector<TIndexPair> Conflicts(const std::vector<training_pattern>& patterns) {
    const std::vector<std::size_t> order = SortedByInputs(patterns);
    std::vector<TIndexPair> conflicts;
    for (auto begin = order.begin(); begin != order.end();) {
        const auto end = std::find_if(begin, order.end(), [&](std::size_t index) {
            return patterns[index].mInputs != patterns[*begin].mInputs;
        });
        AddConflicts(patterns, std::span(&*begin, static_cast<std::size_t>(end - begin)),
                     conflicts);
        begin = end;
    }
    std::sort(conflicts.begin(), conflicts.end());
    return conflicts;
}

void AppendPattern(std::string& text, std::size_t index, const training_pattern& pattern) {
    text += fmt::format("{} {}: \nInput: ", index, pattern.mTellingName);
    for (const double input : pattern.mInputs) text += fmt::format("{:f} ", input);
    text += "\nOutput: ";
    for (const double output : pattern.mOutputs) text += fmt::format("{:f} ", output);
}

}  // namespace

void NeuronalNet::check_learn_data_for_duplicates(const std::vector<training_pattern>& patterns) {
    for (const auto& [i, j] : Conflicts(patterns)) {
        std::string text = fmt::format(
            "Warning: input-pattern {} ({}) and {} ({}) seem to contain inconsistencies.\n", i,
            patterns[i].mTellingName, j, patterns[j].mTellingName);
        AppendPattern(text, i, patterns[i]);
        AppendPattern(text, j, patterns[j]);
        std::cout << text;
    }
}

}  // namespace brindle
