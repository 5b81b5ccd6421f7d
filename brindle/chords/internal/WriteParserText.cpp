// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/WriteParserText.h"

#include "brindle/chords/internal/CTextScan.h"
#include "brindle/chords/internal/ToneMasks.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

constexpr bool CanBeSaid(TToneMask tones) {
    return HasAll(tones, Tones(0)) && HasAny(tones, Tones(6, 7, 8)) &&
           (HasAll(tones, Tones(10)) || !HasAll(tones, Tones(1)));
}

/// No text leaves the root or the fifth out, and a flat nine always brings a minor seventh.
constexpr TToneMask NearestThatCanBeSaid(TToneMask tones) {
    tones |= Tones(0);
    if (!HasAny(tones, Tones(6, 7, 8))) tones |= Tones(7);
    if (HasAll(tones, Tones(1)) && !HasAll(tones, Tones(10))) {
        if (HasAll(tones, Tones(11))) {
            tones &= ~Tones(1);
        } else {
            tones |= Tones(10);
        }
    }
    return tones;
}

struct CWholeChordRow {
    TToneMask mTones;
    std::string_view mText;
};

constexpr auto kWholeChordRows = std::to_array<CWholeChordRow>({
    {TonesOfKind("dim"), "dim"},
    {TonesOfKind("dim7"), "dim7"},
    {TonesOfKind("aug"), "aug"},
    {TonesOfKind("5"), "5"},
});

// The first that is contained.
constexpr auto kFirstNumberRows = std::to_array<CNumberOfTones>({
    {Tones(2, 9, 10), "13", true},
    {Tones(2, 5, 9, 10), "13"},
    {Tones(2, 5, 10), "11"},
    {Tones(2, 10), "9"},
    {Tones(10), "7"},
    {Tones(2, 11), "maj9"},
    {Tones(11), "maj7"},
    {Tones(9), "6"},
});

struct COptionRow {
    int mTone;
    std::string_view mBehindNumber;
    std::string_view mWithoutNumber;
};

// In the order in which they are written. Tone 6 as #11 or b5, and 8 as b13 or #5, are told apart
// by the fifth.
constexpr int kFlatFive = 12;
constexpr int kSharpFive = 13;
constexpr auto kOptionRows = std::to_array<COptionRow>({
    {10, "7", "7"},
    {11, "maj7", "maj7"},
    {1, "b9", "b9"},
    {2, "9", "add9"},
    {3, "#9", "#9"},
    {5, "11", "add11"},
    {6, "#11", "add#11"},
    {kFlatFive, "b5", "b5"},
    {kSharpFive, "#5", "#5"},
    {8, "b13", "b13"},
    {9, "13", "6"},
});

bool CanBeFlat(std::string_view number) {
    return number == "5" || number == "6" || number == "9" || number == "13";
}

class CParserTextWriter {
public:
    CParserTextWriter(std::string root, TToneMask tones)
        : mText(std::move(root)), mRootLength(mText.size()), mTones(tones) {}

    std::string Write() && {
        const auto* const whole =
            std::find_if(kWholeChordRows.begin(), kWholeChordRows.end(),
                         [&](const CWholeChordRow& row) { return row.mTones == mTones; });
        if (whole != kWholeChordRows.end()) {
            Append(whole->mText);
            return std::move(mText);
        }
        mRest = mTones & ~Tones(0);
        WriteThird();
        WriteFirstNumber();
        TakeFifth();
        WriteOptions();
        mText += mTail;
        return std::move(mText);
    }

private:
    bool Drop(int tone) { return TakeTone(mRest, tone); }

    void WriteThird() {
        if (Drop(4)) return;
        if (Drop(3)) {
            mText += 'm';
        } else if (Drop(5)) {
            mTail = "sus4";
        } else if (Drop(2)) {
            mTail = "sus2";
        } else {
            mTail = "no3";
        }
    }

    void WriteFirstNumber() {
        const auto* const row =
            std::find_if(kFirstNumberRows.begin(), kFirstNumberRows.end(),
                         [&](const CNumberOfTones& number) { return IsFirstNumber(number); });
        if (row == kFirstNumberRows.end()) return;
        Append(row->mText);
        mRest &= ~row->mTones;
        mHasNumber = true;
    }

    /// A number that brings several tones brings none that is altered as well.
    [[nodiscard]] bool IsFirstNumber(const CNumberOfTones& row) const {
        if (!HasAll(mRest, row.mTones)) return false;
        if (row.mIsForSus4Alone && mTail != "sus4") return false;
        if (row.IsSingleTone()) return true;
        const bool hasFifth = HasAll(mTones, Tones(7));
        if (HasAll(row.mTones, Tones(2)) && HasAny(mRest, Tones(1, 3))) return false;
        if (HasAll(row.mTones, Tones(10)) && HasAll(mRest, Tones(11))) return false;
        if (HasAll(row.mTones, Tones(5)) && HasAll(mRest, Tones(6)) && hasFifth) return false;
        return !(HasAll(row.mTones, Tones(9)) && HasAll(mRest, Tones(8)) && hasFifth);
    }

    void TakeFifth() {
        if (Drop(7)) return;
        if (Drop(6)) mRest |= Tones(kFlatFive);
        if (Drop(8)) mRest |= Tones(kSharpFive);
    }

    void WriteOptions() {
        for (const COptionRow& row : kOptionRows) {
            if (!Drop(row.mTone)) continue;
            Append(mHasNumber ? row.mBehindNumber : row.mWithoutNumber);
        }
    }

    /// A blank keeps numbers apart, and the root from what could be read as its accidental or, as
    /// in `Ebb 5`, could take one of it away.
    void Append(std::string_view part) {
        const bool isAtRoot = mText.size() == mRootLength;
        const bool beginsWithSign = part.front() == 'b' || part.front() == '#';
        const bool takesFlat = mText.ends_with("bb") && CanBeFlat(part);
        const bool digitsMeet = IsDigit(mText.back()) && IsDigit(part.front());
        if (digitsMeet || (isAtRoot && (beginsWithSign || takesFlat))) mText += ' ';
        mText += part;
    }

    std::string mText;
    std::size_t mRootLength;
    TToneMask mTones;
    TToneMask mRest = 0;
    std::string_view mTail;
    bool mHasNumber = false;
};

std::string NoteText(CKeyEnh key, const CChordNamePrefs& prefs) {
    constexpr std::string_view kLetters = "C D EF G A B";
    constexpr std::array<std::string_view, 5> kSigns{"bb", "b", "", "#", "x"};
    const int accidental = std::clamp(EnhToSemitone(key.mEnh), -2, 2);
    const int natural = FoldIntoOctave(key.mKeyNr - accidental);
    std::string text(1, kLetters[static_cast<std::size_t>(natural)]);
    if (prefs.mBForBFlat && text == "B") {
        if (accidental == -1) return text;
        text = "H";
    }
    return text += kSigns[static_cast<std::size_t>(accidental + 2)];
}

}  // namespace

bool IsExpressible(CSemitones semitones) {
    return CanBeSaid(static_cast<TToneMask>(semitones.Mask()));
}

CParserText WriteParserText(const CChordLite& chord, const CChordNamePrefs& prefs) {
    const auto tones = static_cast<TToneMask>(chord.mSemitones.Mask());
    CParserText written;
    written.mIsExact = CanBeSaid(tones);
    CParserTextWriter writer(NoteText(chord.mRootKeyEnh, prefs), NearestThatCanBeSaid(tones));
    written.mText = std::move(writer).Write();
    if (chord.HasBassNote() && !prefs.mSlashText.empty()) {
        written.mText += prefs.mSlashText.front();
        written.mText += NoteText(chord.mBassKeyEnh, prefs);
    }
    return written;
}

}  // namespace brindle::ChordText
