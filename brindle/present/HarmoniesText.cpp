// SPDX-License-Identifier: MIT
#include "brindle/present/HarmoniesText.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/CBars.h"
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
    Json list = Json::array();
    for (const TMusicXMLHarmony& harmony : sheet.Harmonies) {
        Json degrees = Json::array();
        for (const TMusicXMLDegree& degree : harmony.mDegrees) {
            degrees.push_back({{"Value", Printable(degree.mValue)},
                               {"Alter", degree.mAlter},
                               {"Type", Printable(degree.mType)}});
        }
        list.push_back({{"Position", NumberToJson(harmony.mPosition)},
                        {"Duration", NumberToJson(harmony.mDuration)},
                        {"Symbol", HarmonySymbol(harmony)},
                        {"RootKeyEnh", KeyEnhToJson(harmony.mRoot.ToKeyEnh(NamePrefs()))},
                        {"BassKeyEnh", KeyEnhToJson(harmony.mBass.ToKeyEnh(NamePrefs()))},
                        {"Kind", Printable(harmony.mKind)},
                        {"Degrees", degrees}});
    }
    return JsonText({{"Title", Printable(sheet.Title)}, {"Harmonies", list}});
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
    return paint.Strong(chords.mKey.NameLong(NamePrefs())) + "\n\n" + table.Text(paint);
}

}  // namespace brindle
