// SPDX-License-Identifier: MIT
#include "brindle/present/HarmoniesText.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/CBars.h"
#include "brindle/present/CJsonWriter.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/HarmonySymbols.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <utility>
#include <vector>

namespace brindle {

namespace {

std::string DegreesText(const TMusicXMLHarmony& harmony) {
    std::string text;
    for (const TMusicXMLDegree& degree : harmony.mDegrees) {
        if (!text.empty()) text += ", ";
        text += Printable(degree.mType) + ' ';
        if (degree.mAlter != 0) text += degree.mAlter < 0 ? 'b' : '#';
        text += Printable(degree.mValue);
    }
    return text;
}

// A score read as the library does may have chords without a place in time.
std::string TimeText(double time) {
    return time > -1e9 && time < 1e9 ? ShortNumber(time) : "-";
}

void WriteHarmony(CJsonWriter& json, const TMusicXMLHarmony& harmony) {
    json.BeginObject().Key("Position").Number(harmony.mPosition);
    json.Key("Duration").Number(harmony.mDuration);
    json.Key("Symbol").String(HarmonySymbol(harmony));
    WriteKeyEnh(json.Key("RootKeyEnh"), harmony.mRoot.ToKeyEnh(NamePrefs()));
    WriteKeyEnh(json.Key("BassKeyEnh"), harmony.mBass.ToKeyEnh(NamePrefs()));
    json.Key("Kind").String(Printable(harmony.mKind)).Key("Degrees").BeginArray();
    for (const TMusicXMLDegree& degree : harmony.mDegrees) {
        json.BeginObject().Key("Value").String(Printable(degree.mValue));
        json.Key("Alter").Integer(degree.mAlter);
        json.Key("Type").String(Printable(degree.mType)).EndObject();
    }
    json.EndArray().EndObject();
}

}  // namespace

std::string HarmoniesText(const TMusicXMLDoc& sheet, const CPaint& paint) {
    std::vector<double> starts;
    for (const CHarmBarline& barline : sheet.HarmBarlines) starts.push_back(barline.mPosition);
    const bool hasBars = !starts.empty();
    const CBars bars(1.0, std::move(starts));
    CTable table(
        hasBars ? std::vector<std::string>{" bar", " beat", " position", " length", "chord", "kind",
                                           "degrees"}
                : std::vector<std::string>{" position", " length", "chord", "kind", "degrees"});
    long barBefore = 0;
    for (const TMusicXMLHarmony& harmony : sheet.Harmonies) {
        std::vector<std::string> cells;
        if (hasBars) {
            const long bar = bars.BarOf(harmony.mPosition);
            cells = {bar == barBefore ? "" : fmt::format("{}", bar),
                     ShortNumber(bars.BeatOf(harmony.mPosition))};
            barBefore = bar;
        }
        cells.insert(cells.end(),
                     {TimeText(harmony.mPosition), TimeText(harmony.mDuration),
                      HarmonySymbol(harmony), Printable(harmony.mKind), DegreesText(harmony)});
        table.AddRow(std::move(cells));
    }
    std::string text;
    if (!sheet.Title.empty()) text = paint.Strong(Printable(sheet.Title)) + "\n\n";
    return text + table.Text(paint);
}

std::string HarmoniesJson(const TMusicXMLDoc& sheet) {
    CJsonWriter json;
    json.BeginObject().Key("Title").String(Printable(sheet.Title));
    json.Key("Harmonies").BeginArray();
    for (const TMusicXMLHarmony& harmony : sheet.Harmonies) WriteHarmony(json, harmony);
    json.EndArray().EndObject();
    return std::move(json).Text();
}

namespace {

Json ChordToJson(const CChordFromNotes& chord) {
    const CNamedChord& named = chord.mChord;
    return {{"Position", NumberToJson(chord.mPosition)},
            {"Duration", NumberToJson(chord.mLength)},
            {"Symbol", named.mSymbol},
            {"RootKeyEnh", KeyEnhToJson(named.mRoot)},
            {"BassKeyEnh", KeyEnhToJson(named.mBass)},
            {"Intervals", IntervalsToJson(named.mChord.mSemitones)}};
}

}  // namespace

std::string ChordsFromNotesJson(const CChordsFromNotes& chords) {
    Json list = Json::array();
    for (const CChordFromNotes& chord : chords.mChords) list.push_back(ChordToJson(chord));
    return JsonText(
        {{"Key", chords.mKey.IsUndef() ? Json(nullptr) : Json(chords.mKey.NameLong(NamePrefs()))},
         {"Harmonies", list}});
}

std::string ChordsFromNotesText(const CScoreNotes& score, const CChordsFromNotes& chords,
                                const CPaint& paint) {
    std::vector<double> starts;
    for (const CScoreBar& bar : score.mBars) starts.push_back(bar.mPosition);
    const CBars bars(1.0, std::move(starts));
    CTable table({" bar", " beat", " position", " length", "chord"});
    long barBefore = 0;
    for (const CChordFromNotes& chord : chords.mChords) {
        const long bar = bars.BarOf(chord.mPosition);
        table.AddRow({bar == barBefore ? "" : fmt::format("{}", bar),
                      ShortNumber(bars.BeatOf(chord.mPosition)), ShortNumber(chord.mPosition),
                      ShortNumber(chord.mLength), chord.mChord.mSymbol});
        barBefore = bar;
    }
    if (chords.mKey.IsUndef()) return table.Text(paint);
    return paint.Strong(KeyInWords(chords.mKey)) + "\n\n" + table.Text(paint);
}

}  // namespace brindle
