// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MusicXmlParserHarmonyDelegate.h"

#include "brindle/musicxml/PlayedMeasures.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/theory/CSignKeyHeavy.h"

namespace brindle {

namespace {

// What most elements of a score begin with is not among these, so that one look passes them over.
constexpr std::string_view kFirstLettersOfElements = "cdehmrs";
constexpr std::string_view kFirstLettersOfTexts = "bdfkmrw";

bool MayMatter(std::string_view name, std::string_view firstLetters) {
    return !name.empty() && firstLetters.find(name.front()) != firstLetters.npos;
}

}  // namespace

void MusicXmlParserHarmonyDelegate::didStartDocument(XmlStreamParser&) {
    lastSegno = -1;
    lastCoda = -1;
    fifths = -1;
    measures.clear();
}

void MusicXmlParserHarmonyDelegate::didEndDocument(XmlStreamParser&) {
    mWasCut = !PlayMeasures({measures, codaPairs, segnoPairs}, musicXMLDoc);
}

std::int32_t MusicXmlParserHarmonyDelegate::LastMeasureIndex() const {
    return static_cast<std::int32_t>(measures.size()) - 1;
}

void MusicXmlParserHarmonyDelegate::didStartElement(XmlStreamParser& parser, std::string_view name,
                                                    const XmlAttributes& attributes) {
    currentElementParentName.swap(currentElementName);
    currentElementName = name;
    parser.setTextWanted(MayMatter(name, kFirstLettersOfTexts));
    if (name == "measure") {
        measures.emplace_back();
        return;
    }
    if (measures.empty() || !MayMatter(name, kFirstLettersOfElements)) return;
    TMusicXMLMeasure& measure = measures.back();
    if (name == "harmony") {
        measure.mHarmonies.emplace_back();
    } else if (name == "degree") {
        if (!measure.mHarmonies.empty()) measure.mHarmonies.back().mDegrees.emplace_back();
    } else if (name == "repeat") {
        StartedRepeat(attributes);
    } else if (name == "rehearsal") {
        measure.mRehearsal = 1;
    } else if (name == "ending") {
        if (attributes.Value("type") != "discontinue") return;
        measure.mEndingNumber = ReadInteger(attributes.Value("number"));
    } else if (name == "segno") {
        lastSegno = LastMeasureIndex();
        measure.mSegno = true;
    } else if (name == "coda") {
        if (lastCoda != -1) codaPairs.emplace_back(lastCoda, LastMeasureIndex());
        lastCoda = LastMeasureIndex();
        measure.mCoda = true;
    }
}

void MusicXmlParserHarmonyDelegate::StartedRepeat(const XmlAttributes& attributes) {
    TMusicXMLMeasure& measure = measures.back();
    const std::string_view direction = attributes.Value("direction");
    if (direction == "forward") {
        measure.mRepeatForward = true;
        measure.mRepeatTimes = 2;
        ixLastRepetitionStart = LastMeasureIndex();
    } else if (direction == "backward") {
        measure.mRepeatBackward = true;
    }
}

// The parent's name is kept: "words" counts only directly behind the start of its parent.
void MusicXmlParserHarmonyDelegate::didEndElement(XmlStreamParser& parser, std::string_view) {
    currentElementName.clear();
    parser.setTextWanted(false);
}

void MusicXmlParserHarmonyDelegate::foundCharacters(XmlStreamParser&, std::string_view text) {
    const std::string_view name = currentElementName;
    if (!MayMatter(name, kFirstLettersOfTexts)) return;
    if (name == "movement-title") musicXMLDoc.Title = text;
    if (measures.empty()) return;
    TMusicXMLMeasure& measure = measures.back();
    if (name == "divisions") {
        divisions = ReadInteger(text);
    } else if (name == "beats") {
        beatsNumerator = measure.mBeats = ReadInteger(text);
    } else if (name == "beat-type") {
        beatsDenominator = measure.mBeatType = ReadInteger(text);
    } else if (name == "fifths") {
        fifths = ReadInteger(text);
    } else if (name == "mode") {
        FoundMode(text);
    } else if (name == "words") {
        FoundWords(text);
    } else if (!measure.mHarmonies.empty()) {
        FoundHarmonyText(measure.mHarmonies.back(), text);
    }
}

void MusicXmlParserHarmonyDelegate::FoundMode(std::string_view text) {
    CSignKeyHeavy signKey;
    signKey.SetFromSignsCountAndType(
        fifths, text == "minor" ? TSignKeyTypeNoUndef_Minor : TSignKeyTypeNoUndef_Major);
    CHarmAnlsSignKey found;
    found.mSignKey = CSignKeyLite(signKey);
    measures.back().mHarmSignKeyIndex = static_cast<std::int32_t>(musicXMLDoc.HarmSignKeys.size());
    musicXMLDoc.HarmSignKeys.push_back(found);
}

void MusicXmlParserHarmonyDelegate::FoundWords(std::string_view text) {
    if (currentElementParentName != "direction-type") return;
    TMusicXMLMeasure& measure = measures.back();
    if (IsRepeatWord(text)) measure.mRepeatWords.emplace_back(text);
    if (text == "D.S. al Coda") {
        if (lastSegno != -1) segnoPairs.emplace_back(LastMeasureIndex(), lastSegno);
        measure.mDalSegnoAlCoda = true;
    }
    if (text == "/") measure.mSlash = true;
}

void MusicXmlParserHarmonyDelegate::FoundHarmonyText(TMusicXMLHarmony& harmony,
                                                     std::string_view text) {
    const std::string_view name = currentElementName;
    // Any duration of the measure counts, normally that of the note which follows.
    if (name == "duration") {
        harmony.mDuration = divisions == 0 ? kPosUndef
                                           : static_cast<double>(ReadInteger(text)) /
                                                 static_cast<double>(divisions);
    } else if (name == "root-step") {
        harmony.mRoot.mStep = text;
    } else if (name == "root-alter") {
        harmony.mRoot.mAlter = ReadInteger(text);
    } else if (name == "bass-step") {
        harmony.mBass.mStep = text;
    } else if (name == "bass-alter") {
        harmony.mBass.mAlter = ReadInteger(text);
    } else if (name == "kind") {
        harmony.mKind = text;
    } else if (!harmony.mDegrees.empty()) {
        TMusicXMLDegree& degree = harmony.mDegrees.back();
        if (name == "degree-value") {
            degree.mValue = text;
        } else if (name == "degree-alter") {
            degree.mAlter = ReadInteger(text);
        } else if (name == "degree-type") {
            degree.mType = text;
        }
    }
}

}  // namespace brindle
