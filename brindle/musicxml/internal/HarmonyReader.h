// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/musicxml/internal/ScoreElements.h"

#include <optional>
#include <string>
#include <string_view>

namespace brindle {

class XmlAttributes;

/// Reads one chord symbol of a score.
class CHarmonyReader {
public:
    CHarmonyReader() = default;
    explicit CHarmonyReader(const XmlAttributes& attributes);

    void Started(TScoreElement element, const XmlAttributes& attributes);
    void Ended(TScoreElement element, std::string_view text);
    /// The chord, its kind in the words of HarmonyKinds.h. Nothing for one that only stands in for
    /// another.
    [[nodiscard]] std::optional<TMusicXMLHarmony> Take();

private:
    TMusicXMLHarmony mHarmony;
    std::string mKindText;  // how the kind is printed
    /// A symbol may stack chords, "V of II"; the first one sounds.
    int mRootCount = 0;
    bool mIsAlternate = false;
};

}  // namespace brindle
