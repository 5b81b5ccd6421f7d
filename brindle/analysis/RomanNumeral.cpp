// SPDX-License-Identifier: MIT
#include "brindle/analysis/RomanNumeral.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <iterator>

namespace brindle {
namespace {

constexpr int kDominantDegree = 7;

bool IsSmall(TKeyChordClass chordClass) {
    switch (chordClass) {
        case TKeyChordClass_Min:
        case TKeyChordClass_Min7:
        case TKeyChordClass_HDim:
        case TKeyChordClass_Dim:
            return true;
        case TKeyChordClass_Triad:
        case TKeyChordClass_Maj7:
        case TKeyChordClass_Dom:
        case TKeyChordClass_Open:
            return false;
    }
    return false;
}

std::string_view OpenSign(CSemitones semitones) {
    const bool isSus4 = semitones.HasIntvl(5);
    if (!isSus4 && !semitones.HasIntvl(2)) return "5";
    if (semitones.HasIntvl(10)) return "7sus";
    return isSus4 ? "sus" : "sus2";
}

// One of kNumeralSigns, of the chord's class.
std::string_view SignOf(CSemitones semitones) {
    const auto has = [&](int intvl) { return semitones.HasIntvl(intvl); };
    switch (KeyChordClassOf(semitones)) {
        case TKeyChordClass_Triad:
            return "";
        case TKeyChordClass_Maj7:
            return has(11) ? "^7" : "6";
        case TKeyChordClass_Dom:
            if (has(8) && !has(7)) return has(10) ? "+7" : "+";
            return "7";
        case TKeyChordClass_Min:
            if (has(11)) return "^7";
            if (has(9)) return has(10) ? "13" : "6";
            return "";
        case TKeyChordClass_Min7:
            return "7";
        case TKeyChordClass_HDim:
            return "h7";
        case TKeyChordClass_Dim:
            return has(9) ? "o7" : "o";
        case TKeyChordClass_Open:
            return OpenSign(semitones);
    }
    return "";
}

std::string DegreeText(int dist, bool isSmall, const CSignKeyLite& key, bool inDigits) {
    const TNumeralDegree degree = DegreesOf(key.mSignKeyType)[static_cast<std::size_t>(dist)];
    std::string text;
    if (degree.mAccidental != 0) text = degree.mAccidental > 0 ? "#" : "b";
    if (inDigits) return text + static_cast<char>('0' + degree.mNumber);
    for (const char c : kRomanNumbers[static_cast<std::size_t>(degree.mNumber - 1)]) {
        text += isSmall ? static_cast<char>(c - 'A' + 'a') : c;
    }
    return text;
}

int DistToTonic(const CKeyEnh& keyEnh, const CSignKeyLite& key) {
    return FoldIntoOctave(std::int64_t{keyEnh.mKeyNr} - key.mRootKeyEnh.mKeyNr);
}

/// What a chord is to the chord that follows it: "V", "subV" or "vii" of that chord's degree.
struct TApplied {
    std::string_view mNumeral;
    std::string mTarget;
};

TApplied AppliedTo(const CChordLite& next, const CChordLite& chord, const CSignKeyLite& key) {
    if (next.IsUndef()) return {};
    const int target = DistToTonic(next.mRootKeyEnh, key);
    if (target == 0 || !key.Semitones().HasIntvl(target)) return {};
    const TKeyChordClass chordClass = KeyChordClassOf(chord.mSemitones);
    const int dist = DistToTonic(chord.mRootKeyEnh, key);
    const int up = FoldIntoOctave(target - dist);
    std::string_view numeral;
    if (chordClass == TKeyChordClass_Dom && dist != kDominantDegree) {
        if (up == 5) numeral = "V";
        if (up == 11) numeral = "subV";
    } else if (chordClass == TKeyChordClass_Dim && up == 1) {
        numeral = "vii";
    }
    if (numeral.empty()) return {};
    const bool isSmall = IsSmall(KeyChordClassOf(next.mSemitones));
    return {numeral, DegreeText(target, isSmall, key, false)};
}

const TNumeralSign& SignInTable(std::string_view sign) {
    return *std::find_if(kNumeralSigns.begin(), kNumeralSigns.end(),
                         [&](const TNumeralSign& row) { return row.mText == sign; });
}

// The place of a tone in a chord from below, -1 if it is not there.
int ToneOf(CSemitones chord, int intvl) {
    if (!chord.HasIntvl(intvl)) return -1;
    int tone = 0;
    for (int below = 0; below < intvl; ++below) tone += chord.HasIntvl(below) ? 1 : 0;
    return tone;
}

// The sign with the figure of the bass in it; empty where the figures do not tell the bass.
std::string SignWithFigure(std::string_view sign, bool isSmall, int bass) {
    constexpr auto triads = std::to_array<std::string_view>({"", "o", "+"});
    const bool isTriad = std::find(triads.begin(), triads.end(), sign) != triads.end();
    const bool hasSeventh = sign.ends_with('7');
    if (!isTriad && !hasSeventh) return {};
    const TNumeralSign& row = SignInTable(sign);
    const int tone = ToneOf(isSmall ? row.mMinor : row.mMajor, bass);
    for (const TInversionFigure& figure : kInversionFigures) {
        if (figure.mTone != tone || figure.mHasSeventh != hasSeventh) continue;
        if (hasSeventh) sign.remove_suffix(1);
        return std::string(sign) += figure.mFigure;
    }
    return {};
}

/// What stands behind the degree, and the bass behind the last slash.
struct TTail {
    std::string mSign;
    std::string mBass;
};

TTail TailOf(const CChordLite& chord, const CSignKeyLite& key, bool isSmall,
             const TNumeralOptions& options) {
    TTail tail{std::string(SignOf(chord.mSemitones)), {}};
    if (chord.HasBassNote()) {
        const int bass =
            FoldIntoOctave(std::int64_t{chord.mBassKeyEnh.mKeyNr} - chord.mRootKeyEnh.mKeyNr);
        std::string figured;
        if (options.mFigures) figured = SignWithFigure(tail.mSign, isSmall, bass);
        if (!figured.empty()) return {figured, {}};
        if (bass != 0)
            tail.mBass = "/" + DegreeText(DistToTonic(chord.mBassKeyEnh, key), false, key, true);
    }
    // Among figures a bare 6 is an inversion.
    if (options.mFigures && tail.mSign == "6") tail.mSign = "add6";
    return tail;
}

std::string WithPrintedSigns(std::string_view sign) {
    std::string printed;
    for (const char c : sign) {
        if (c == 'h') {
            printed += "\xC3\xB8";  // ø
        } else if (c == 'o') {
            printed += "\xC2\xB0";  // °
        } else {
            printed += c;
        }
    }
    return printed;
}

}  // namespace

std::string RomanNumeral(const CChordLite& chord, const CSignKeyLite& key, const CChordLite* next,
                         const TNumeralOptions& options) {
    if (chord.IsUndef() || key.IsUndef()) return {};
    const bool isSmall = IsSmall(KeyChordClassOf(chord.mSemitones));
    TTail tail = TailOf(chord, key, isSmall, options);
    if (options.mPrintedSigns && tail.mSign.find("sus") == std::string::npos) {
        tail.mSign = WithPrintedSigns(tail.mSign);
    }
    if (next != nullptr && !options.mNashville) {
        const TApplied applied = AppliedTo(*next, chord, key);
        if (!applied.mNumeral.empty()) {
            return std::string(applied.mNumeral) + tail.mSign + "/" + applied.mTarget + tail.mBass;
        }
    }
    const int dist = DistToTonic(chord.mRootKeyEnh, key);
    std::string numeral = DegreeText(dist, isSmall, key, options.mNashville);
    const TKeyChordClass chordClass = KeyChordClassOf(chord.mSemitones);
    const bool isMinor = chordClass == TKeyChordClass_Min || chordClass == TKeyChordClass_Min7;
    if (options.mNashville && isMinor) numeral += '-';
    return numeral + tail.mSign + tail.mBass;
}

std::vector<std::string> NumeralsOf(const CHarmAnlsChords& chords, const CKeyOfSong& keys,
                                    const TNumeralOptions& options) {
    std::vector<std::string> numerals(chords.size());
    const std::vector<TKeyChord> heard = KeyChordsOf(chords);
    auto region = keys.mRegions.rbegin();
    const CChordLite* next = nullptr;
    std::size_t end = chords.size();
    for (std::size_t i = heard.size(); i-- > 0;) {
        const std::size_t begin = heard[i].mBegin;
        // A dominant that is written twice leads to what comes behind both.
        if (i + 1 < heard.size() && !IsSameKind(heard[i], heard[i + 1])) {
            next = &chords[heard[i + 1].mBegin];
        }
        while (region != keys.mRegions.rend() && region->mBegin > begin) ++region;
        if (region == keys.mRegions.rend()) break;
        const std::string numeral = RomanNumeral(chords[begin], region->mKey, next, options);
        for (std::size_t ix = begin; ix < end; ++ix) {
            if (!chords[ix].IsUndef()) numerals[ix] = numeral;
        }
        end = begin;
    }
    return numerals;
}

}  // namespace brindle
