// SPDX-License-Identifier: MIT
#include "brindle/platform/Alerts.h"

#include <iostream>
#include <mutex>
#include <utility>

namespace brindle {

namespace {

struct THandlerInUse {
    std::mutex mMutex;
    TAlertHandler mHandler;
};

THandlerInUse& HandlerInUse() {
    static THandlerInUse handler;
    return handler;
}

void WriteToStandardError(const TAlert& alert) {
    std::cerr << alert.messageText + ": " + alert.informativeText + '\n';
}

}  // namespace

void SetAlertHandler(TAlertHandler handler) {
    THandlerInUse& inUse = HandlerInUse();
    const std::lock_guard lock(inUse.mMutex);
    inUse.mHandler = std::move(handler);
}

void ShowAlert(const TAlert& alert) {
    TAlertHandler handler;
    {
        THandlerInUse& inUse = HandlerInUse();
        const std::lock_guard lock(inUse.mMutex);
        handler = inUse.mHandler;
    }
    handler ? handler(alert) : WriteToStandardError(alert);
}

}  // namespace brindle
