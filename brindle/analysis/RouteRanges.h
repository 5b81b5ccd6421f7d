// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/theory/CHarmCenterLite.h"

namespace brindle {

/// How far the range of a found center reaches over its neighbouring chords.
namespace RouteRanges {

/// A place in the list of chords.
using chord_iterator = CHarmAnlsChords::const_iterator;

/// Moves `first` back, at most to `begin`, as long as the center tolerates the chord before it.
void MoveToFirstTolerated(const CHarmCenterLite& center, chord_iterator begin,
                          chord_iterator& first);
/// Moves `last` on, at most to the last chord before `end`, as long as the center tolerates the
/// next chord. The chord at `last` itself is not tried.
void MoveToLastTolerated(const CHarmCenterLite& center, chord_iterator end, chord_iterator& last);

}  // namespace RouteRanges
}  // namespace brindle
