// SPDX-License-Identifier: MIT
#include "brindle/theory/CHarmCenterLite.h"

#include <ostream>

namespace brindle {

std::ostream& operator<<(std::ostream& stream, const CHarmCenterLite& center) {
    return stream << "CHarmCenterLite: RootKeyEnh " << center.mRootKeyEnh << ", Semitones "
                  << center.mSemitones;
}

}  // namespace brindle
