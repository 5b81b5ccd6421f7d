// SPDX-License-Identifier: MIT
#include "brindle/analysis/RouteRanges.h"

#include "brindle/analysis/ScaleLite.h"

#include <iterator>

namespace brindle::RouteRanges {

void MoveToFirstTolerated(const CHarmCenterLite& center, chord_iterator begin,
                          chord_iterator& first) {
    const CScaleLite scale = center.ToScaleLite();
    while (first != begin && ScaleLite::ChordIsCompatibleWithScale(*std::prev(first), scale)) {
        --first;
    }
}

void MoveToLastTolerated(const CHarmCenterLite& center, chord_iterator end, chord_iterator& last) {
    if (last == end) return;
    const CScaleLite scale = center.ToScaleLite();
    while (std::next(last) != end &&
           ScaleLite::ChordIsCompatibleWithScale(*std::next(last), scale)) {
        ++last;
    }
}

}  // namespace brindle::RouteRanges
