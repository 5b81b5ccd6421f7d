// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

/// The translation of `key` in the present locale, in UTF-8; the key itself when there is none.
[[nodiscard]] std::string LocalizedString(const std::string& key);

/// Tells where the translations lie: a folder with `<language>/LC_MESSAGES/brindle.mo` in it.
/// Without this call they are looked for where the system keeps them.
void SetLocalizationFolder(const std::string& folder);

}  // namespace brindle
