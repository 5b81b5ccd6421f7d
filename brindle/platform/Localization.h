// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

/// The translation of `key` in UTF-8; the key itself when there is none.
///
/// As thread-safe as the localizer, which is the system's unless a host has set another.
[[nodiscard]] std::string LocalizedString(const std::string& key);

/// Finds the translation of a key, and gives the key itself when there is none.
using TLocalizer = std::string (*)(const std::string& key);

/// Lets a host translate by its own means; a null pointer brings the system's catalogues back.
void SetLocalizer(TLocalizer localizer);

/// Tells where the system's catalogues lie: a folder with `<language>/LC_MESSAGES/brindle.mo` in
/// it. Without this call they are looked for where the system keeps them.
void SetLocalizationFolder(const std::string& folder);

}  // namespace brindle
