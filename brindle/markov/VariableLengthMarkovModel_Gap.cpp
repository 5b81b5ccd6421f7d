// SPDX-License-Identifier: MIT
#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>
#include <map>

namespace brindle {
namespace {

double ValueOf(const MarkovProbabilities& table, MarkovIterator symbol) {
    const auto found = table.find(symbol);
    return found == table.end() ? 0.0 : found->second;
}

/// The symbols from place `begin` to before place `end`, as far as there are any.
MarkovSequenceView Slice(const MarkovSequence& symbols, std::size_t begin, std::size_t end) {
    begin = std::min(begin, symbols.size());
    end = std::min(end, symbols.size());
    return MarkovSequenceView(symbols).subspan(begin, end - begin);
}

std::size_t PlaceOfFirstGap(const MarkovSequence& symbols) {
    const auto gap = std::find_if(symbols.begin(), symbols.end(),
                                  [](MarkovIterator symbol) { return symbol->IsGap(); });
    return gap == symbols.end() ? 0 : static_cast<std::size_t>(gap - symbols.begin());
}

bool IsCandidate(const CMarkovObject& object) {
    return object != CMarkovObject_Start && object != CMarkovObject_Gap;
}

}  // namespace

// With N = 2 and the gap at 3, a candidate is weighed by three chances: its own behind the window,
// and those of the two symbols whose histories it is part of.
//
//   place     0  1  2  3  4  5
//             C  F  G  _  F  C
//                window       P(_ | F G)
//                   fed       P(F | G _), then P(C | _ F)
MarkovIterator VariableLengthMarkovModel::FillGapInSequence(const MarkovSequence& sequence) {
    StartSequence();
    MarkovSequence filled(sequence);
    const std::size_t n = mMaxHistoryLength;
    const std::size_t gap = PlaceOfFirstGap(filled);
    const std::size_t begin = gap > n ? gap - n : 0;
    // Kept: a gap among the first N places stands in the window itself, with the last candidate in
    // it.
    const MarkovSequenceView window = Slice(filled, begin, begin + n);
    const MarkovSequenceView fed = Slice(filled, begin + n, gap + n);
    const MarkovSequenceView followers = Slice(filled, begin + n + 1, gap + n + 1);
    std::map<MarkovIterator, double, CMarkovLess> sums;
    MarkovProbabilities table;
    for (auto candidate = mObjects.begin(); candidate != mObjects.end(); ++candidate) {
        if (!IsCandidate(*candidate)) continue;
        for (const MarkovIterator symbol : window) QueryAddSymbol(*symbol);
        if (gap < filled.size()) filled[gap] = candidate;
        ProbabilitiesForNextSymbol(table);
        double sum = ValueOf(table, candidate);
        for (std::size_t i = 0; i < fed.size(); ++i) {
            QueryAddSymbol(*fed[i]);
            if (i == followers.size()) break;
            ProbabilitiesForNextSymbol(table);
            sum += ValueOf(table, followers[i]);
        }
        sums[candidate] = sum;
    }
    return ChooseFromProbabilities(
        MarkovProbabilities(boost::container::ordered_unique_range, sums.begin(), sums.end()));
}

}  // namespace brindle
