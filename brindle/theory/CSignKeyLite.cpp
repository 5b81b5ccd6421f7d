// SPDX-License-Identifier: MIT
#include "brindle/theory/CSignKeyLite.h"

#include <ostream>

namespace brindle {

void CSignKeyLite::AppendJSONString(std::ostream& stream) const {
    stream << R"({"CKeyEnh":)";
    mRootKeyEnh.AppendJSONString(stream);
    stream << R"(,"Type":")" << JSONWord(mSignKeyType) << "\"}";
}

std::ostream& operator<<(std::ostream& stream, const CSignKeyLite& signKey) {
    return stream << "CSignKeyLite: RootKeyEnh " << signKey.mRootKeyEnh << ", "
                  << signKey.mSignKeyType;
}

}  // namespace brindle
