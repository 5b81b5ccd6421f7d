// SPDX-License-Identifier: MIT
#include "brindle/neural/ChordRootPatterns.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"
#include "brindle/neural/NeuronalNet.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <initializer_list>
#include <utility>
#include <vector>

using namespace brindle;

namespace {

std::uint32_t InputsOf(std::initializer_list<unsigned> intvls) {
    std::uint32_t inputs = 0;
    for (const unsigned intvl : intvls) inputs |= 1U << intvl;
    return inputs;
}

/// The root that the net of these weights hears, by its ordinary forward pass.
int HeardRoot(NeuronalNet& net, std::uint32_t inputs, std::vector<double>& buffer) {
    for (std::size_t i = 0; i < buffer.size(); ++i) buffer[i] = (inputs >> i & 1U) != 0;
    net.use(buffer);
    return static_cast<int>(net.winner());
}

}  // namespace

TEST_CASE("Each set of notes has one root") {
    struct CCase {
        const char* mChord;
        std::initializer_list<unsigned> mIntvls;
        int mRootIntvl;
        TOmission mOmission = TOmission_None;
    };
    const CCase cases[] = {
        {"C E G", {0, 4, 7}, 0},
        {"C C E G, C E G", {0, 4, 7, 12, 16, 19}, 0},
        {"E G C", {0, 3, 8}, 8},
        {"E C G", {0, 8, 15}, 8},
        {"G C, the fourth upwards", {0, 5}, 5},
        {"C E G sharp", {0, 4, 8}, 0},
        {"C E flat F sharp A", {0, 3, 6, 9}, 0},
        {"C D G, sus2", {0, 2, 7}, 0},
        {"G C D, sus4", {0, 5, 7}, 0},
        {"D G C, Gsus4 rather than Csus2", {0, 5, 10}, 5},
        {"C E G A, C6", {0, 4, 7, 9}, 0},
        {"A C E G, Am7", {0, 3, 7, 10}, 0},
        {"E G A C, Am7 rather than C6", {0, 3, 5, 8}, 5},
        {"E flat G A C, Am7b5 rather than Cm6", {0, 4, 6, 9}, 6},
        {"C E flat G A flat, A flat maj7 even in root position", {0, 3, 7, 8}, 8},
        {"C E G B flat D", {0, 4, 7, 10, 14}, 0},
        {"D E G A C, D9sus4", {0, 2, 5, 7, 10}, 0},
        {"E G A C D, C6 add9 before D9sus4", {0, 3, 5, 8, 10}, 8},
        {"C E B flat", {0, 4, 10}, 0, TOmission_Fifth},
        {"C G B flat", {0, 7, 10}, 0, TOmission_Third},
        {"E F G B flat, C7 11", {0, 1, 3, 6}, 8, TOmission_Root},
        {"E G B flat, a full triad before C7 without root", {0, 3, 6}, 0},
    };
    const std::vector<CChordRootPattern> patterns = ChordRootPatterns();
    for (const CCase& test : cases) {
        CAPTURE(test.mChord);
        const auto found =
            std::lower_bound(patterns.begin(), patterns.end(), InputsOf(test.mIntvls),
                             [](const CChordRootPattern& pattern, std::uint32_t inputs) {
                                 return pattern.mInputs < inputs;
                             });
        REQUIRE(found != patterns.end());
        CHECK(found->mInputs == InputsOf(test.mIntvls));
        CHECK(found->mRootIntvl == test.mRootIntvl);
        CHECK(found->mOmission == test.mOmission);
    }
}

TEST_CASE("The patterns are each voicing of each shape, once, with and without the upper octave") {
    const std::vector<CChordRootPattern> patterns = ChordRootPatterns();
    CHECK(ChordShapes().size() == 42);
    CHECK(patterns.size() == 27084);
    const auto isUnordered = [](const CChordRootPattern& a, const CChordRootPattern& b) {
        return a.mInputs >= b.mInputs;
    };
    CHECK(std::adjacent_find(patterns.begin(), patterns.end(), isUnordered) == patterns.end());
    // Ordered by inputs, so patterns with and without input 12 can be held against each other.
    std::vector<std::pair<std::uint32_t, int>> without;
    std::vector<std::pair<std::uint32_t, int>> with;
    constexpr std::uint32_t kOctave = 1U << 12U;
    for (const CChordRootPattern& pattern : patterns) {
        auto& half = (pattern.mInputs & kOctave) == 0 ? without : with;
        half.emplace_back(pattern.mInputs & ~kOctave, pattern.mRootIntvl);
    }
    CHECK(with == without);
    CHECK(std::all_of(with.begin(), with.end(), [](const auto& half) { return half.first & 1U; }));
    // Three voicings of each of two upper tones, with and without the octave, on three tones.
    const auto majorTriads = std::count_if(
        patterns.begin(), patterns.end(),
        [](const auto& pattern) { return ChordShapes()[pattern.mShape].mName == "major"; });
    CHECK(majorTriads == 3 * 3 * 2 * 3);
}

TEST_CASE("The net hears the root of every voicing of every shape") {
    NeuronalNet net(ChordAnalysisNeuronalNet);
    std::vector<double> buffer(static_cast<std::size_t>(net.get_input_neuron_count()));
    int wrongOfCatalogue = 0;
    int others = 0;
    int wrongOthers = 0;
    for (const CChordRootPattern& pattern : ChordRootPatterns()) {
        const bool isWrong = HeardRoot(net, pattern.mInputs, buffer) != pattern.mRootIntvl;
        if (pattern.mIsOfCatalogue) {
            wrongOfCatalogue += isWrong;
        } else {
            ++others;
            wrongOthers += isWrong;
        }
    }
    CHECK(wrongOfCatalogue == 0);
    CHECK(others > 15000);
    CHECK(wrongOthers * 200 <= others);  // 99.5 %
}

TEST_CASE("The net hears a single note as its own root, and the lower note of thirds and fifths") {
    NeuronalNet net(ChordAnalysisNeuronalNet);
    std::vector<double> buffer(24);
    CHECK(HeardRoot(net, InputsOf({0}), buffer) == 0);
    CHECK(HeardRoot(net, InputsOf({0, 12}), buffer) == 0);
    CHECK(HeardRoot(net, InputsOf({0, 3}), buffer) == 0);
    CHECK(HeardRoot(net, InputsOf({0, 4}), buffer) == 0);
    CHECK(HeardRoot(net, InputsOf({0, 7}), buffer) == 0);
}
