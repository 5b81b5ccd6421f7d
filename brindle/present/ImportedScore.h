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

/// The note number of the snare drum in General MIDI, for a note to which neither instrument nor
/// staff place gives one.
inline constexpr int kUsualDrumKey = 38;

/// One line of the table of a part: a note, or something that stands between notes.
struct CImportedEvent {
    std::int32_t mPosition = 0;           ///< in ticks
    std::optional<std::int32_t> mLength;  ///< in ticks; of notes, where it is known
    std::string mWhat;                    ///< "Bb4", "time 3/4"
    std::string mMarks;                   ///< "chord staccato"
    bool mIsNote = false;                 ///< otherwise it is something between notes
    std::int64_t mNoteNr = -1;  ///< of a note as it sounds, 0 to 127; -1 where it has no pitch
    int mVelocity = 0;          ///< of a note, 1 to 127
    std::int32_t mVoice = 0;    ///< of a note; 0 where the score tells none
    std::int32_t mStaff = 0;    ///< of a note, from 1; 0 where the score tells none
};

/// A note as it is heard.
struct CPlayedNote {
    std::int32_t mPosition = 0;           ///< in ticks
    std::optional<std::int32_t> mLength;  ///< in ticks, where it is known
    std::int64_t mNoteNr = -1;            ///< 0 to 127; -1 where it has no pitch
    int mVelocity = 0;                    ///< 1 to 127
    bool mIsUnpitched = false;            ///< a note of drums and their like
    /// Of a note without pitch, the note number that plays it, from 0, where the score tells it.
    std::optional<int> mMidiKey;
    /// The channel of its instrument, from 0, where the score tells it.
    std::optional<int> mMidiChannel;
};

/// Where a measure begins, and its number as it is printed.
struct CImportedMeasure {
    std::int32_t mPosition = 0;  ///< in ticks
    std::string mNumber;         ///< "12", "X1"; "-" for none
};

/// How MIDI plays an instrument of a part; all numbers from 0. A number that MIDI does not have is
/// as one that the score does not tell.
struct CImportedInstrument {
    std::optional<int> mProgram;       ///< the sound, 0 is a grand piano
    std::optional<int> mChannel;       ///< 9 is that of drums
    std::optional<int> mUnpitchedKey;  ///< of all notes without a pitch
};

/// A part of a score: its name, how MIDI plays it, and all that happens in it, in the order of the
/// file.
struct CImportedPart {
    std::string mID;              ///< as in the list of parts, "P1"
    std::string mName;            ///< the best that CMuxmlPart has; may be empty
    std::optional<int> mProgram;  ///< from 0
    std::optional<int> mChannel;  ///< from 0
    /// By the identifiers that notes have.
    std::map<std::string, CImportedInstrument, std::less<>> mInstruments;
    /// Of several instruments, the one for notes without a pitch that name none.
    CImportedInstrument mUsualDrum;
    std::vector<CImportedEvent> mEvents;      ///< in the order of the file
    std::vector<CImportedMeasure> mMeasures;  ///< likewise
    std::vector<CPlayedNote> mPlayedNotes;    ///< all that is heard
    /// Those of them whose ties lead nowhere.
    std::vector<CImportedEvent> mNotesLeftOpen;
    std::int32_t mEnd = 0;  ///< in ticks, the end of its last bar
};

/// What an import told, kept for the eye and the ear.
struct CImportedScore {
    std::vector<CImportedPart> mParts;                ///< in the order of the file
    std::vector<CMidiTempo> mTempos;                  ///< of all parts, as they come
    std::vector<CMidiTimeSignature> mTimeSignatures;  ///< of the first part
    std::vector<CMidiKeySignature> mKeySignatures;    ///< of the first part, as they sound
    bool mIsInPart = false;                           ///< while the score is filled
    std::vector<CImportedEvent> mEventsBeforePart;  ///< likewise; they go to the part that follows
};

/// A host that fills the score, which must live as long.
[[nodiscard]] MusicXmlParserDelegate HostFor(CImportedScore& score);

}  // namespace brindle
