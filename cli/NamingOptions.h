// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CChordNamePrefs.h"

#include <optional>
#include <string>

namespace brindle::cli {

class CCommand;

/// The options that tell how names are written, one for each naming preference that has an effect.
class CNamingOptions {
public:
    /// All of them.
    void AddTo(CCommand& command);
    /// Those that the symbol of a chord takes up.
    void AddSymbolsTo(CCommand& command,
                      const char* majorSeventhPurpose = "A major seventh; usual is maj7");

    [[nodiscard]] CChordNamePrefs Prefs() const;
    /// The same with a major seventh as players write it, "maj7", unless it was told otherwise.
    [[nodiscard]] CChordNamePrefs PlayersPrefs() const;
    /// These, or nothing if no option tells another style than the usual one.
    [[nodiscard]] std::optional<CChordNamePrefs> ToldPrefs() const;
    [[nodiscard]] bool ReadsBAsBFlat() const { return mPrefs.mBForBFlat; }

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
