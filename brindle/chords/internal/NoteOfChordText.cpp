// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/NoteOfChordText.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>
#include <span>

namespace brindle::ChordText {
namespace {

enum TLetter { C, D, E, F, G, A, B };

struct CSyllableRow {
    std::string_view mSyllable;
    TLetter mLetter;
};

constexpr auto kSyllableRows = std::to_array<CSyllableRow>({
    {"do", C},
    {"ut", C},
    {"re", D},
    {"r\u00E9", D},
    {"r\u00C9", D},
    {"mi", E},
    {"fa", F},
    {"sol", G},
    {"la", A},
    {"ti", B},
    {"si", B},
});

// A to H; H is always B natural.
constexpr auto kLettersFromA = std::to_array<TLetter>({A, B, C, D, E, F, G, B});

using TTexts = std::span<const std::string_view>;

/// What may stand behind a letter. The first row that fits is taken.
struct CAccidentalRow {
    std::string_view mText;
    int mAccidental;
    /// The letters in lower case that can have it; all if empty. Endings belong to letters alone.
    std::string_view mLetters;
    /// The row does not fit before these.
    TTexts mNotBefore;
    /// Signs are small letters, a capital B is no flat; words come in any case.
    bool mIsSign = false;
};

constexpr std::string_view kAnyLetter = "abcdefgh";
// `Asus` and `Es4` are suspended chords.
constexpr auto kSuspended = std::to_array<std::string_view>({"us", "p", "2", "4", " 2", " 4", "s"});
constexpr auto kSharpDegrees = std::to_array<std::string_view>({"5", "9", "11"});
constexpr auto kFlatDegrees = std::to_array<std::string_view>({"5", "6", "9", "13"});

constexpr auto kAccidentalRows = std::to_array<CAccidentalRow>({
    // Words.
    {"flat", -1, "", {}},
    {" flat", -1, "", {}},
    {"-flat", -1, "", {}},
    {"sharp", +1, "", {}},
    {" sharp", +1, "", {}},
    {"-sharp", +1, "", {}},
    // German endings.
    {"isis", +2, kAnyLetter, {}},
    {"is", +1, kAnyLetter, {}},
    {"ses", -2, "ae", kSuspended},
    {"s", -1, "ae", kSuspended},
    {"eses", -2, kAnyLetter, {}},
    {"ases", -2, "a", {}},
    {"es", -1, kAnyLetter, {}},
    // Signs. `Bbb7` is B double flat, `Bbb9` is B flat with a flat nine.
    {"##", +2, "", kSharpDegrees, true},
    {"x", +2, "", {}, true},
    {"#", +1, "", {}, true},
    {"bb", -2, "", kFlatDegrees, true},
    {"b", -1, "", {}, true},
});

bool SeesAny(const CTextScan& scan, TTexts texts) {
    return std::any_of(texts.begin(), texts.end(),
                       [&](std::string_view text) { return scan.SeesWord(text); });
}

bool Fits(const CAccidentalRow& row, CTextScan scan, char letter) {
    if (!row.mLetters.empty() && row.mLetters.find(letter) == row.mLetters.npos) return false;
    if (row.mIsSign ? !scan.Sees(row.mText) : !scan.SeesWord(row.mText)) return false;
    scan.mPos += row.mText.size();
    return !SeesAny(scan, row.mNotBefore);
}

/// The accidental behind a letter in lower case, or behind a syllable (0).
std::optional<int> TakeAccidental(CTextScan& scan, char letter) {
    for (const CAccidentalRow& row : kAccidentalRows) {
        if (!Fits(row, scan, letter)) continue;
        scan.mPos += row.mText.size();
        return row.mAccidental;
    }
    return std::nullopt;
}

std::optional<TLetter> TakeSyllable(CTextScan& scan) {
    for (const CSyllableRow& row : kSyllableRows) {
        if (!scan.TakeWord(row.mSyllable)) continue;
        // `Fadd9` and `Faug` begin with the letter F.
        if (row.mLetter == F &&
            (scan.SeesWord("dd") || scan.SeesWord("ug") || scan.SeesWord("lt"))) {
            scan.mPos -= row.mSyllable.size();
            continue;
        }
        return row.mLetter;
    }
    return std::nullopt;
}

}  // namespace

CKeyEnh CWrittenNote::KeyEnh() const {
    const int natural = kNaturalKeyNrs[static_cast<std::size_t>(mLetter)];
    return {FoldIntoOctave(natural + mAccidental), SemitoneToEnh(mAccidental)};
}

std::optional<CWrittenNote> TakeNote(CTextScan& scan, const CChordTextOptions& prefs) {
    if (prefs.mSolfege) {
        if (const auto letter = TakeSyllable(scan)) {
            return CWrittenNote{*letter, TakeAccidental(scan, '\0').value_or(0), false};
        }
    }
    const char typed = scan.Peek();
    const char letter = Ascii::ToLower(typed);
    if (letter < 'a' || letter > 'h') return std::nullopt;
    ++scan.mPos;
    const auto accidental = TakeAccidental(scan, letter);
    const int withoutOne = prefs.mBIsBFlat && letter == 'b' ? -1 : 0;
    return CWrittenNote{kLettersFromA[static_cast<std::size_t>(letter - 'a')],
                        accidental.value_or(withoutOne), letter == 'h'};
}

bool SeesOneAccidentalTooMany(const CTextScan& scan, const CWrittenNote& note) {
    CTextScan behind = scan;
    if (behind.Take('x')) return true;
    if (behind.Take('#')) return !SeesAny(behind, kSharpDegrees);
    return note.mAccidental == -2 && behind.Take('b') && !SeesAny(behind, kFlatDegrees);
}

}  // namespace brindle::ChordText
