// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TBasicChord.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace brindle {

class CChordLite;
struct CChordNamePrefs;

/// The reader of chord symbols as people type them: "Eb maj 7/G", "C7 b13", "F#m7b5".
///
/// It is a scanner for keywords from left to right and no grammar: what it does not know it steps
/// over, so it never fails. The slash and the bass behind it are scanned for options too.
class CChordSetFromStringHelper {
public:
    /// Sets all of `chord` from the symbol. Without a note letter the root stays undefined and the
    /// semitones are read all the same.
    static void SetFromString(std::string_view symbol, CChordLite& chord,
                              const CChordNamePrefs& prefs);

private:
    /// Masks of intervals above the root, an octave and more: bit 14 is the ninth, bit 2 the
    /// second.
    struct CIntvlsOfOptions {
        std::uint32_t mAdd = 0;
        std::uint32_t mErase = 0;
    };

    explicit CChordSetFromStringHelper(std::span<char> lowercaseText)
        : mLowercaseText(lowercaseText) {}

    [[nodiscard]] std::string_view LowercaseText() const {
        return {mLowercaseText.data(), mLowercaseText.size()};
    }

    [[nodiscard]] bool _StringShouldSetUndefOrNoChord(CChordLite& chord);
    [[nodiscard]] CSemitones _BasicChordSemitonesFromString(int& pos);
    [[nodiscard]] CKeyEnh _BassKeyNrAndEnhFromString(const CChordNamePrefs& prefs) const;
    /// Folds UTF-8 signs in the text, so it comes last.
    [[nodiscard]] CIntvlsOfOptions _AddAndEraseIntvlsForOptionsFromString(int pos);
    void _AddAndEraseIntvlsForSingleOptionFromString(std::string_view text, int& pos,
                                                     CIntvlsOfOptions& options) const;

    /// What the text names itself; None for a major chord.
    TBasicChord mBasicChord = TBasicChord::None;
    std::span<char> mLowercaseText;
};

}  // namespace brindle
