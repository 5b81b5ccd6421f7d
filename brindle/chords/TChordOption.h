// SPDX-License-Identifier: MIT
#pragma once

#include <boost/container/flat_map.hpp>
#include <boost/container/small_vector.hpp>
#include <cstdint>
#include <functional>
#include <utility>

namespace brindle {

/// What a chord name can say beyond its basic chord. `b` is flat, `s` is sharp.
enum TChordOption : std::int32_t {
    TChordOption_b9 = 0,      ///< "b9"
    TChordOption_add_b9 = 1,  ///< "add b9", above nothing but a triad
    TChordOption_9 = 2,       ///< "9"
    TChordOption_add_9 = 3,   ///< "add 9", above nothing but a triad
    TChordOption_s9 = 4,      ///< "#9"
    TChordOption_b3 = 5,      ///< "b3", where it makes no minor chord
    TChordOption_3 = 6,       ///< "3", where it makes no major chord
    TChordOption_11 = 7,      ///< "11"
    TChordOption_add_11 = 8,  ///< "add 11", above nothing but a triad
    TChordOption_s11 = 9,     ///< "#11"
    TChordOption_b5 = 10,     ///< "b5"
    TChordOption_5 = 11,      ///< "5", the perfect fifth where the skeleton has none
    TChordOption_b13 = 12,    ///< "b13"
    TChordOption_s5 = 13,     ///< "#5"
    TChordOption_13 = 14,     ///< "13"
    TChordOption_7 = 15,      ///< "7", the minor seventh; the diminished one of a diminished chord
    TChordOption_6 = 16,      ///< "6"
    TChordOption_ma7 = 17,    ///< "ma7", the major seventh
    TChordOption_j7 = 18,     ///< "j7", the same for `mChordPrefC` 1
    TChordOption_maj7 = 19,   ///< "maj7", the same for `mChordPrefC` 2
};

/// The options of a chord by the number that orders them in its name: the interval that the option
/// names, or 99 for an altered fifth, which comes last. There are 14 such numbers, so it needs no
/// allocation.
using TChordOptionsMap =
    boost::container::flat_map<int, TChordOption, std::less<>,
                               boost::container::small_vector<std::pair<int, TChordOption>, 14>>;

}  // namespace brindle
