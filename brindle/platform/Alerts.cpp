// SPDX-License-Identifier: MIT
#include "brindle/platform/Alerts.h"

#include <iostream>
#include <mutex>
#include <utility>

namespace brindle {

namespace {

struct CHandlerInUse {
    std::mutex mMutex;
    TAlertHandler mHandler;
};

CHandlerInUse& HandlerInUse() {
    static CHandlerInUse handler;
    return handler;
}

thread_local int theMutedDepth = 0;

void WriteToStandardError(const CAlert& alert) {
    std::cerr << alert.messageText + ": " + alert.informativeText + '\n';
}

}  // namespace

void SetAlertHandler(TAlertHandler handler) {
    CHandlerInUse& inUse = HandlerInUse();
    const std::lock_guard lock(inUse.mMutex);
    inUse.mHandler = std::move(handler);
}

void ShowAlert(const CAlert& alert) {
    if (theMutedDepth > 0) return;
    TAlertHandler handler;
    {
        CHandlerInUse& inUse = HandlerInUse();
        const std::lock_guard lock(inUse.mMutex);
        handler = inUse.mHandler;
    }
    handler ? handler(alert) : WriteToStandardError(alert);
}

CMutedAlerts::CMutedAlerts() {
    ++theMutedDepth;
}

CMutedAlerts::~CMutedAlerts() {
    --theMutedDepth;
}

}  // namespace brindle
