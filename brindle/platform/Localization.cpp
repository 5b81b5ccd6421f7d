// SPDX-License-Identifier: MIT
#include "brindle/platform/Localization.h"

#include <atomic>

#if __has_include(<libintl.h>)
#include <libintl.h>
#endif

namespace brindle {

namespace {

#if __has_include(<libintl.h>)
constexpr const char* kTextDomain = "brindle";

/// From the catalogues of the system, by the locale that the host has set.
std::string SystemLocalizedString(const std::string& key) {
    // Without this, translations come in the character set of the locale.
    static const char* const codeset = bind_textdomain_codeset(kTextDomain, "UTF-8");
    if (codeset == nullptr || key.empty()) return key;  // the empty key is the catalogue's heading
    const char* translation = dgettext(kTextDomain, key.c_str());
    return translation == key.c_str() ? key : translation;
}
#else
std::string SystemLocalizedString(const std::string& key) {
    return key;
}
#endif

constinit std::atomic<TLocalizer> localizerInUse = nullptr;

}  // namespace

std::string LocalizedString(const std::string& key) {
    const TLocalizer localizer = localizerInUse.load();
    return localizer == nullptr ? SystemLocalizedString(key) : localizer(key);
}

void SetLocalizer(TLocalizer localizer) {
    localizerInUse.store(localizer);
}

void SetLocalizationFolder([[maybe_unused]] const std::string& folder) {
#if __has_include(<libintl.h>)
    bindtextdomain(kTextDomain, folder.c_str());
#endif
}

}  // namespace brindle
