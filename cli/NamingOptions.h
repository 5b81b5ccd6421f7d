// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CChordNamePrefs.h"

#include <string>

namespace brindle::cli {

class CCommand;

/// The options that tell how names are written, one for each naming preference that has an effect.
class CNamingOptions {
public:
    void AddTo(CCommand& command);

    [[nodiscard]] CChordNamePrefs Prefs() const;
    /// The same with a major seventh as players write it, "maj7", unless it was told otherwise.
    [[nodiscard]] CChordNamePrefs PlayersPrefs() const;

private:
    CChordNamePrefs mPrefs;
    bool mAscii = false;
    bool mSlash = false;
    bool mKeepBassOption = false;
    bool mBrackets = false;
    bool mSpaces = false;
    bool mSpacesAroundSlash = false;
    std::string mMiddleC = "4";
    std::string mMajorSeventh = "usual";
};

}  // namespace brindle::cli
