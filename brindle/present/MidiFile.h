// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

// What a Standard MIDI File holds. All times are ticks from the start of the file, in any order;
// channels count from 0 to 15.

/// A note from its beginning to its end.
struct CMidiNote {
    std::int64_t mTick = 0;
    std::int64_t mDuration = 0;  ///< in ticks; a note without length is held for one
    int mChannel = 0;
    int mNoteNr = 60;  ///< 0 to 127; other notes are left out
    int mVelocity = 80;
};

/// The instrument of a channel from here on.
struct CMidiProgram {
    std::int64_t mTick = 0;
    int mChannel = 0;
    int mProgram = 0;  ///< 0 to 127, 0 is the grand piano
};

/// Held in the file as whole microseconds per quarter note.
struct CMidiTempo {
    std::int64_t mTick = 0;
    double mQuartersPerMinute = 120.0;
};

/// A time signature that holds from a tick on.
struct CMidiTimeSignature {
    std::int64_t mTick = 0;
    int mNumerator = 4;    ///< 1 to 255
    int mDenominator = 4;  ///< rounded down to a power of two
};

/// A key signature that holds from a tick on.
struct CMidiKeySignature {
    std::int64_t mTick = 0;
    int mSharps = 0;  ///< -7 (flats) to 7
    bool mIsMinor = false;
};

/// A track: its name, which instruments play it, and its notes.
struct CMidiTrack {
    std::string mName;
    std::vector<CMidiProgram> mPrograms;
    std::vector<CMidiNote> mNotes;
};

/// A piece: what holds for all tracks, and the tracks.
struct CMidiPiece {
    int mTicksPerQuarter = 480;  ///< 1 to 32767
    std::vector<CMidiTempo> mTempos;
    std::vector<CMidiTimeSignature> mTimeSignatures;
    std::vector<CMidiKeySignature> mKeySignatures;
    std::vector<CMidiTrack> mTracks;
};

/// The bytes of a Standard MIDI File of format 1: a first track with tempos and signatures, then
/// the tracks. Values out of range are limited to it.
[[nodiscard]] std::string MidiFileBytes(const CMidiPiece& piece);

}  // namespace brindle
