// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/ReadHarmony.h"
#include "brindle/analysis/internal/NumeralText.h"

#include <algorithm>
#include <utility>

namespace brindle {

std::string CServedDegree::Name() const {
    std::string name;
    if (mSemitones >= 0) AppendDegree(name, {mNumber, mAccidental}, mIsMinor);
    return name;
}

namespace {

// viih7 and io7 as viiÃ¸7 and iÂ°7; no sign stands but behind a small degree.
std::string InPrintedSigns(std::string_view numeral) {
    std::string printed;
    char before = 0;
    for (const char c : numeral) {
        const bool isSign = before == 'i' || before == 'v';
        if (isSign && c == 'h') {
            printed += "\xC3\xB8";
        } else if (isSign && c == 'o') {
            printed += "\xC2\xB0";
        } else {
            printed += c;
        }
        before = c;
    }
    return printed;
}

}  // namespace

CSongReading WithNumerals(CSongReading reading, const CHarmAnlsChords& chords,
                          const CNumeralOptions& options) {
    if (options == CNumeralOptions{}) return reading;
    const std::size_t count = std::min(chords.size(), reading.mChords.size());
    for (std::size_t ix = 0; ix < count; ++ix) {
        CChordReading& chord = reading.mChords[ix];
        chord.mNumeral = options == CNumeralOptions{.mPrintedSigns = true}
                             ? InPrintedSigns(chord.mNumeral)
                             : NumeralInStyle(chord.mNumeral, chords[ix], chord.mKey, options);
    }
    return reading;
}

std::string_view NameOf(THarmFunction function) {
    switch (function) {
        case THarmFunction_Undef:
            return "";
        case THarmFunction_Tonic:
            return "tonic";
        case THarmFunction_Subdominant:
            return "subdominant";
        case THarmFunction_Dominant:
            return "dominant";
        case THarmFunction_None:
            return "none";
    }
    return "";
}

std::string_view LetterOf(THarmFunction function) {
    switch (function) {
        case THarmFunction_Undef:
            return "";
        case THarmFunction_Tonic:
            return "T";
        case THarmFunction_Subdominant:
            return "S";
        case THarmFunction_Dominant:
            return "D";
        case THarmFunction_None:
            return "-";
    }
    return "";
}

std::string_view NameOf(TChordRelation relation) {
    switch (relation) {
        case TChordRelation_Undef:
            return "";
        case TChordRelation_None:
            return "none";
        case TChordRelation_Tonic:
            return "tonic";
        case TChordRelation_Dominant:
            return "dominant";
        case TChordRelation_RelatedSecond:
            return "related second";
        case TChordRelation_SubstituteDominant:
            return "substitute dominant";
        case TChordRelation_LeadingDiminished:
            return "leading diminished";
        case TChordRelation_PassingDiminished:
            return "passing diminished";
        case TChordRelation_CommonToneDiminished:
            return "common-tone diminished";
        case TChordRelation_Backdoor:
            return "backdoor";
        case TChordRelation_Plagal:
            return "plagal";
        case TChordRelation_Borrowed:
            return "borrowed";
        case TChordRelation_ChromaticMediant:
            return "chromatic mediant";
        case TChordRelation_Neapolitan:
            return "Neapolitan";
        case TChordRelation_AugmentedSixth:
            return "augmented sixth";
        case TChordRelation_Blues:
            return "blues";
        case TChordRelation_LineCliche:
            return "line cliche";
    }
    return "";
}

}  // namespace brindle
