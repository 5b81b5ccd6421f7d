// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/present/CGridStyle.h"
#include "cli/Output.h"

#include <optional>
#include <string>

namespace brindle::cli {

class CCommand;

/// The options of what a hand can hold and of how it is drawn.
class CFingeringOptionsOfUser {
public:
    void AddTo(CCommand& command);

    [[nodiscard]] CFingeringOptions Options() const;
    [[nodiscard]] CGridStyle Style() const;

private:
    int mMost = 6;
    int mHighestFret = 15;
    int mSpan = 4;
    bool mIsWhole = false;
    bool mIsRootless = false;
    std::string mBass = "usual";
    std::string mDots = "fingers";
    bool mIsLeft = false;
};

/// The tuning of an option; nothing if it is none, and then the error has been printed.
[[nodiscard]] std::optional<GChShortTuning> ReadTuningOption(const std::string& text);

/// Prints that a chord has no fingering on a tuning, and why.
TStatus FailWithoutFingering(const std::string& symbol, const GChShortTuning& tuning);

}  // namespace brindle::cli
