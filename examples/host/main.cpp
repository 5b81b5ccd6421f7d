// SPDX-License-Identifier: MIT
// A small host program: reads a song, from a file in any form or from a text, analyses it and
// prints what it finds.

#include "brindle/brindle.h"

#include <iostream>

int main(int argc, char** argv) {
    const brindle::CSong song =
        argc > 1 ? brindle::ReadSongFile(argv[1]) : brindle::ReadSong("Dm7 G7 | C");
    for (const auto& fault : song.mFaults) {
        std::cerr << fault.mLine << ':' << fault.mColumn << ": " << fault.mText << '\n';
    }
    if (song.HasFault()) return 1;

    const brindle::CSongAnalysis found = brindle::AnalyseSong(song);
    for (const auto& signKey : found.mAnalyse.mSignKeys) {
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
