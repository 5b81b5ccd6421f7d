// SPDX-License-Identifier: MIT
#include "brindle/theory/TSignKeyType.h"

#include <ostream>

namespace brindle {

std::string_view JSONWord(TSignKeyType type) {
    switch (type) {
        case TSignKeyType_Undef:
            return "undef";
        case TSignKeyType_Major:
            return "major";
        case TSignKeyType_Minor:
            return "minor";
    }
    return "undef";
}

std::ostream& operator<<(std::ostream& stream, TSignKeyType type) {
    switch (type) {
        case TSignKeyType_Undef:
            return stream << "Undef";
        case TSignKeyType_Major:
            return stream << "Major";
        case TSignKeyType_Minor:
            return stream << "Minor";
    }
    return stream << "unkown TSignKeyType";
}

}  // namespace brindle
