// SPDX-License-Identifier: MIT
// Any text as an analysis in RomanText: its chords and measures are in order of time, and each
// fault has a text.

#include "brindle/analysis/ReadRomanText.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace {

template <typename TPlaces>
void CheckOrder(const TPlaces& places) {
    double before = 0.0;
    for (const auto& place : places) {
        if (!(place.mPosition >= before) || !(place.mLength >= 0.0)) std::abort();
        before = place.mPosition;
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    constexpr std::size_t kMostBytes = 4096;
    if (size > kMostBytes) return 0;
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const brindle::CRomanTextReading reading = brindle::ReadRomanText(text);
    CheckOrder(reading.mChords);
    CheckOrder(reading.mBars);
    for (const brindle::CTextFault& fault : reading.mFaults) {
        if (fault.mText.empty()) std::abort();
    }
    return 0;
}
