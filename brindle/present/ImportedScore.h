// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParserDelegate.h"
#include "brindle/present/MidiFile.h"

#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace brindle {

/// Ticks to the quarter of an import by the program.
inline constexpr std::int32_t kImportTicksPerQuarter = 960;

/// One line of the table of a part: a note, or something that stands between notes.
struct CImportedEvent {
    std::int32_t mPosition = 0;           ///< in ticks
    std::optional<std::int32_t> mLength;  ///< in ticks; of notes, where it is known
    std::string mWhat;                    ///< "Bb4", "time 3/4"
    std::string mMarks;                   ///< "chord staccato"
    bool mIsNote = false;
    std::int64_t mNoteNr = -1;
    int mVelocity = 0;
    std::int32_t mVoice = 0;
    std::int32_t mStaff = 0;
    bool mIsUnpitched = false;
    /// Of a note, what its instrument is played with: from 0, where the score tells it.
    std::optional<int> mMidiKey;
    std::optional<int> mMidiChannel;
};

/// Where a measure begins, and its number as it is printed.
struct CImportedMeasure {
    std::int32_t mPosition = 0;
    std::string mNumber;
};

/// How MIDI plays an instrument of a part; all numbers from 0.
struct CImportedInstrument {
    std::optional<int> mProgram;
    std::optional<int> mChannel;
    std::optional<int> mUnpitchedKey;  ///< of all notes without a pitch
};

/// A part of a score: its name, how MIDI plays it, and all that happens in it, in the order of the
/// file.
struct CImportedPart {
    std::string mID;
    std::string mName;
    std::optional<int> mProgram;  ///< from 0
    std::optional<int> mChannel;  ///< from 0
    /// By the identifiers that notes have.
    std::map<std::string, CImportedInstrument, std::less<>> mInstruments;
    std::vector<CImportedEvent> mEvents;
    std::vector<CImportedMeasure> mMeasures;
    /// Notes whose ties never end: they are none of the events, and sound as long as is written.
    std::vector<CImportedEvent> mNotesLeftOpen;
    std::int32_t mEnd = 0;
};

/// What an import told, kept for the eye and the ear.
struct CImportedScore {
    std::vector<CImportedPart> mParts;
    std::vector<CMidiTempo> mTempos;
    // Of the first part:
    std::vector<CMidiTimeSignature> mTimeSignatures;
    std::vector<CMidiKeySignature> mKeySignatures;
    // While the score is filled:
    bool mIsInPart = false;
    std::vector<CImportedEvent> mEventsBeforePart;
};

/// A host that fills the score, which must live as long.
[[nodiscard]] MusicXmlParserDelegate HostFor(CImportedScore& score);

}  // namespace brindle
