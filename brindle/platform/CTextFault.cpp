// SPDX-License-Identifier: MIT
#include "brindle/platform/CTextFault.h"

#include <fmt/format.h>

#include <ostream>

namespace brindle {

std::string FaultWithPlace(const CTextFault& fault) {
    if (fault.mLine == 0) return fault.mText;
    return fmt::format("{}:{}: {}", fault.mLine, fault.mColumn, fault.mText);
}

std::ostream& operator<<(std::ostream& stream, const CTextFault& fault) {
    return stream << FaultWithPlace(fault);
}

}  // namespace brindle
