// SPDX-License-Identifier: MIT
// Any text as a typed key and as a typed scale: either it is understood, or it is told where not.

#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/ReadKeyText.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const brindle::CKeyText key = brindle::ReadKeyText(text);
    if (key.mError.empty() == key.mSignKey.IsUndef() || key.mColumn > size) std::abort();
    if (key.mError.empty()) {
        const auto name = key.mSignKey.NameLong(brindle::ChordNamePrefsNonUTF8);
        if (!(brindle::ReadKeyText(name).mSignKey == key.mSignKey)) std::abort();
    }
    const brindle::CScaleText scale = brindle::ReadScaleText(text);
    if (scale.mColumn > size) std::abort();
    if (scale.mError.empty() && scale.mScale.ToSemitones().IsEmpty()) std::abort();
    return 0;
}
