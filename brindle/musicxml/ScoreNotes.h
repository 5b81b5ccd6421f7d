// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CNote.h"

#include <cstddef>
#include <string_view>
#include <vector>

namespace brindle {

struct Error;

/// A note that sounds from a position on. Both are quarter notes from the start of the score.
struct CTimedNote {
    double mPosition = 0.0;  ///< when it begins
    double mLength = 0.0;    ///< above 0; of tied notes together
    /// As it sounds; without a spelling in parts that are written in another pitch.
    CNote mNote;

    [[nodiscard]] double EndPosition() const { return mPosition + mLength; }  ///< when it ends
};

/// A bar as it is written.
struct CScoreBar {
    double mPosition = 0.0;     ///< in quarter notes, as the end
    double mEndPosition = 0.0;  ///< a whole bar later, also for an upbeat
    /// Length of a beat: a quarter in 4/4, a dotted one in 6/8.
    double mBeat = 1.0;
};

/// What sounds in a score and where its bars are, of all parts together.
struct CScoreNotes {
    /// By position, the lower note first. Tied notes are one note; grace notes, cue notes and
    /// unpitched ones are left out.
    std::vector<CTimedNote> mNotes;
    /// Those of the first part, one behind the other.
    std::vector<CScoreBar> mBars;
};

/// Reads the notes of a score in MusicXML, plain or compressed, as it is written: each bar once,
/// without repeats. False when the bytes are no score that can be read; `error`, if given, then
/// tells why. The limits are those of MusicXmlParser, of which one may run at a time.
[[nodiscard]] bool ReadScoreNotes(std::string_view bytes, CScoreNotes& notes,
                                  Error* error = nullptr);

}  // namespace brindle
