// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"

#include "brindle/Version.h"
#include "brindle/platform/Alerts.h"
#include "brindle/platform/Localization.h"
#include "brindle/platform/Resources.h"

using namespace brindle::border;

const char* brindle_version(void) {
    return brindle::BrindleVersionString;
}

int brindle_api_version(void) {
    return BRINDLE_API_VERSION;
}

brindle_status brindle_set_data_folder(const char* path) {
    return Guarded([&] {
        brindle::SetResourceFolder(path == nullptr ? "" : path);
        return BRINDLE_OK;
    });
}

brindle_status brindle_set_locale_folder(const char* path) {
    if (path == nullptr) return FailForNull("path");
    return Guarded([&] {
        brindle::SetLocalizationFolder(path);
        return BRINDLE_OK;
    });
}

brindle_status brindle_set_alert_handler(brindle_alert_handler handler, void* context) {
    return Guarded([&] {
        if (handler == nullptr) {
            brindle::SetAlertHandler({});
        } else {
            brindle::SetAlertHandler([handler, context](const brindle::CAlert& alert) {
                handler(alert.messageText.c_str(), alert.informativeText.c_str(), context);
            });
        }
        return BRINDLE_OK;
    });
}
