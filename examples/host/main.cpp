// SPDX-License-Identifier: MIT
// A small host program: analyses a chord text and prints what it finds.

#include "brindle/brindle.h"

#include <iostream>

int main() {
    brindle::CHarmonicAnalyse analyse;
    analyse.AnalyseFromChordString("Dm7 G7 | C", {}, brindle::TAnalyse_TonicProgressions, {});

    for (const auto& signKey : analyse.mSignKeys) {
        std::cout << signKey.mSignKey.NameLong(brindle::CurrentChordNamePrefs) << '\n';
        for (const auto& center : signKey.mHarmCenters) {
            for (const auto& chord : center.mChords) {
                std::cout << "  beat " << chord.mPosition << ": " << chord.mRootDistToHarmCenter
                          << " semitones above the center\n";
            }
        }
    }
    return 0;
}
