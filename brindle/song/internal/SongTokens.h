// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/ReadSong.h"
#include "brindle/song/internal/LineKinds.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

/// The steps of reading the text of a song: a form cuts it into tokens, and these are played.
namespace brindle::SongText {

enum class TTokenKind : std::uint8_t {
    Chord,
    Hold,
    RepeatBars,
    Bar,
    Ending,
    Section,
    Time,
    Key,
    /// "D.C. al Fine", "3x".
    PlayWords,
    /// The sign of a coda, which stands where it is left and where it begins.
    CodaSign,
};

struct CToken {
    TTokenKind mKind = TTokenKind::Bar;
    /// A chord as it is written, the name of a section. Part of the song's text.
    std::string_view mText;
    /// Of a chord.
    CChordLite mChord;
    TSeventhSpelling mSeventh = TSeventhSpelling_Undef;
    /// Holds: steps. RepeatBars: bars.
    int mCount = 1;
    /// Of a chord whose text tells it, in beats; 0 for a step of the song.
    double mLength = 0.0;
    /// Of a bar line.
    bool mEndsRepeat = false;
    bool mStartsRepeat = false;
    /// Bit n is the n-th ending.
    std::uint64_t mEndings = 0;
    /// Holds from here on. A bar has so many beats as the numerator tells.
    CSongTime mTime;
};

/// A fault at a byte of the text.
struct CTokenFault {
    std::size_t mOffset = 0;
    std::string mText;
    bool mIsNote = false;
};

/// A song cut into tokens.
class CTokenList {
public:
    /// `song` takes what the text tells beside its chords.
    CTokenList(std::string_view text, const CSongOptions& prefs, CSong& song)
        : mText(text), mPrefs(prefs), mSong(song) {}

    std::vector<CToken> mTokens;
    bool mIsEven = false;
    bool mHasH = false;
    /// How many tokens there were behind the last line of chords, if it had bar lines; else 0.
    std::size_t mEndOfBars = 0;
    /// Words that steer the playing stand in front of the chords of their bar.
    bool mWordsStandInFront = false;

    [[nodiscard]] std::string_view Text() const { return mText; }
    [[nodiscard]] const CSongOptions& Prefs() const { return mPrefs; }
    [[nodiscard]] CSong& Song() const { return mSong; }
    [[nodiscard]] bool HasBarLines() const;

    CToken& Add(TTokenKind kind, std::string_view text = {});
    void AddBar(bool endsRepeat, bool startsRepeat);
    /// A chord, no-chord, hold or repeat that stands by itself; a fault becomes a no-chord.
    void AddChordText(std::string_view text);
    /// The same with what was read from it.
    void AddReading(std::string_view text, const CChordTextReading& reading);
    /// The tokens from `begin` up to `end` once more. False when there would be too many.
    [[nodiscard]] bool AddAgain(std::size_t begin, std::size_t end);

    /// `where` is part of the text.
    void AddFault(std::string_view where, std::string text);
    /// What is not understood in a chord that begins with `chord`.
    void AddFault(std::string_view chord, const CChordTextReading& reading);
    /// Something was left out that is no chord.
    void AddNote(std::string_view where, std::string text);
    [[nodiscard]] const std::vector<CTokenFault>& Faults() const { return mFaults; }
    /// After the first fault, unless the reading is lenient.
    [[nodiscard]] bool IsGivenUp() const { return mHasFault && !mPrefs.mLenient; }

    /// Reads all chords again with B as B flat.
    void MakeGerman();

private:
    void AddFaultOrNote(std::string_view where, std::string text, bool isNote);

    std::string_view mText;
    const CSongOptions& mPrefs;
    CSong& mSong;
    std::vector<CTokenFault> mFaults;
    bool mHasFault = false;
    std::size_t mAddedAgain = 0;
};

/// What a fault shows of a text that may be long.
[[nodiscard]] std::string_view ShownOf(std::string_view text);

/// "3/4" and "3"; undefined for what is none.
[[nodiscard]] CSongTime ReadTime(std::string_view text);

/// Cuts one line of plain text, which must be part of the text of `list`.
void CutChordLine(std::string_view line, CTokenList& list);
/// The same for a line of a sheet, where a bar ends with its line: behind a line with bar lines
/// only a line that begins with a hold goes on in the same bar. `x3` at its end plays it again.
void CutSheetLine(std::string_view line, CTokenList& list);
/// The same for the lines with chords and the names of parts of a sheet with chords above lyrics.
void CutLineOfSheet(const CTextLine& line, CTokenList& list);
/// Cut the whole text of `list`.
void CutChordText(CTokenList& list);
void CutChordsAboveLyrics(CTokenList& list);
void CutChordPro(CTokenList& list);
void CutChart(CTokenList& list);
void CutChordStrings(CTokenList& list);

/// Puts the tokens in time: chords, symbols, bars, sections, keys and repeats of the song.
void PlaySheet(CTokenList& list);

}  // namespace brindle::SongText
