// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParserDelegate.h"
#include "brindle/present/MidiFile.h"

#include <cstdint>
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
};

struct CImportedMeasure {
    std::int32_t mPosition = 0;
    std::string mNumber;
};

struct CImportedPart {
    std::string mID;
    std::string mName;
    std::optional<int> mProgram;  ///< from 0
    std::optional<int> mChannel;  ///< from 0
    std::vector<CImportedEvent> mEvents;
    std::vector<CImportedMeasure> mMeasures;
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
