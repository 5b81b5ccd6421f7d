// SPDX-License-Identifier: MIT
#include "cli/ChordTextOptions.h"

#include "brindle/song/SongBeats.h"
#include "cli/CCommand.h"
#include "cli/Message.h"

namespace brindle::cli {

void AddBeats(CCommand& command, double& beatsPerBar, double& beatsPerChord) {
    command.AddOption("--beats-per-bar", "BEATS", beatsPerBar,
                      "Length of a bar in beats (default: 4)");
    command.AddOption("--beats-per-chord", "BEATS", beatsPerChord,
                      "Length of a chord in beats (default: 1)");
}

std::optional<std::string> BeatsContradiction(double beatsPerBar, double beatsPerChord) {
    for (const double beats : {beatsPerBar, beatsPerChord}) {
        if (AreSongBeats(beats)) continue;
        return Message("--beats-per-bar and --beats-per-chord take 1/1024 to 1024 beats");
    }
    return std::nullopt;
}

}  // namespace brindle::cli
