// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/FindFingerings.h"

namespace brindle {
namespace {

// Semitones above the root.
constexpr int kNinth = 2;
constexpr int kThird = 4;
constexpr int kEleventh = 5;
constexpr int kFifth = 7;
constexpr int kThirteenth = 9;

}  // namespace

CSemitones OmittableTones(CSemitones semitones) {
    const auto has = [&](int tone) { return semitones.HasIntvl(tone); };
    const bool hasSeventh = has(10) || has(11);
    const bool hasThird = has(3) || has(kThird);
    CSemitones omittable;
    if (semitones.size() > 3 && has(kFifth)) omittable.AddIntvl(kFifth);
    if (!hasSeventh) return omittable;
    const bool hasEleventh = has(kEleventh) && hasThird;
    const bool hasThirteenth = has(kThirteenth) && semitones.size() > 4;
    if (has(kNinth) && (hasEleventh || hasThirteenth)) omittable.AddIntvl(kNinth);
    if (!hasEleventh) return omittable;
    if (hasThirteenth) {
        omittable.AddIntvl(kEleventh);
    } else if (has(kThird)) {
        // The eleventh lies a minor ninth above the third: the chord is named after one of both.
        omittable.AddIntvl(kThird);
    }
    return omittable;
}

}  // namespace brindle
