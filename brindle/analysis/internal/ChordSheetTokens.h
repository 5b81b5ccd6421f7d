// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadChordSheet.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

/// The steps of reading the text of a song: forms cut it into tokens, and the tokens are played.
namespace brindle::ChordSheet {

enum class TTokenKind : std::uint8_t {
    Chord,
    Hold,
    RepeatBars,
    Bar,
    Ending,
    Section,
    Beats,
};

struct TToken {
    TTokenKind mKind = TTokenKind::Bar;
    /// A chord as it is written, the name of a section. Part of the song's text.
    std::string_view mText;
    /// Of a chord.
    CChordLite mChord;
    /// Holds: steps. RepeatBars: bars.
    int mCount = 1;
    /// Of a bar line.
    bool mEndsRepeat = false;
    bool mStartsRepeat = false;
    /// Bit n is the n-th ending.
    std::uint64_t mEndings = 0;
    /// From here on, the length of a bar.
    double mBeats = 0.0;
};

/// A fault at a byte of the text.
struct TSheetFault {
    std::size_t mOffset = 0;
    std::string mText;
};

/// A song cut into tokens.
class CTokenList {
public:
    CTokenList(std::string_view text, const CChordSheetPrefs& prefs) : mText(text), mPrefs(prefs) {}

    std::vector<TToken> mTokens;
    std::string_view mTitle;
    std::string_view mKey;
    bool mIsEven = false;
    bool mHasH = false;

    [[nodiscard]] std::string_view Text() const { return mText; }
    [[nodiscard]] const CChordSheetPrefs& Prefs() const { return mPrefs; }

    TToken& Add(TTokenKind kind, std::string_view text = {});
    void AddBar(bool endsRepeat, bool startsRepeat);
    /// A chord, no-chord, hold or repeat that stands by itself; a fault becomes a no-chord.
    void AddChordText(std::string_view text);
    /// The same with what was read from it.
    void AddReading(std::string_view text, const CChordTextReading& reading);

    /// `where` is part of the text.
    void AddFault(std::string_view where, std::string text);
    /// What is not understood in a chord that begins with `chord`.
    void AddFault(std::string_view chord, const CChordTextReading& reading);
    [[nodiscard]] const std::vector<TSheetFault>& Faults() const { return mFaults; }
    /// After the first fault, unless the reading is lenient.
    [[nodiscard]] bool IsGivenUp() const { return !mFaults.empty() && !mPrefs.mLenient; }

    /// Reads all chords again with B as B flat.
    void MakeGerman();

private:
    std::string_view mText;
    const CChordSheetPrefs& mPrefs;
    std::vector<TSheetFault> mFaults;
};

/// Cuts one line of plain text, which must be part of the text of `list`.
void CutPlainLine(std::string_view line, CTokenList& list);
/// Cut the whole text of `list`.
void CutPlain(CTokenList& list);
void CutChordPro(CTokenList& list);
void CutIReal(CTokenList& list);

/// Plain, ChordPro or IReal.
[[nodiscard]] TChordSheetForm LikeliestForm(std::string_view text);

/// Puts the tokens in time: chords, symbols and sections of `reading`.
void Play(CTokenList& list, CChordSheetReading& reading);

}  // namespace brindle::ChordSheet
