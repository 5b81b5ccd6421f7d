// SPDX-License-Identifier: MIT
#include "tools/train_root_net/RootNetFigures.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/neural/ChordAnalysisNeuronalNet.h"
#include "brindle/neural/NeuronalNet.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>
#include <map>
#include <utility>

namespace brindle::tools {

namespace {

/// How many patterns of a group there are, and how many each method gets right.
struct CCounts {
    std::size_t mPatterns = 0;
    std::vector<std::size_t> mRight;
};

std::vector<double> InputsOf(const CChordRootPattern& pattern) {
    std::vector<double> inputs(kChordRootInputCount);
    for (std::size_t i = 0; i < inputs.size(); ++i) inputs[i] = (pattern.mInputs >> i & 1U) != 0;
    return inputs;
}

std::string NameOf(const CChordRootPattern& pattern) {
    const std::string_view shape = ChordShapes()[pattern.mShape].mName;
    switch (pattern.mOmission) {
        case TOmission_None:
            break;
        case TOmission_Fifth:
            return fmt::format("{} without fifth", shape);
        case TOmission_Third:
            return fmt::format("{} without third", shape);
        case TOmission_Root:
            return fmt::format("{} without root", shape);
    }
    return std::string(shape);
}

std::string NotesOf(const CChordRootPattern& pattern) {
    std::string text;
    for (unsigned i = 0; i < kChordRootInputCount; ++i) {
        if ((pattern.mInputs >> i & 1U) != 0) text += fmt::format("{} ", i);
    }
    text.pop_back();
    return text;
}

template <class Condition>
CCounts CountsOf(std::span<const CChordRootPattern> patterns, std::span<const CHeardRoots> heard,
                 Condition isInGroup) {
    CCounts counts;
    counts.mRight.resize(heard.size());
    for (std::size_t i = 0; i < patterns.size(); ++i) {
        if (!isInGroup(patterns[i])) continue;
        ++counts.mPatterns;
        for (std::size_t method = 0; method < heard.size(); ++method) {
            if (heard[method].mRootIntvls[i] == patterns[i].mRootIntvl) ++counts.mRight[method];
        }
    }
    return counts;
}

std::string HeadingRows(std::string_view first, std::span<const CHeardRoots> heard) {
    std::string names = fmt::format("| {} | patterns |", first);
    std::string lines = "|---|---:|";
    for (const CHeardRoots& method : heard) {
        names += fmt::format(" {} | |", method.mMethod);
        lines += "---:|---:|";
    }
    return names + "\n" + lines + "\n";
}

std::string Row(std::string_view name, const CCounts& counts) {
    std::string row = fmt::format("| {} | {} |", name, counts.mPatterns);
    for (const std::size_t right : counts.mRight) {
        row += fmt::format(" {} | {:.2f} % |", right,
                           100.0 * static_cast<double>(right) /
                               static_cast<double>(std::max<std::size_t>(counts.mPatterns, 1)));
    }
    return row + "\n";
}

std::string GroupTable(std::span<const CChordRootPattern> patterns,
                       std::span<const CHeardRoots> heard) {
    using TPattern = CChordRootPattern;
    std::string text = HeadingRows("group", heard);
    const auto add = [&](std::string_view name, auto isInGroup) {
        text += Row(name, CountsOf(patterns, heard, isInGroup));
    };
    add("usual shapes in every voicing", [](const TPattern& p) { return p.mIsOfCatalogue; });
    add("further shapes and notes left out", [](const TPattern& p) { return !p.mIsOfCatalogue; });
    add("all", [](const TPattern&) { return true; });
    return text;
}

std::string ShapeTable(std::span<const CChordRootPattern> patterns,
                       std::span<const CHeardRoots> heard) {
    std::map<std::pair<TOmission, std::size_t>, std::string> names;
    for (const CChordRootPattern& pattern : patterns) {
        names.try_emplace({pattern.mOmission, pattern.mShape}, NameOf(pattern));
    }
    std::string text = HeadingRows("shape", heard);
    for (const auto& group : names) {
        const auto isInGroup = [&](const CChordRootPattern& pattern) {
            return std::pair(pattern.mOmission, pattern.mShape) == group.first;
        };
        text += Row(group.second, CountsOf(patterns, heard, isInGroup));
    }
    return text;
}

std::string Confusions(std::span<const CChordRootPattern> patterns, const CHeardRoots& heard) {
    std::string text;
    for (std::size_t i = 0; i < patterns.size(); ++i) {
        if (heard.mRootIntvls[i] == patterns[i].mRootIntvl) continue;
        text += fmt::format("- {}: {}: root at {}, heard at {}\n", NameOf(patterns[i]),
                            NotesOf(patterns[i]), patterns[i].mRootIntvl, heard.mRootIntvls[i]);
    }
    return text.empty() ? "None.\n" : text;
}

}  // namespace

CHeardRoots HeardByNet(std::span<const CChordRootPattern> patterns,
                       std::span<const double> weights) {
    NeuronalNet net(ChordAnalysisNeuronalNet, weights);
    CHeardRoots heard{"net", {}};
    for (const CChordRootPattern& pattern : patterns) {
        net.use(InputsOf(pattern));
        heard.mRootIntvls.push_back(static_cast<int>(net.winner()));
    }
    return heard;
}

CHeardRoots FoundByScore(std::span<const CChordRootPattern> patterns) {
    constexpr unsigned kLowestC = 48;
    CHeardRoots heard{"score", {}};
    for (const CChordRootPattern& pattern : patterns) {
        CMySet<unsigned char> noteNrs;
        for (unsigned i = 0; i < kChordRootInputCount; ++i) {
            if ((pattern.mInputs >> i & 1U) != 0) {
                noteNrs.insert(static_cast<unsigned char>(kLowestC + i));
            }
        }
        CChordHeavy chord;
        chord.SetFromNoteNrSet(noteNrs);
        chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(TSingleChordAnalysisAlgo_Score);
        heard.mRootIntvls.push_back(chord.RootNote().KeyNr());
    }
    return heard;
}

double LeastMargin(std::span<const CChordRootPattern> patterns, std::span<const double> weights) {
    NeuronalNet net(ChordAnalysisNeuronalNet, weights);
    double least = 1.0;
    for (const CChordRootPattern& pattern : patterns) {
        net.use(InputsOf(pattern));
        std::vector<double> outputs = net.get_outputs();
        double& right = outputs[static_cast<std::size_t>(pattern.mRootIntvl)];
        const double value = std::exchange(right, 0.0);
        least = std::min(least, value - *std::max_element(outputs.begin(), outputs.end()));
    }
    return least;
}

std::string FiguresText(std::span<const CChordRootPattern> patterns,
                        std::span<const CHeardRoots> heard) {
    return GroupTable(patterns, heard) + "\n### By shape\n\n" + ShapeTable(patterns, heard) +
           "\n### Confusions of the " + heard.front().mMethod + "\n\n" +
           Confusions(patterns, heard.front());
}

}  // namespace brindle::tools
