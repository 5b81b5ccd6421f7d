// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsSignKeys.h"
#include "brindle/analysis/CHarmCopy.h"
#include "brindle/analysis/Positions.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

struct Error;

/// Most measures that a score may have, those of all parts counted; a longer one fails to load.
inline constexpr std::size_t kMaxWrittenMeasures = 1'000'000;
/// How often repeats and jumps may play what is written: measures, harmonies and their room alike.
/// A song that goes on is cut there, and its load reports failure. A short song may play more
/// often, and a long one less: see the bounds below. What is written is played in any case.
inline constexpr std::size_t kMaxTimesPlayed = 64;
/// Measures that a song may always play.
inline constexpr std::size_t kMinPlayedMeasures = 10'000;
/// Most measures that it may play.
inline constexpr std::size_t kMaxPlayedMeasures = 100'000;
/// Harmonies that a song may always play.
inline constexpr std::size_t kMinPlayedHarmonies = 10'000;
/// Most harmonies that it may play.
inline constexpr std::size_t kMaxPlayedHarmonies = 100'000;
/// Room in bytes that the played harmonies may always take.
inline constexpr std::size_t kMinPlayedBytes = std::size_t{16} << 20;
/// Most room that they may take.
inline constexpr std::size_t kMaxPlayedBytes = std::size_t{64} << 20;

/// A time signature that holds from a position in quarter notes on.
struct TMusicXMLTimeSignature {
    double mPosition = kPosUndef;   ///< where it begins to hold
    std::int32_t mNumerator = 4;    ///< beats in a bar
    std::int32_t mDenominator = 4;  ///< 4 where a quarter is the beat

    friend bool operator==(const TMusicXMLTimeSignature&, const TMusicXMLTimeSignature&) = default;
};

/// A part of a song that begins at a rehearsal mark.
struct CHarmSection {
    double mPosition = kPosUndef;  ///< in quarter notes
    bool mFlag1 = false;           ///< not used
    bool mFlag2 = true;            ///< not used
    /// True only for the first section of a song.
    bool mIsFirst = false;

    friend bool operator==(const CHarmSection&, const CHarmSection&) = default;
};

/// The start of a bar as it is played.
struct CHarmBarline {
    double mPosition = kPosUndef;  ///< in quarter notes, ascending in a list

    friend bool operator==(const CHarmBarline&, const CHarmBarline&) = default;
};

/// The harmonies of a lead sheet in playing order, with repeats, endings and jumps played through.
/// All positions are quarter notes from the start of the song.
struct TMusicXMLDoc {
    std::string Title;  ///< in UTF-8; empty where the file tells none
    /// The keys as read, at unknown positions, then each change where it is played.
    CHarmAnlsSignKeys HarmSignKeys;
    std::vector<TMusicXMLHarmony> Harmonies;  ///< in playing order
    /// Indexes into `Harmonies`, one for each measure with the word "/".
    std::vector<std::uint64_t> ChordSequences;
    /// Each where it differs from the one before.
    std::vector<TMusicXMLTimeSignature> TimeSignatures;
    std::vector<CHarmSection> HarmSections;  ///< one for each rehearsal mark that is passed
    /// One entry for each jump back.
    CHarmCopies HarmCopies;
    /// Left empty by LoadFromMusicXMLFile.
    std::vector<CHarmBarline> HarmBarlines;

    /// Empties the title, the sign keys and the harmonies; the other fields stay.
    void clear();

    /// Reads a plain MusicXML file. A harmony lasts as long as the last duration read behind it,
    /// measures without harmonies take no time, and all parts are read as one song. False when the
    /// file cannot be read or is not well-formed (what was read before the fault stays), or when
    /// the song does not end.
    bool LoadFromMusicXMLFile(const std::string& path);
    /// The same for a plain MusicXML text in memory.
    bool LoadFromMusicXML(std::string_view bytes);

    /// Reads a MusicXML file, plain or compressed, as a musician plays it: the chords of the first
    /// part that has any stand where the notes are and last to the next one, all measures take
    /// their time, and repeats, endings, D.C., D.S., Coda and Fine are followed, whether signs,
    /// words or sound instructions tell them. Keys stand only where they begin to hold; a key
    /// without mode has the undefined type. Copies are told backwards, as CHarmCopy says, and are
    /// as long as the same measures follow on each other. Replaces all fields. False when the file
    /// is no score that can be read, or when the song does not end (what was played up to there
    /// stays); `error`, if given, then tells why, with line and column of a fault in the text.
    bool LoadAsPlayed(const std::string& path, Error* error = nullptr);
    /// The same for a file in memory.
    bool LoadAsPlayedFromBytes(std::string_view bytes, Error* error = nullptr);
};

}  // namespace brindle
