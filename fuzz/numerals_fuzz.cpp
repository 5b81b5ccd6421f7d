// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadNumerals.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace {

constexpr std::size_t kLongestText = 65536;

// What is read is written, and read again as the same tones.
void CheckWritten(const brindle::CChordLite& chord, const brindle::CSignKeyLite& key,
                  const brindle::CNumeralOptions& options) {
    const auto numeral = brindle::RomanNumeral(chord, key, nullptr, options);
    const auto read = brindle::ChordFromNumeral(numeral, key, options);
    if (!read || read->mSemitones != chord.mSemitones ||
        read->mRootKeyEnh.mKeyNr != chord.mRootKeyEnh.mKeyNr) {
        std::abort();
    }
}

void ReadAsNumerals(std::string_view text, const brindle::CNumeralOptions& options) {
    for (const char* name : {"Eb major", "F# minor"}) {
        const brindle::CSignKeyLite key(name);
        const auto reading = brindle::ReadNumerals(text, key, options);
        for (const auto& word : reading.mWords) {
            if (!word.mChord.IsUndef()) CheckWritten(word.mChord, key, options);
        }
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size > kLongestText) return 0;
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    ReadAsNumerals(text, {});
    ReadAsNumerals(text, {.mFigures = true});
    ReadAsNumerals(text, {.mByKey = true});
    return 0;
}
