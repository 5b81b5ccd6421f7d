// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"
#include "brindle/chords/internal/DegreesOfChordText.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

enum class TQuality { Minor, Diminished, HalfDiminished, Augmented, Dominant };

struct CQualityRow {
    std::string_view mText;
    TQuality mQuality;
    /// A small letter only.
    bool mIsExact = false;
};

// The words for major are those of DegreesOfChordText.h; they are tried before these, since `maj`
// begins with the `m` of minor. Longer ones first.
constexpr auto kQualityRows = std::to_array<CQualityRow>({
    {"minor", TQuality::Minor},
    {"min", TQuality::Minor},
    {"mi", TQuality::Minor},
    {"moll", TQuality::Minor},
    {"-moll", TQuality::Minor},
    {"m", TQuality::Minor, true},
    {"-", TQuality::Minor},
    {"o", TQuality::Diminished, true},
    {"diminished", TQuality::Diminished},
    {"dimin", TQuality::Diminished},
    {"dim", TQuality::Diminished},
    {"%", TQuality::HalfDiminished},
    {"half-diminished", TQuality::HalfDiminished},
    {"half diminished", TQuality::HalfDiminished},
    {"halfdiminished", TQuality::HalfDiminished},
    {"half-dim", TQuality::HalfDiminished},
    {"half dim", TQuality::HalfDiminished},
    {"halfdim", TQuality::HalfDiminished},
    {"hdim", TQuality::HalfDiminished},
    {"h", TQuality::HalfDiminished, true},
    {"+", TQuality::Augmented},
    {"augmented", TQuality::Augmented},
    {"aug", TQuality::Augmented},
    {"dominant", TQuality::Dominant},
    {"dom", TQuality::Dominant},
});

bool Fits(const CQualityRow& row, CTextScan scan) {
    if (row.mIsExact ? !scan.Sees(row.mText) : !scan.SeesWord(row.mText)) return false;
    scan.mPos += row.mText.size();
    // `C-5` has a flat five, `Comit3` leaves the third out, `ConX` has a bass that is none.
    if (row.mText == "-") return scan.Peek() != '5';
    if (row.mText == "o") {
        return !scan.Sees("mit") && !(scan.Peek() == 'n' && IsCapitalNote(scan.Peek(1)));
    }
    return true;
}

struct CTuneBookRow {
    std::string_view mText;
    TQuality mQuality;
};

// All that stands behind a capital root in tune books.
constexpr auto kTuneBookRows = std::to_array<CTuneBookRow>({
    {"d", TQuality::Diminished},
    {"a", TQuality::Augmented},
    {"d7", TQuality::Diminished},
    {"a7", TQuality::Augmented},
});

void Make(TQuality quality, CChordTextTones& tones) {
    switch (quality) {
        case TQuality::Minor:
            return tones.MakeMinor();
        case TQuality::Diminished:
            return tones.MakeDiminished();
        case TQuality::HalfDiminished:
            return tones.MakeHalfDiminished();
        case TQuality::Augmented:
            return tones.MakeAugmented();
        case TQuality::Dominant:
            return;
    }
}

}  // namespace

void CChordTextParser::ReadQuality() {
    if (ReadTuneBookQuality()) return;
    const CTextScan atRoot = mScan;
    std::size_t depth = 0;
    while (mScan.Peek() == ' ' || mScan.Peek() == '(' || mScan.Peek() == ',') {
        depth += mScan.Peek() == '(';
        ++mScan.mPos;
    }
    if (const auto major = TakeMajorMark(mScan)) {
        ReadMajorMark(*major == TMajorMark::Seventh);
    } else {
        const auto* const row =
            std::find_if(kQualityRows.begin(), kQualityRows.end(),
                         [&](const CQualityRow& quality) { return Fits(quality, mScan); });
        if (row == kQualityRows.end()) {
            mScan = atRoot;
            if (mRootIsSmall && mPrefs.mLowerCaseIsMinor) mTones.MakeMinor();
            return;
        }
        mScan.mPos += row->mText.size();
        mScan.Take('.');
        Make(row->mQuality, mTones);
        if (row->mQuality == TQuality::Augmented) mScan.Take('5');
    }
    mDepth = depth;
    ++mPartCount;
}

bool CChordTextParser::ReadTuneBookQuality() {
    if (mRootIsSmall) return false;
    for (const CTuneBookRow& row : kTuneBookRows) {
        if (mScan.Rest() != row.mText) continue;
        Make(row.mQuality, mTones);
        ++mScan.mPos;
        ++mPartCount;
        return true;
    }
    return false;
}

}  // namespace brindle::ChordText
