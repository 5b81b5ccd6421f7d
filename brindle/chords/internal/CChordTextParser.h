// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/internal/CChordTextTones.h"
#include "brindle/chords/internal/CTextScan.h"
#include "brindle/chords/internal/CUnifiedText.h"
#include "brindle/chords/internal/FaultsOfChordText.h"
#include "brindle/chords/internal/NoteOfChordText.h"

#include <cstddef>
#include <optional>

namespace brindle::ChordText {

/// Reads one chord from a folded text: root, colon form or bass, quality, options. The grammar is
/// told in docs/chord-symbols.md. A step that fails sets the fault and gives false.
class CChordTextParser {
public:
    CChordTextParser(const CUnifiedText& text, const CChordTextOptions& prefs)
        : mPrefs(prefs), mScan(text.Text(), text.Lower()) {}

    /// False: Fault tells why.
    [[nodiscard]] bool Read();
    [[nodiscard]] const CFaultAt& Fault() const { return mFault; }
    [[nodiscard]] CChordLite Chord() const;
    [[nodiscard]] bool HasH() const { return mRoot.mIsH || (mBass && mBass->mIsH); }
    [[nodiscard]] bool HasAugmentedSixth() const { return mTones.HasAugmentedSixth(); }

private:
    bool Fail(TFault fault, std::size_t pos, std::size_t length = 0);
    /// At the place of the scan.
    bool Fail(TFault fault) { return Fail(fault, mScan.mPos); }

    bool ReadRoot();

    // `root ":" word ["(" degrees ")"] ["/" bass]`, as corpora of chords write it.
    /// False when the text is not of this form; nothing is read then. A bass that cannot be spelled
    /// sets the fault.
    bool ReadColonForm();
    bool ReadColonDegrees(CSemitones& tones);
    bool ReadColonBass();

    /// Finds the bass and cuts it off.
    void CutBass();
    void CutBassBehind(std::size_t separator, std::size_t name);
    [[nodiscard]] std::optional<CWrittenNote> WholeNote(std::size_t pos) const;

    void ReadQuality();
    [[nodiscard]] bool ReadTuneBookQuality();

    bool ReadOptions();
    bool ReadOption();
    /// A word and what reads it.
    struct COptionRow;
    [[nodiscard]] static const COptionRow* FindOptionRow(const CTextScan& scan);
    bool ReadDegreeOption();
    bool ReadDrone(std::size_t wordLength);
    bool ReadAltered(std::size_t wordLength);
    bool ReadAugmented(std::size_t wordLength);
    bool ReadPunctuation(char c);
    bool ReadOmission(std::size_t wordLength);
    bool ReadRaisedFourth();
    bool ReadSuspension();
    bool ReadAddition(std::size_t wordLength);
    bool ReadSignedDegree(int sign, std::size_t signLength);
    bool ReadNumber(int number);
    bool ReadOtherOption();
    bool ReadLoneDim();
    void ReadMajorMark(bool isSeventhSign);
    /// A number with a sign behind it, `9-`; nothing if it does not alter the number.
    [[nodiscard]] int SignBehindNumber(int number) const;
    bool FailNumberOr(TFault fault, std::size_t pos, std::size_t length);
    bool FailAtOption();
    bool FailBehindSlash();

    CChordTextOptions mPrefs;
    CTextScan mScan;
    CFaultAt mFault;

    CWrittenNote mRoot;
    std::optional<CWrittenNote> mBass;
    CChordTextTones mTones;
    /// Set by the colon form, which has no use for the other steps.
    std::optional<CSemitones> mSemitones;
    bool mRootIsSmall = false;
    /// Open brackets.
    std::size_t mDepth = 0;
    /// Qualities and options read so far.
    std::size_t mPartCount = 0;
    /// Behind a comma or a slash each number stands by itself.
    bool mNumbersAreSingle = false;
};

}  // namespace brindle::ChordText
