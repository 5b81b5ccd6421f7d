// SPDX-License-Identifier: MIT
#include "brindle/theory/KeyNames.h"

#include "brindle/platform/Localization.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"

#include <algorithm>
#include <array>
#include <cstddef>

// A name is a stem, a letter or a syllable, and an ending, its signs or a German syllable. Both
// have a row for the flat side, one for the sharp side and a plain one, indexed by key number 0
// to 11.

namespace brindle {

namespace {

using TStems = std::array<std::string_view, 12>;

/// The stems of one way to name keys.
struct CStemRows {
    TStems mFlatSide;
    TStems mSharpSide;
    TStems mPlain;
};

constexpr TStems OneEach(std::string_view letters) {
    TStems stems;
    for (std::size_t i = 0; i < stems.size(); ++i) stems[i] = letters.substr(i, 1);
    return stems;
}

// In the tables a blank is no sign and no ending.
// clang-format off

// Syllables of the flat side, of the sharp side and of the plain row.
constexpr TStems RomanString1 = {
    "Re", "Re", "Mi", "Mi", "Fa", "Sol", "Sol", "La", "La", "Ti", "Ti", "Do"};
constexpr TStems RomanString2 = {
    "Ti", "Do", "Do", "Re", "Re", "Mi", "Fa", "Fa", "Sol", "Sol", "La", "La"};
constexpr TStems RomanString3 = {
    "Do", "Do", "Re", "Mi", "Mi", "Fa", "Fa", "Sol", "Sol", "La", "Ti", "Ti"};

constexpr CStemRows kLetters = {OneEach("DDEEFGGAABBC"),
                                OneEach("BCCDDEFFGGAA"),
                                OneEach("CCDEEFFGGABB")};
constexpr CStemRows kSyllables = {RomanString1, RomanString2, RomanString3};

// The flat side has one "b" on every key, and this is the second.
constexpr std::string_view kSecondFlatSigns = "b b  b b b  ";
constexpr std::string_view kSharpSigns      = "##x#x##x#x#x";
constexpr std::string_view kPlainSigns      = " # b  # # b ";

// German endings of the sharp side and of the plain row; those of the flat side are regular.
constexpr std::array<std::string_view, 12> SpellEnharm1 = {
    "is", "is", "isis", "is", "isis", "is", "is", "isis", "is", "isis", "is", "isis"};
constexpr std::array<std::string_view, 12> SpellEnharm2 = {
    " ", "is", " ", "es", " ", " ", "is", " ", "is", " ", "es", " "};
// clang-format on

std::string_view UnlessBlank(std::string_view sign) {
    return sign == " " ? std::string_view() : sign;
}

// The double accidentals that the flat and the sharp side have no name for. Their letter is that of
// the key a whole tone away.
constexpr bool HasDoubleFlatOfItsOwn(std::size_t key) {
    return key == 3 || key == 10;  // Fbb, Cbb
}
constexpr bool HasDoubleSharpOfItsOwn(std::size_t key) {
    return key == 6 || key == 1;  // Ex, Bx
}

std::string_view Stem(const CStemRows& rows, std::size_t key, TEnh enh) {
    switch (enh) {
        case TEnh_bb:
            return HasDoubleFlatOfItsOwn(key) ? rows.mPlain[(key + 2) % 12] : rows.mFlatSide[key];
        case TEnh_b:
            return rows.mFlatSide[key];
        case TEnh_s:
            return rows.mSharpSide[key];
        case TEnh_ss:
            return HasDoubleSharpOfItsOwn(key) ? rows.mPlain[(key + 10) % 12]
                                               : rows.mSharpSide[key];
        case TEnh_bbb:
        case TEnh_n:
        case TEnh_sss:
        case TEnh_Undef:
            break;
    }
    return rows.mPlain[key];
}

std::string_view Signs(std::size_t key, TEnh enh) {
    switch (enh) {
        case TEnh_bb:
            if (HasDoubleFlatOfItsOwn(key)) return "bb";
            [[fallthrough]];
        case TEnh_b:
            return kSecondFlatSigns[key] == 'b' ? "bb" : "b";
        case TEnh_ss:
            if (HasDoubleSharpOfItsOwn(key)) return "x";
            [[fallthrough]];
        case TEnh_s:
            return kSharpSigns.substr(key, 1);
        case TEnh_bbb:
        case TEnh_n:
        case TEnh_sss:
        case TEnh_Undef:
            break;
    }
    return UnlessBlank(kPlainSigns.substr(key, 1));
}

std::string_view GermanEnding(std::size_t key, TEnh enh) {
    switch (enh) {
        case TEnh_bb:
            if (HasDoubleFlatOfItsOwn(key)) return "eses";
            if (key == 7) return "ses";  // Ases. Kept: as a single flat it is Aeses.
            [[fallthrough]];
        case TEnh_b:
            if (key == 3 || key == 8) return "s";  // Es, As
            return kSecondFlatSigns[key] == 'b' ? "eses" : "es";
        case TEnh_ss:
            if (HasDoubleSharpOfItsOwn(key)) return "isis";
            [[fallthrough]];
        case TEnh_s:
            return SpellEnharm1[key];
        case TEnh_bbb:
        case TEnh_n:
        case TEnh_sss:
        case TEnh_Undef:
            break;
    }
    return UnlessBlank(SpellEnharm2[key]);
}

/// German musicians call B natural H, and some call B flat B.
void ApplyHAndBRules(std::string& name, const CChordNamePrefs& prefs) {
    const std::string_view bFlat = prefs.mGermanNames ? "Bes" : "Bb";
    if (prefs.mHForB && name.front() == 'B' && name != bFlat) name.front() = 'H';
    if (prefs.mBForBFlat && name == bFlat) name = "B";
}

std::string WithUtf8Signs(std::string_view name) {
    std::string result;
    for (const char c : name) {
        if (c == '#') {
            result += kUtf8Sharp;
        } else if (c == 'b') {
            result += kUtf8Flat;
        } else {
            result += c;
        }
    }
    return result;
}

void ReplaceAll(std::string& text, std::string_view from, std::string_view to) {
    for (auto at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
}

/// Looks at any name, so that it also runs on letters.
void LocalizeSyllables(std::string& name) {
    for (const char* syllable : {"Do", "Re", "Mi", "Fa", "Sol", "La", "Ti"}) {
        if (name.find(syllable) == std::string::npos) continue;
        ReplaceAll(name, syllable, LocalizedString(syllable));
    }
}

}  // namespace

std::string KeyNrAndEnhToName(int keyNr, TEnh enh, const CChordNamePrefs& prefs) {
    if (keyNr == kKeyNrUndef) return "Undef";
    const auto key = static_cast<std::size_t>(std::clamp(keyNr, 0, 11));
    std::string name(Stem(prefs.mSolfege ? kSyllables : kLetters, key, enh));
    name += !prefs.mSolfege && prefs.mGermanNames ? GermanEnding(key, enh) : Signs(key, enh);
    if (!prefs.mSolfege) ApplyHAndBRules(name, prefs);
    if (prefs.mAsciiAccidentals == 0) name = WithUtf8Signs(name);
    if (prefs.mLocalizeSolfege) LocalizeSyllables(name);
    return name;
}

std::string KeyNrToNameIgnoringEnh(int keyNr, TEnh enh, const CChordNamePrefs& prefs) {
    if (!prefs.mSolfege && prefs.mGermanNames) return KeyNrAndEnhToName(keyNr, enh, prefs);
    if (keyNr < 0 || keyNr > 11) return "Undef";
    const auto key = static_cast<std::size_t>(keyNr);
    std::string name(Stem(prefs.mSolfege ? kSyllables : kLetters, key, enh));
    if (!prefs.mSolfege) {
        if (prefs.mHForB && name == "B" && keyNr != 10) name = "H";
        if (prefs.mBForBFlat && keyNr == 10) name = "B";
    }
    if (prefs.mLocalizeSolfege) LocalizeSyllables(name);
    return name;
}

std::string_view SharpAsUTF8OrNot(const CChordNamePrefs& prefs) {
    return prefs.mAsciiAccidentals != 0 ? "#" : kUtf8Sharp;
}

std::string_view FlatAsUTF8OrNot(const CChordNamePrefs& prefs) {
    return prefs.mAsciiAccidentals != 0 ? "b" : kUtf8Flat;
}

void ConvertUtf8SharpAndFlatToAscii(std::string& text) {
    text.resize(ConvertUtf8SharpAndFlatToAscii(std::span<char>(text)).size());
}

std::span<char> ConvertUtf8SharpAndFlatToAscii(std::span<char> text) {
    // A sign becomes shorter, so what is written never overtakes what is read.
    std::size_t size = 0;
    for (std::string_view rest(text.data(), text.size()); !rest.empty();) {
        const bool isSharp = rest.starts_with(kUtf8Sharp);
        const bool isSign = isSharp || rest.starts_with(kUtf8Flat);
        text[size++] = isSharp ? '#' : isSign ? 'b' : rest.front();
        rest.remove_prefix(isSign ? kUtf8Sharp.size() : 1);
    }
    return text.first(size);
}

std::string_view OptionalSpaceBetweenNameParts(const CChordNamePrefs& prefs) {
    return prefs.mNoSpaceBetweenNameParts == 0 ? " " : "";
}

std::string_view OptionalSpaceAroundSlash(const CChordNamePrefs& prefs) {
    return prefs.mNoSpaceAroundSlash == 0 ? " " : "";
}

}  // namespace brindle
