// SPDX-License-Identifier: MIT
// A symbol is a root, a third, a number that stands for a seventh and what is stacked on it,
// alterations, added tones, and what stands last: a suspension or what is left out. Alterations
// stand alone behind a number (E7b9) and in brackets without one (E(b9)), where they could be taken
// for the accidental of the root.

#include "brindle/chords/WriteChordSymbol.h"

#include "brindle/chords/internal/SignsOfRoot.h"
#include "brindle/chords/internal/ToneMasks.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <string_view>
#include <vector>

namespace brindle {
namespace {

struct CSuffixRow {
    TToneMask mTones;
    std::string_view mText;
};

// Chords that have a sign of their own.
constexpr auto kWholeChordRows = std::to_array<CSuffixRow>({
    {TonesOfKind("dim"), "dim"},
    {TonesOfKind("dim7"), "dim7"},
    {TonesOfKind("dim(maj7)"), "dim(maj7)"},
    {TonesOfKind("aug"), "aug"},
    {TonesOfKind("5"), "5"},
    {TonesOfKind("sus24"), "sus24"},
    {TonesOfKind("13b9"), "13b9"},
    {TonesOfKind("13#9"), "13#9"},
    {TonesOfKind("13b9#11"), "13b9#11"},
});

// The first that is contained. With a third, 13 has the eleventh below it.
constexpr auto kNumberRows = std::to_array<CNumberOfTones>({
    {Tones(2, 9, 10), "13", true},
    {Tones(2, 5, 9, 10), "13"},
    {Tones(2, 5, 10), "11"},
    {Tones(2, 10), "9"},
    {Tones(10), "7"},
    {Tones(2, 9, 11), "maj13", true},
    {Tones(2, 5, 9, 11), "maj13"},
    {Tones(2, 5, 11), "maj11"},
    {Tones(2, 11), "maj9"},
    {Tones(11), "maj7"},
    {Tones(2, 9), "69"},
    {Tones(9), "6"},
});

class CSuffixWriter {
public:
    explicit CSuffixWriter(TToneMask tones) : mTones(tones), mRest(tones & ~Tones(0)) {}

    std::string Write() && {
        TakeThird();
        TakeNumber();
        TakeFifth();
        TakeAlterations();
        TakeAddedTones();
        if (!HasAll(mTones, Tones(0))) mTail += "no1";
        return mThird + mNumber + Alterations() + mAdded + mTail;
    }

private:
    bool Take(int tone) { return TakeTone(mRest, tone); }

    void TakeThird() {
        if (Take(4)) return;
        if (Take(3)) {
            mThird = "m";
        } else if (Take(5)) {
            mIsSus4 = true;
            mTail = "sus4";
        } else if (Take(2)) {
            mTail = "sus2";
        } else {
            mTail = "no3";
        }
    }

    void TakeNumber() {
        const auto* const row =
            std::find_if(kNumberRows.begin(), kNumberRows.end(),
                         [&](const CNumberOfTones& number) { return IsNumber(number); });
        if (row == kNumberRows.end()) return;
        mRest &= ~row->mTones;
        const bool isMajor = row->mText.front() == 'm';
        mNumber = isMajor && !mThird.empty() ? "(" + std::string(row->mText) + ")" : row->mText;
        if (HasAll(row->mTones, Tones(10)) && Take(11)) mNumber += "(maj7)";
    }

    /// A number that brings several tones brings none that is altered as well, and only one
    /// seventh.
    [[nodiscard]] bool IsNumber(const CNumberOfTones& row) const {
        if (!HasAll(mRest, row.mTones) || (row.mIsForSus4Alone && !mIsSus4)) return false;
        if (row.IsSingleTone()) return true;
        const bool hasFifth = HasAll(mTones, Tones(7));
        if (HasAny(mRest, Tones(1, 3)) || HasAll(mRest, Tones(10, 11))) return false;
        if (HasAll(row.mTones, Tones(5)) && HasAll(mRest, Tones(6)) && hasFifth) return false;
        return !(HasAll(row.mTones, Tones(9)) && HasAll(mRest, Tones(8)) && hasFifth);
    }

    void TakeFifth() {
        if (Take(7)) return;
        if (!HasAny(mRest, Tones(6, 8))) mTail += "no5";
        if (Take(6)) mAlterations.push_back("b5");
        if (Take(8)) mAlterations.push_back("#5");
    }

    void TakeAlterations() {
        if (Take(1)) mAlterations.push_back("b9");
        if (Take(3)) mAlterations.push_back("#9");
        if (Take(6)) mAlterations.push_back("#11");
        if (Take(8)) mAlterations.push_back("b13");
    }

    void TakeAddedTones() {
        if (Take(2)) mAdded += "add9";
        if (Take(5)) mAdded += "add11";
        if (Take(9)) mAdded += "add13";
    }

    [[nodiscard]] std::string Alterations() const {
        const bool isBehindNumber = !mNumber.empty() && Ascii::IsDigit(mNumber.back());
        std::string text;
        for (const std::string_view alteration : mAlterations) {
            if (!text.empty() && !isBehindNumber) text += ',';
            text += alteration;
        }
        return text.empty() || isBehindNumber ? text : "(" + text + ")";
    }

    TToneMask mTones;
    TToneMask mRest;
    bool mIsSus4 = false;
    std::string mThird;
    std::string mNumber;
    std::vector<std::string_view> mAlterations;
    std::string mAdded;
    std::string mTail;
};

// A triple accidental has no text; the key has another name with one sign or none.
CKeyEnh WithTwoSignsAtMost(CKeyEnh note) {
    const int signs = EnhToSemitone(note.mEnh);
    if (note.mEnh != TEnh_Undef && signs >= -2 && signs <= 2) return note;
    const bool isBlack = HasAny(TToneMask{1} << FoldIntoOctave(note.mKeyNr), Tones(1, 3, 6, 8, 10));
    note.mEnh = !isBlack ? TEnh_n : signs < 0 ? TEnh_b : TEnh_s;
    return note;
}

std::string_view Letter(int natural, const CChordSymbolStyle& style) {
    constexpr std::array<std::string_view, 12> kLetters{"C", "",  "D", "",  "E", "F",
                                                        "",  "G", "",  "A", "",  "B"};
    constexpr std::array<std::string_view, 12> kSyllables{"Do", "",    "Re", "",   "Mi", "Fa",
                                                          "",   "Sol", "",   "La", "",   "Si"};
    const auto key = static_cast<std::size_t>(natural);
    if (style.mNotes == TNoteNaming_German && natural == 11) return "H";
    return style.mNotes == TNoteNaming_Solfege ? kSyllables[key] : kLetters[key];
}

// A flat in a suffix is a b before a number, and nothing else there has a b.
std::string WithUnicodeSigns(std::string_view text) {
    std::string signs;
    for (const char c : text) {
        if (c == 'b') {
            signs += kUtf8Flat;
        } else if (c == '#') {
            signs += kUtf8Sharp;
        } else {
            signs += c;
        }
    }
    return signs;
}

}  // namespace

bool TakesSignOf(const CKeyEnh& root, std::string_view suffix) {
    const bool hasTwoSigns = std::abs(EnhToSemitone(WithTwoSignsAtMost(root).mEnh)) == 2;
    return hasTwoSigns && !suffix.empty() && Ascii::IsDigit(suffix.front());
}

std::string ChordSymbolSuffix(CSemitones semitones) {
    const auto tones = static_cast<TToneMask>(semitones.Mask());
    const auto* const whole =
        std::find_if(kWholeChordRows.begin(), kWholeChordRows.end(),
                     [&](const CSuffixRow& row) { return row.mTones == tones; });
    if (whole != kWholeChordRows.end()) return std::string(whole->mText);
    return CSuffixWriter(tones).Write();
}

std::string WriteNoteName(const CKeyEnh& note, const CChordSymbolStyle& style) {
    if (note.IsUndef()) return {};
    const CKeyEnh written = WithTwoSignsAtMost(note);
    const int signs = EnhToSemitone(written.mEnh);
    const int natural = FoldIntoOctave(written.mKeyNr - signs);
    if (style.mNotes == TNoteNaming_German && natural == 11 && signs == -1) return "B";
    std::string name(Letter(natural, style));
    const std::string_view flat = style.mUnicodeSigns ? kUtf8Flat : "b";
    const std::string_view sharp = style.mUnicodeSigns ? kUtf8Sharp : "#";
    for (int sign = 0; sign < std::abs(signs); ++sign) name += signs < 0 ? flat : sharp;
    return name;
}

std::string WriteChordSymbol(const CChordLite& chord, const CChordSymbolStyle& style) {
    if (chord.mRootKeyEnh.IsUndef()) return "N.C.";
    std::string suffix = ChordSymbolSuffix(chord.mSemitones);
    if (style.mUnicodeSigns) suffix = WithUnicodeSigns(suffix);
    std::string symbol = WriteNoteName(chord.mRootKeyEnh, style);
    if (TakesSignOf(chord.mRootKeyEnh, suffix)) symbol += ' ';
    symbol += suffix;
    const bool hasBass =
        chord.HasBassNote() && chord.mBassKeyEnh.mKeyNr != chord.mRootKeyEnh.mKeyNr;
    if (hasBass) symbol += "/" + WriteNoteName(chord.mBassKeyEnh, style);
    return symbol;
}

CChordTextOptions ReadingPrefsOf(const CChordSymbolStyle& style) {
    return {.mBIsBFlat = style.mNotes == TNoteNaming_German,
            .mSolfege = style.mNotes == TNoteNaming_Solfege};
}

}  // namespace brindle
