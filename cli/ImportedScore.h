// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParserDelegate.h"

#include "cli/MidiFile.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace brindle::cli {

class CPaint;

/// Ticks to the quarter of an import by the program.
inline constexpr std::int32_t kImportTicksPerQuarter = 960;

/// One line of the table of a part: a note, or something that stands between notes.
struct TImportedEvent {
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

struct TImportedMeasure {
    std::int32_t mPosition = 0;
    std::string mNumber;
};

struct TImportedPart {
    std::string mID;
    std::string mName;
    std::optional<int> mProgram;  ///< from 0
    std::optional<int> mChannel;  ///< from 0
    std::vector<TImportedEvent> mEvents;
    std::vector<TImportedMeasure> mMeasures;
    std::int32_t mEnd = 0;
};

/// What an import told, kept for the eye and the ear.
struct TImportedScore {
    std::vector<TImportedPart> mParts;
    std::vector<TMidiTempo> mTempos;
    // Of the first part:
    std::vector<TMidiTimeSignature> mTimeSignatures;
    std::vector<TMidiKeySignature> mKeySignatures;
    // While the score is filled:
    bool mIsInPart = false;
    std::vector<TImportedEvent> mEventsBeforePart;
};

/// A host that fills the score, which must live as long.
[[nodiscard]] MusicXmlParserDelegate HostFor(TImportedScore& score);

/// A table for each part.
[[nodiscard]] std::string ImportText(TImportedScore score, const CPaint& paint);

/// One track for each part. Notes of unknown length are left out.
[[nodiscard]] TMidiPiece MidiPieceOf(const TImportedScore& score);

}  // namespace brindle::cli
