// SPDX-License-Identifier: MIT
#include "brindle/chords/ReadChordText.h"

#include "brindle/chords/internal/CChordTextParser.h"
#include "brindle/chords/internal/CUnifiedText.h"
#include "brindle/chords/internal/NonChordTexts.h"
#include "brindle/chords/internal/WriteParserText.h"
#include "brindle/theory/CChordNamePrefs.h"

namespace brindle {

using namespace ChordText;

namespace {

/// How CChordSetFromStringHelper is to read a text.
const CChordNamePrefs& ParserPrefs(bool bIsBFlat) {
    static const CChordNamePrefs bIsNatural;
    static const CChordNamePrefs bIsFlat{.mBForBFlat = true};
    return bIsBFlat ? bIsFlat : bIsNatural;
}

CChordTextReading NotUnderstood(const CFaultAt& fault, const CUnifiedText& text) {
    CChordTextReading reading;
    reading.mFaultPos = CharacterPos(text.Input(), text.InputOffset(fault.mPos));
    reading.mFault = FaultText(fault, text);
    return reading;
}

void SetParserText(CChordTextReading& reading, std::string_view input, bool bIsBFlat) {
    const CChordNamePrefs& prefs = ParserPrefs(bIsBFlat);
    if (CChordLite(input, prefs) == reading.mChord) {
        reading.mParserText = input;
        reading.mParserTextIsExact = true;
        return;
    }
    CParserText written = WriteParserText(reading.mChord, prefs);
    reading.mParserText = std::move(written.mText);
    reading.mParserTextIsExact = written.mIsExact;
}

}  // namespace

CChordTextReading ReadChordText(std::string_view text, const CChordTextOptions& prefs) {
    const CUnifiedText folded(text);
    if (folded.IsEmpty()) return NotUnderstood({TFault::Empty}, folded);
    if (auto nonChord = ReadNonChord(folded)) return *std::move(nonChord);
    CChordTextParser parser(folded, prefs);
    if (!parser.Read()) return NotUnderstood(parser.Fault(), folded);
    CChordTextReading reading;
    reading.mKind = TChordText_Chord;
    reading.mChord = parser.Chord();
    reading.mHasH = parser.HasH();
    reading.mHasAugmentedSixth = parser.HasAugmentedSixth();
    SetParserText(reading, text, prefs.mBIsBFlat);
    return reading;
}

std::optional<std::string> NormaliseChordSymbol(std::string_view text,
                                                const CChordTextOptions& prefs) {
    CChordTextReading reading = ReadChordText(text, prefs);
    if (reading.mKind != TChordText_Chord) return std::nullopt;
    return std::move(reading.mParserText);
}

}  // namespace brindle
