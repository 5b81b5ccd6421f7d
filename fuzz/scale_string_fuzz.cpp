// SPDX-License-Identifier: MIT
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const brindle::CChordNamePrefs prefs;
    const brindle::CScaleLite compact(text, prefs);
    const brindle::CScaleHeavy full(text, prefs);
    if (full.ToSemitones() != compact.mSemitones) std::abort();
    return 0;
}
