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
    TChordOption_b9 = 0,
    TChordOption_add_b9 = 1,
    TChordOption_9 = 2,
    TChordOption_add_9 = 3,
    TChordOption_s9 = 4,
    TChordOption_b3 = 5,
    TChordOption_3 = 6,
    TChordOption_11 = 7,
    TChordOption_add_11 = 8,
    TChordOption_s11 = 9,
    TChordOption_b5 = 10,
    TChordOption_5 = 11,
    TChordOption_b13 = 12,
    TChordOption_s5 = 13,
    TChordOption_13 = 14,
    TChordOption_7 = 15,
    TChordOption_6 = 16,
    TChordOption_ma7 = 17,
    TChordOption_j7 = 18,
    TChordOption_maj7 = 19,
};

/// The options of a chord by the number that orders them in its name: the interval that the option
/// names, or 99 for an altered fifth, which comes last. There are 14 such numbers, so it needs no
/// allocation.
using TChordOptionsMap =
    boost::container::flat_map<int, TChordOption, std::less<>,
                               boost::container::small_vector<std::pair<int, TChordOption>, 14>>;

}  // namespace brindle
