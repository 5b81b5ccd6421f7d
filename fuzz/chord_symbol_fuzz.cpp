// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

/// The first byte chooses the preferences, the rest is the symbol.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    brindle::CChordNamePrefs prefs;
    prefs.mBForBFlat = (data[0] & 1) != 0;
    if ((data[0] & 2) != 0) prefs.mSlashText = "\xE2\x88\x95";
    if ((data[0] & 4) != 0) prefs.mSlashText.clear();
    const std::string_view symbol(reinterpret_cast<const char*>(data + 1), size - 1);
    const brindle::CChordLite chord(symbol, prefs);
    if (chord.mSemitones.Mask() > 0xFFF) std::abort();
    return 0;
}
