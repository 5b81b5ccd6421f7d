// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include <chrono>
#include <cstddef>
#include <string>
#include <string_view>

namespace brindle::cli {

/// A bar on standard error that tells how far a work of many steps is, when it takes about a second
/// or longer. Elsewhere than on a terminal nothing is shown. The bar is gone when the object is.
class CProgress {
public:
    explicit CProgress(std::size_t steps);
    CProgress(const CProgress&) = delete;
    CProgress& operator=(const CProgress&) = delete;
    ~CProgress() { HideProgress(); }

    /// The next step begins; `name` is what it works on.
    void Step(std::string_view name);

private:
    std::size_t mSteps;
    std::size_t mBegun = 0;
    bool mIsTerminal;
    std::chrono::steady_clock::time_point mNextShow;
};

/// The same for a work whose length nobody knows: a line that tells how much has been done.
class CCountProgress {
public:
    /// `name` is what is worked on, `unit` what is counted: "bars".
    CCountProgress(std::string_view name, std::string unit);
    CCountProgress(const CCountProgress&) = delete;
    CCountProgress& operator=(const CCountProgress&) = delete;
    ~CCountProgress() { HideProgress(); }

    void CountOne();

private:
    std::string mName;
    std::string mUnit;
    std::size_t mCount = 0;
    bool mIsTerminal;
    std::chrono::steady_clock::time_point mNextShow;
};

}  // namespace brindle::cli
