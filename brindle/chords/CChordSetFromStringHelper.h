// SPDX-License-Identifier: MIT
#pragma once

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
};

}  // namespace brindle
