// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/NumeralText.h"

#include "brindle/analysis/internal/KeyNumbers.h"
#include "brindle/platform/Ascii.h"

namespace brindle {
namespace {

std::string_view OpenSign(CSemitones semitones) {
    const bool isSus4 = semitones.HasIntvl(5);
    if (!isSus4 && !semitones.HasIntvl(2)) return "5";
    if (semitones.HasIntvl(10)) return "7sus";
    return isSus4 ? "sus" : "sus2";
}

std::string_view MinorSign(CSemitones semitones) {
    if (semitones.HasIntvl(11)) return "^7";
    if (!semitones.HasIntvl(9)) return "";
    return semitones.HasIntvl(10) ? "13" : "6";
}

}  // namespace

std::string_view NumeralSignOf(CSemitones semitones) {
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
            return MinorSign(semitones);
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

const CNumeralDegree& NumeralDegreeOf(int degree, int key) {
    const TSignKeyType type = IsMinorKey(key) ? TSignKeyType_Minor : TSignKeyType_Major;
    return DegreesOf(type)[static_cast<std::size_t>(degree)];
}

void AppendAccidentals(std::string& text, int accidental) {
    for (; accidental > 0; --accidental) text += '#';
    for (; accidental < 0; ++accidental) text += 'b';
}

void AppendDegree(std::string& text, const CNumeralDegree& degree, bool isSmall) {
    AppendAccidentals(text, degree.mAccidental);
    for (const char c : kRomanNumbers[static_cast<std::size_t>(degree.mNumber - 1)]) {
        text += isSmall ? Ascii::ToLower(c) : c;
    }
}

}  // namespace brindle
