// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/NameNotes.h"
#include "brindle/musicxml/ScoreNotes.h"
#include "brindle/theory/CSignKeyLite.h"

#include <vector>

namespace brindle {

/// Where the chords of a score may stand.
enum class TChordEvery {
    Bar,     ///< one for each bar
    Beat,    ///< one for each beat
    Change,  ///< where the chord changes, at a beat
};

/// How the chords of a score are found in its notes.
struct CChordsFromNotesOptions {
    /// Where a chord may begin.
    TChordEvery mEvery = TChordEvery::Change;
    /// The key of the piece; it is found if it is undefined.
    CSignKeyLite mKey;
};

/// A chord of a score, named from its notes.
struct CChordFromNotes {
    /// Quarter notes from the start.
    double mPosition = 0.0;
    /// Quarter notes, up to where another chord begins or nothing sounds.
    double mLength = 0.0;
    CNamedChord mChord;  ///< its best name over the bass
};

/// The chords of a score without chord symbols.
struct CChordsFromNotes {
    /// As stated, or as FindKeys finds it.
    CSignKeyLite mKey;
    /// By position. Where nothing sounds there is no chord.
    std::vector<CChordFromNotes> mChords;
};

/// Names the chords of a score from what sounds in each bar or beat: all notes that sound there, so
/// that broken chords are whole, each weighed by how long it sounds, so that passing notes do not
/// count much. The bass is the lowest note where the bar or the beat begins. Chords are weighed by
/// how common they are over that bass and in the key, and the path through the piece is taken that
/// is likeliest as a whole, by the steps between roots. Time is linear in the notes and the beats.
///
/// A bar with more than 64 beats counts as one beat.
[[nodiscard]] CChordsFromNotes ChordsFromNotes(const CScoreNotes& score,
                                               const CChordsFromNotesOptions& options = {});

}  // namespace brindle
