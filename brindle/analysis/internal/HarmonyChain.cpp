// SPDX-License-Identifier: MIT
// Which chord stands under which. From the end on, each chord chooses among the next one, the one
// that that stands under, and so on: only these can be reached without crossing an arc. Dm7 stands
// under G7, and that under C, also where chords of less weight stand between them.

#include "brindle/analysis/internal/HarmonyChain.h"

#include "brindle/analysis/internal/ChainTables.h"
#include "brindle/analysis/internal/KeyNumbers.h"

#include <utility>

namespace brindle {
namespace {

constexpr std::size_t kMostCandidates = 6;

std::size_t Up(int from, int to) {
    return static_cast<std::size_t>(DegreeInKey(to, from));
}

class CChain {
public:
    CChain(std::span<const CKeyChord> chords, std::span<const TKeyChordKind> kinds, int home)
        : mChords(chords), mKinds(kinds), mHome(home), mUnder(chords.size(), -1) {}

    std::vector<std::ptrdiff_t> Make() {
        for (std::size_t i = mChords.size(); i-- > 0;) mUnder[i] = Choose(i);
        return std::move(mUnder);
    }

private:
    // The first of the best. To prepare nothing is the last choice.
    [[nodiscard]] std::ptrdiff_t Choose(std::size_t ix) const {
        const auto count = static_cast<std::ptrdiff_t>(mChords.size());
        std::ptrdiff_t best = -1;
        int most = 0;
        std::ptrdiff_t candidate = static_cast<std::ptrdiff_t>(ix) + 1;
        for (std::size_t way = 0; way < kMostCandidates; ++way) {
            if (candidate < 0 || candidate >= count) break;
            const auto goal = static_cast<std::size_t>(candidate);
            const int points = Points(ix, goal, way);
            if (best < 0 || points > most) {
                best = candidate;
                most = points;
            }
            candidate = mUnder[goal];
        }
        return best >= 0 && most >= PointsOfRest(mChords[ix]) ? best : -1;
    }

    [[nodiscard]] int Points(std::size_t ix, std::size_t goal, std::size_t way) const {
        const TKeyChordKind kind = mKinds[ix];
        const CKeyChord& to = mChords[goal];
        const std::size_t up = Up(mChords[ix].mRoot, to.mRoot);
        return kChainMotion[kind][up] + kChainGoal[kind][Degree(to)] + kChainTo[to.mClass][up] +
               kChainDepth[way][kind];
    }

    [[nodiscard]] int PointsOfRest(const CKeyChord& chord) const {
        return kChainRest[chord.mClass][Degree(chord) + (IsMinorKey(mHome) ? 12U : 0U)];
    }

    [[nodiscard]] std::size_t Degree(const CKeyChord& chord) const {
        return static_cast<std::size_t>(DegreeInKey(chord.mRoot, mHome));
    }

    std::span<const CKeyChord> mChords;
    std::span<const TKeyChordKind> mKinds;
    int mHome;
    std::vector<std::ptrdiff_t> mUnder;
};

}  // namespace

std::vector<std::ptrdiff_t> HarmonyChain(std::span<const CKeyChord> chords,
                                         std::span<const TKeyChordKind> kinds, int home) {
    return CChain(chords, kinds, home).Make();
}

}  // namespace brindle
