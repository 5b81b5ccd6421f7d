// SPDX-License-Identifier: MIT
#include "brindle/theory/CSemitones.h"

#include <ostream>

namespace brindle {

void CSemitones::AppendJSONString(std::ostream& stream) const {
    for (int i = 0; i < 12; ++i) {
        stream << (i == 0 ? '[' : ',') << (mMask >> i & 1);
    }
    stream << ']';
}

std::ostream& operator<<(std::ostream& stream, const CSemitones& semitones) {
    return stream << semitones.Mask();
}

}  // namespace brindle
