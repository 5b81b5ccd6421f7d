// SPDX-License-Identifier: MIT
#include "brindle/present/AnalysisJson.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/CChordSymbols.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/KeysJson.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/present/ReadingJson.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/SheetTimes.h"

#include <utility>

namespace brindle {
namespace {

class CAnalysisWriter {
public:
    CAnalysisWriter(CJsonWriter& json, const CChordSymbols& symbols)
        : mJson(json), mSymbols(symbols) {}

    template <class TList>
    void WriteList(const TList& list) {
        mJson.BeginArray();
        for (const auto& element : list) Write(element);
        mJson.EndArray();
    }

private:
    void Write(const CHarmAnlsSignKey& signKey) {
        mJson.BeginObject();
        WritePlace(signKey.mProbability, signKey.mPosition);
        const CSignKeyLite& key = signKey.mSignKey;
        mJson.Key("SignKey").BeginObject();
        WriteName(signKey.IsUndef() ? "" : key.NameLong(NamePrefs()));
        WriteKeyEnh(mJson.Key("CKeyEnh"), key.mRootKeyEnh);
        mJson.Key("Type").StringOrNull(
            key.mSignKeyType == TSignKeyType_Undef ? "" : JSONWord(key.mSignKeyType));
        mJson.EndObject().Key("HarmCenters");
        WriteList(signKey.mHarmCenters);
        mJson.EndObject();
    }

    void Write(const CHarmAnlsCenter& center) {
        mJson.BeginObject();
        WritePlace(center.mProbability, center.mPosition);
        const CHarmCenterLite& harmCenter = center.mHarmCenter;
        mJson.Key("HarmCenter").BeginObject();
        WriteName(center.IsUndef() ? "" : harmCenter.NameLong(NamePrefs()));
        WriteKeyEnh(mJson.Key("CKeyEnh"), harmCenter.mRootKeyEnh);
        WriteSemitones(harmCenter.mSemitones);
        mJson.EndObject().Key("HarmChords").BeginArray();
        for (const auto& chord : center.mChords) Write(chord, harmCenter);
        mJson.EndArray().EndObject();
    }

    void Write(const CHarmAnlsChordWithPos& chord, const CHarmCenterLite& center) {
        mJson.BeginObject().Key("Position").Number(chord.mPosition);
        mJson.Key("Symbol").StringOrNull(mSymbols.SymbolOf(chord));
        WriteKeyEnh(mJson.Key("RootKeyEnh"), chord.mRootKeyEnh);
        WriteKeyEnh(mJson.Key("BassKeyEnh"), chord.mBassKeyEnh);
        WriteSemitones(chord.mSemitones);
        WriteDistance(mJson.Key("RootDistToHarmCenter"), chord.mRootDistToHarmCenter);
        WriteDistance(mJson.Key("BassDistToHarmCenter"), chord.mBassDistToHarmCenter);
        mJson.Key("Numeral").StringOrNull(NumeralOf(chord, center)).EndObject();
    }

    void WritePlace(double probability, double position) {
        mJson.Key("Probability").Number(probability).Key("Position").Number(position);
    }
    void WriteName(std::string_view name) { mJson.Key("Name").StringOrNull(name); }
    void WriteSemitones(CSemitones semitones) {
        mJson.Key("Semitones").Integer(static_cast<std::int64_t>(semitones.Mask()));
        WriteIntervals(mJson.Key("Intervals"), semitones);
    }
    static void WriteDistance(CJsonWriter& json, int distance) {
        distance < 0 ? json.Null() : json.Integer(distance);
    }

    CJsonWriter& mJson;
    const CChordSymbols& mSymbols;
};

void WriteTimes(CJsonWriter& json, const TMusicXMLDoc& sheet) {
    json.Key("TimeSignatures").BeginArray();
    for (const TMusicXMLTimeSignature& time : sheet.TimeSignatures) {
        json.BeginObject().Key("Position").Number(time.mPosition);
        json.Key("Numerator").Integer(time.mNumerator);
        json.Key("Denominator").Integer(time.mDenominator).EndObject();
    }
    json.EndArray();
}

void WriteSections(CJsonWriter& json, const TMusicXMLDoc& sheet) {
    json.Key("Sections").BeginArray();
    for (const CHarmSection& section : sheet.HarmSections) {
        json.BeginObject().Key("Position").Number(section.mPosition);
        json.Key("IsFirst").Bool(section.mIsFirst).EndObject();
    }
    json.EndArray();
}

void WriteCopies(CJsonWriter& json, const TMusicXMLDoc& sheet) {
    json.Key("Copies").BeginArray();
    for (const CHarmCopy& copy : sheet.HarmCopies) {
        json.BeginObject().Key("Position").Number(copy.mTargetPos);
        json.Key("SourceOffsetBars").Integer(copy.mSourceOffsetBars);
        json.Key("LengthBars").Integer(static_cast<std::int64_t>(copy.mLengthBars)).EndObject();
    }
    json.EndArray();
}

void WriteScore(CJsonWriter& json, const TMusicXMLDoc& sheet) {
    json.BeginObject().Key("Title").String(Printable(sheet.Title));
    WriteTimes(json, sheet);
    WriteSections(json, sheet);
    WriteCopies(json, sheet);
    json.Key("Bars").BeginArray();
    for (const CHarmBarline& barline : sheet.HarmBarlines) json.Number(barline.mPosition);
    json.EndArray().EndObject();
}

/// `sheet` and `read` may be null.
std::string AnalysisText(const CSongAnalysis& found, const CChordSymbols& symbols,
                         const TMusicXMLDoc* sheet, const CReadSong* read) {
    CJsonWriter json;
    CAnalysisWriter writer(json, symbols);
    json.BeginObject();
    if (sheet != nullptr) WriteScore(json.Key("Score"), *sheet);
    json.Key("HarmSignKeys");
    writer.WriteList(found.mAnalyse.mSignKeys);
    if (found.mHasReadings) {
        json.Key("Readings");
        writer.WriteList(found.mReadings);
    }
    WriteKeys(json, MakeSongKeys(found, symbols));
    if (read != nullptr) WriteReading(json, *read);
    json.EndObject();
    return std::move(json).Text();
}

std::string WithScoreOf(const CSong& song, const CSongAnalysis& found, const CChordSymbols& symbols,
                        const CReadSong* read) {
    if (!IsScore(song.mFormat)) return AnalysisText(found, symbols, nullptr, read);
    const TMusicXMLDoc sheet = SheetWithoutChords(song);
    return AnalysisText(found, symbols, &sheet, read);
}

}  // namespace

std::string AnalysisJson(const CSong& song, const CSongAnalysis& found) {
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    return WithScoreOf(song, found, symbols, nullptr);
}

std::string AnalysisJson(const CSong& song, const CSongAnalysis& found, const CSongReading& reading,
                         std::span<const std::string> explanations) {
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    const CReadSong read{song, reading, explanations};
    return WithScoreOf(song, found, symbols, &read);
}

std::string AnalysisJson(const TMusicXMLDoc& sheet, const CSongAnalysis& found) {
    return AnalysisText(found, CChordSymbols(sheet, found.mAnalyse.mChords), &sheet, nullptr);
}

}  // namespace brindle
