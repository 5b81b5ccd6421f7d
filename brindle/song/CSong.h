// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CHarmAnlsSignKeys.h"
#include "brindle/analysis/ReadHarmony.h"
#include "brindle/platform/CTextFault.h"
#include "brindle/song/TSongFormat.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace brindle {

/// A time signature. Undefined where a song does not tell one.
struct CSongTime {
    std::int32_t mNumerator = 0;    ///< beats in a bar
    std::int32_t mDenominator = 0;  ///< 4 where a quarter is the beat

    /// Whether one of the numbers is not above 0.
    [[nodiscard]] bool IsUndef() const { return mNumerator <= 0 || mDenominator <= 0; }
    friend bool operator==(const CSongTime&, const CSongTime&) = default;
};

/// A sign that jumps lead to.
enum TSongSign : std::uint8_t {
    TSongSign_None,   ///< no sign
    TSongSign_Segno,  ///< where D.S. goes on
    TSongSign_Coda,   ///< where what is behind "To Coda" goes on
};

/// A bar as it is played. A bar that is played twice stands twice.
struct CSongBar {
    /// Of a bar whose source does not tell which written one it is.
    static constexpr std::size_t kNotWritten = static_cast<std::size_t>(-1);

    /// As printed, "12" or "12a"; of a typed song, the number of the written bar.
    std::string mNumber;
    double mPosition = 0.0;  ///< of its bar line, in beats
    /// An upbeat is as long as it is written.
    double mLength = 0.0;
    CSongTime mTime;  ///< that holds in it
    /// The bar of the written song that this is, from 0; `kNotWritten` if the source does not tell.
    std::size_t mWritten = kNotWritten;
    /// What stands where the bar begins.
    TSongSign mSign = TSongSign_None;
    /// What stands at its end: "To Coda", "Fine", "D.C. al Fine".
    std::string mWords = {};
    /// The bracket of an ending stops at its end.
    bool mEndsEnding = false;

    friend bool operator==(const CSongBar&, const CSongBar&) = default;
};

/// A part of a song that begins here: a rehearsal mark, a verse, a chorus. It may have no name.
struct CSongSection {
    std::string mName;       ///< "A", "Chorus"
    double mPosition = 0.0;  ///< in beats

    friend bool operator==(const CSongSection&, const CSongSection&) = default;
};

/// A written passage that is played again, as a repeat or a jump tells.
struct CSongRepeat {
    /// Where the second playing begins.
    double mPosition = 0.0;
    /// Where the first playing began.
    double mSourcePosition = 0.0;
    /// From both places on so many bars are the same.
    std::size_t mBarCount = 0;

    friend bool operator==(const CSongRepeat&, const CSongRepeat&) = default;
};

/// What a song tells beside its chords, such as `{"album", "Kind of Blue"}`.
struct CSongRemark {
    std::string mName;  ///< as the source calls it, "album"
    std::string mText;  ///< what it says there

    friend bool operator==(const CSongRemark&, const CSongRemark&) = default;
};

/// What is wrong with a song or was left out of it, and where. Of a note the chords are all there.
using CSongFault = CTextFault;

/// A song from any source, played through its repeats, endings and jumps. A value.
///
/// All positions and lengths are beats from the beginning of the song: quarter notes in a score,
/// what the song itself counts in a text. Texts are UTF-8 and as the source has them; empty is what
/// it does not tell.
struct CSong {
    std::string mTitle;  ///< of the song itself, not of its file
    /// Who made it: composers, artists, writers of the words, separated by ", ".
    std::string mMakers;
    std::string mStyle;  ///< as the source calls it, "Medium Swing"
    /// As played, with the end marker; empty for a song without chords. Where no chord sounds
    /// stands "No Chord Yield" or an undefined chord.
    CHarmAnlsChords mChords;
    /// Of each chord, as written; the end marker has none. A score has no written symbols: these
    /// are the ones that read back as its chords.
    std::vector<std::string> mSymbols;
    /// How the seventh of each chord is spelled, where the source tells it; may have fewer entries.
    std::vector<TSeventhSpelling> mSevenths;
    /// Empty for a text without bar lines.
    std::vector<CSongBar> mBars;
    std::vector<CSongSection> mSections;  ///< as played, by position
    /// The first key of the song, if it tells root and type.
    std::optional<CSignKeyLite> mStatedKey;
    /// All stated keys where they begin to hold; their types may be undefined.
    CHarmAnlsSignKeys mStatedKeys;
    /// Quarter notes a minute.
    std::optional<double> mTempo;
    /// Length of a bar by the first time signature, else that of the preferences or of most bars.
    double mBeatsPerBar = 4.0;
    /// The fret of a capodaster, 0 for none. It is only told: the chords are those that are
    /// written.
    int mCapo = 0;
    int mTranspose = 0;  ///< semitones that the song asks for, negative down; only told, too
    std::vector<CSongRepeat> mRepeats;  ///< by the places where they are played
    std::vector<CSongRemark> mRemarks;  ///< in the order of the source
    /// What it was read as; never TSongFormat_Auto.
    TSongFormat mFormat = TSongFormat_ChordText;
    /// By their places; empty if all is understood.
    std::vector<CSongFault> mFaults;

    /// Whether there is a fault that is no note.
    [[nodiscard]] bool HasFault() const;
};

}  // namespace brindle
