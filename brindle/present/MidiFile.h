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
    std::int64_t mTick = 0;      ///< when it begins, 0 to 2^28 - 2
    std::int64_t mDuration = 0;  ///< in ticks; a note without length is held for one
    int mChannel = 0;            ///< 9 is that of drums
    int mNoteNr = 60;            ///< 0 to 127; other notes are left out
    int mVelocity = 80;          ///< 1 to 127, how hard the key is struck
};

/// The instrument of a channel from here on.
struct CMidiProgram {
    std::int64_t mTick = 0;  ///< from when on
    int mChannel = 0;        ///< whose notes it plays
    int mProgram = 0;        ///< 0 to 127, 0 is the grand piano
};

/// Held in the file as whole microseconds per quarter note.
struct CMidiTempo {
    std::int64_t mTick = 0;             ///< from when on
    double mQuartersPerMinute = 120.0;  ///< limited to 3.58 and more; below 0 it is 120
};

/// A time signature that holds from a tick on.
struct CMidiTimeSignature {
    std::int64_t mTick = 0;  ///< from when on
    int mNumerator = 4;      ///< 1 to 255
    int mDenominator = 4;    ///< rounded down to a power of two
};

/// A key signature that holds from a tick on.
struct CMidiKeySignature {
    std::int64_t mTick = 0;  ///< from when on
    int mSharps = 0;         ///< -7 (flats) to 7
    bool mIsMinor = false;   ///< the signs are those of a minor key
};

/// A track: its name, which instruments play it, and its notes.
struct CMidiTrack {
    std::string mName;                    ///< empty for none; its bytes are written as they are
    std::vector<CMidiProgram> mPrograms;  ///< for any channel
    std::vector<CMidiNote> mNotes;        ///< those out of range do not count
};

/// A piece: what holds for all tracks, and the tracks.
struct CMidiPiece {
    int mTicksPerQuarter = 480;                       ///< 1 to 32767
    std::vector<CMidiTempo> mTempos;                  ///< without any, players take 120
    std::vector<CMidiTimeSignature> mTimeSignatures;  ///< without any, players take 4/4
    std::vector<CMidiKeySignature> mKeySignatures;    ///< as the piece sounds
    std::vector<CMidiTrack> mTracks;                  ///< at most 65534 are written
};

/// The bytes of a Standard MIDI File of format 1: a first track with tempos and signatures, then
/// the tracks. Values out of range are limited to it.
[[nodiscard]] std::string MidiFileBytes(const CMidiPiece& piece);

}  // namespace brindle
