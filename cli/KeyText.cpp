// SPDX-License-Identifier: MIT
#include "cli/KeyText.h"

#include "cli/Input.h"

namespace brindle::cli {

std::optional<CSignKeyLite> ReadKeyOption(std::string_view typed) {
    const std::string text = FoldAccidentals(typed);
    const CKeyText key = ReadKeyText(text);
    if (key.mError.empty()) return key.mSignKey;
    static_cast<void>(FailAt(TStatus::BadUsage, "--key: " + key.mError, text, key.mColumn));
    return std::nullopt;
}

}  // namespace brindle::cli
