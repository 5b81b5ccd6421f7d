// SPDX-License-Identifier: MIT
// Any text as the vector of a chord, and as the dictionary that holds one.

#include "brindle/analysis/CHarmAnlsChordForMetro.h"
#include "brindle/analysis/ChordVectorText.h"

#include <cstddef>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <string_view>

namespace {

using brindle::CHarmAnlsChordForMetro;

void Check(bool condition) {
    if (!condition) __builtin_trap();
}

// What a vector says is said again by the vector of the chord.
void CheckChord(const CHarmAnlsChordForMetro& chord) {
    CHarmAnlsChordForMetro again;
    again.SetFromChordVectorRepresentation(chord.GetChordVectorRepresentation());
    Check(again.GetChordVectorRepresentation() == chord.GetChordVectorRepresentation());
    for (const bool flag : {false, true}) {
        Check(!chord.NameForMetroExport(flag).empty());
        (void)chord.SimplifiedToMajorOrMinor(flag);
        (void)chord.SimplifiedToRecognizedMetroChord(flag);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const brindle::CChordVectorText read = brindle::ReadChordVector(text);
    Check(read.mVector.size() == (read.mError.empty() ? 46 : 0) && read.mColumn <= size);
    CHarmAnlsChordForMetro chord;
    chord.SetFromChordVectorRepresentation(read.mVector);
    if (read.mError.empty()) {
        Check(brindle::ReadChordVector(brindle::WriteChordVector(read.mVector)).mVector ==
              read.mVector);
        CheckChord(chord);
    }
    chord.FromDictionary(nlohmann::json::parse(text.begin(), text.end(), nullptr, false));
    (void)chord.NameForMetroExport(true);
    return 0;
}
