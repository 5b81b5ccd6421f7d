// SPDX-License-Identifier: MIT
// Any bytes as a score, plain or compressed: both readings of it come to an end, and what they give
// can be analysed.

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/Error.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace {

// Longer songs take longer to analyse, not other ways.
constexpr std::size_t kMostHarmonies = 500;

void Analyse(const brindle::TMusicXMLDoc& doc) {
    if (doc.Harmonies.size() > kMostHarmonies) return;
    brindle::CHarmonicAnalyse analyse;
    analyse.AnalyseFromMusicXMLDoc(doc, brindle::TAnalyse_TonicProgressions);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view bytes(reinterpret_cast<const char*>(data), size);
    brindle::TMusicXMLDoc doc;
    brindle::Error error;
    const bool isRead = doc.LoadAsPlayedFromBytes(bytes, &error);
    if (isRead != error.description.empty()) __builtin_trap();
    double before = 0.0;
    for (const brindle::TMusicXMLHarmony& harmony : doc.Harmonies) {
        if (!(harmony.mPosition >= before) || !(harmony.mDuration >= 0.0)) __builtin_trap();
        before = harmony.mPosition;
    }
    Analyse(doc);
    (void)doc.LoadFromMusicXML(bytes);
    Analyse(doc);
    return 0;
}
