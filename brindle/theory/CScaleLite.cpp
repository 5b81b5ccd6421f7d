// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleLite.h"

#include <ostream>

namespace brindle {

void CScaleLite::AppendJSONString(std::ostream& stream) const {
    stream << R"({"CKeyEnh":)";
    mRootKeyEnh.AppendJSONString(stream);
    stream << R"(,"Semitones":")";
    mSemitones.AppendJSONString(stream);
    stream << "\"}";
}

std::ostream& operator<<(std::ostream& stream, const CScaleLite& scale) {
    return stream << "CScaleLite: RootKeyEnh " << scale.mRootKeyEnh << ", Semitones "
                  << scale.mSemitones;
}

}  // namespace brindle
