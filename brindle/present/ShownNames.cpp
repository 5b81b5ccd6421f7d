// SPDX-License-Identifier: MIT
#include "brindle/present/ShownNames.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/HarmFuncNames.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/KeyNames.h"

#include <fmt/format.h>

#include <array>
#include <cstdlib>

namespace brindle {
namespace {

/// Within a sentence a mode is no proper name.
std::string WithSmallMode(std::string longName) {
    const std::size_t blank = longName.find(' ');
    if (blank != longName.npos) longName[blank + 1] = Ascii::ToLower(longName[blank + 1]);
    return longName;
}

}  // namespace

const CChordNamePrefs& NamePrefs() {
    return ChordNamePrefsNonUTF8;
}

std::string KeyName(const CKeyEnh& keyEnh) {
    return KeyNrAndEnhToName(keyEnh.mKeyNr, keyEnh.mEnh, NamePrefs());
}

std::string KeyInWords(const CSignKeyLite& key) {
    return WithSmallMode(key.NameLong(NamePrefs()));
}

std::string KeyInWords(const CHarmCenterLite& center) {
    return WithSmallMode(center.NameLong(NamePrefs()));
}

std::string_view DegreeName(int distance) {
    constexpr auto names = std::to_array<std::string_view>(
        {"I", "bII", "II", "bIII", "III", "IV", "#IV", "V", "bVI", "VI", "bVII", "VII"});
    if (distance < 0 || distance > 11) return {};
    return names[static_cast<std::size_t>(distance)];
}

std::string_view NumeralOf(const CChordLite& chord, const CHarmCenterLite& center) {
    const CScaleHeavy scale(center.mRootKeyEnh, center.mSemitones);
    const int function = chord.HarmFuncIn(scale);
    return function < 0 ? "" : HarmFuncName(function, scale.ScaleType(), NamePrefs());
}

std::string SemitonesText(CSemitones semitones) {
    std::string text;
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (!semitones.HasIntvl(intvl)) continue;
        text += fmt::format("{}{}", text.empty() ? "" : " ", intvl);
    }
    return text;
}

std::vector<CKeyEnh> KeysOf(const CScaleHeavy& scale) {
    const CKeyEnh root = scale.RootKeyEnh();
    std::vector<CKeyEnh> keys;
    for (int degree = 0; degree < scale.DegreesPerOctave(); ++degree) {
        CKeyEnh key = scale.DegreeNrToKeyEnh(degree);
        if (key.mEnh == TEnh_Undef) key = root + (key.mKeyNr - root.mKeyNr);
        keys.push_back(key);
    }
    return keys;
}

std::string NotesText(const std::vector<CKeyEnh>& keys) {
    std::string text;
    for (const CKeyEnh& key : keys) text += (text.empty() ? "" : " ") + KeyName(key);
    return text;
}

std::string SignsText(int signsCount) {
    if (signsCount == 0) return "none";
    const int count = std::abs(signsCount);
    return fmt::format("{} {}{}", count, signsCount > 0 ? "sharp" : "flat", count > 1 ? "s" : "");
}

std::string_view BasicChordName(TBasicChord basicChord) {
    switch (basicChord) {
        case TBasicChord::None:
            return "none";
        case TBasicChord::Major:
            return "major";
        case TBasicChord::Minor:
            return "minor";
        case TBasicChord::Augmented:
            return "augmented";
        case TBasicChord::Diminished:
            return "diminished";
        case TBasicChord::Sus4:
            return "sus4";
        case TBasicChord::Sus2:
            return "sus2";
        case TBasicChord::Drone:
            return "drone";
    }
    return "none";
}

}  // namespace brindle
