// SPDX-License-Identifier: MIT
#include "cli/KeyText.h"

#include "cli/FaultMessage.h"
#include "cli/Output.h"

namespace brindle::cli {

std::optional<CSignKeyLite> ReadKeyOption(std::string_view typed) {
    const CKeyText key = ReadKeyText(typed);
    if (key.mError.empty()) return key.mSignKey;
    static_cast<void>(
        FailAt(TStatus::BadUsage, "--key: " + FaultMessage(key.mError), typed, key.mColumn));
    return std::nullopt;
}

std::optional<CSignKeyLite> ReadKeyIfTold(std::string_view typed) {
    return typed.empty() ? CSignKeyLite() : ReadKeyOption(typed);
}

}  // namespace brindle::cli
