// SPDX-License-Identifier: MIT
// A small host program: reads a song, from a file in any form or from a text, analyses it, and
// writes what it finds as JSON and as a picture.

#include "brindle/brindle.h"

#include <fstream>
#include <iostream>

int main(int argc, char** argv) {
    const auto song = argc > 1 ? brindle::ReadSongFile(argv[1]) : brindle::ReadSong("Dm7 G7 | C");
    for (const auto& fault : song.mFaults) std::cerr << fault << '\n';
    if (song.HasFault()) return 1;

    const brindle::CSongAnalysis found = brindle::AnalyseSong(song);
    std::cout << found.mKeys.mKey.NameLong(brindle::CurrentChordNamePrefs) << '\n';
    std::ofstream("song.json") << brindle::AnalysisJson(song, found);
    std::ofstream("song.svg") << brindle::AnalysisSvg(brindle::ShowSong(song, found));
}
