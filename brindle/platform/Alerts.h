// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <string>

namespace brindle {

/// What is shown to the user when something goes wrong and the caller is not the one to be told.
struct CAlert {
    std::string messageText;      ///< the heading
    std::string informativeText;  ///< one sentence
    std::string button;           ///< the word that closes the panel
};

/// What a host does with an alert.
using TAlertHandler = std::function<void(const CAlert&)>;

/// Lets a host show alerts by its own means; an empty handler brings the default back, which writes
/// one line to standard error. Safe to call from any thread.
void SetAlertHandler(TAlertHandler handler);

/// Hands the alert to the handler, on the caller's thread.
void ShowAlert(const CAlert& alert);

/// While one lives, alerts of its thread are shown to nobody: for a caller who is told the error.
class CMutedAlerts {
public:
    CMutedAlerts();
    CMutedAlerts(const CMutedAlerts&) = delete;
    CMutedAlerts& operator=(const CMutedAlerts&) = delete;
    ~CMutedAlerts();
};

}  // namespace brindle
