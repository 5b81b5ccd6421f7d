// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/MidiFile.h"

#include <vector>

namespace brindle {

// Chords as they are played: a piano for them and an acoustic bass below it.

inline constexpr int kPianoChannel = 0;
inline constexpr int kBassChannel = 1;

/// The two tracks without a note. Programs are those of General MIDI, from 0.
[[nodiscard]] inline std::vector<CMidiTrack> PianoAndBass() {
    constexpr int kGrandPiano = 0;
    constexpr int kAcousticBass = 32;
    return {{"Chords", {{0, kPianoChannel, kGrandPiano}}, {}},
            {"Bass", {{0, kBassChannel, kAcousticBass}}, {}}};
}

}  // namespace brindle
