// SPDX-License-Identifier: MIT
#include "brindle/present/ChordsText.h"

#include "brindle/chords/NameNotes.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/theory/KeyNames.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {

namespace {

std::string HashCode(const CChordLite& chord) {
    return fmt::format("0x{:010X}", chord.GetChordHashCode());
}

std::string NonChordName(const CChordLite& chord) {
    if (chord.IsNoChordYield()) return "no chord, yield";
    return chord.IsNoChordForce() ? "no chord, force" : "undefined";
}

Json ChordToJson(const CReadChord& read) {
    const CChordLite& chord = read.mChord;
    return {{"Symbol", read.mSymbol},
            {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
            {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
            {"Semitones", chord.mSemitones.Mask()},
            {"Intervals", IntervalsToJson(chord.mSemitones)},
            {"BasicChord", BasicChordName(chord.BasicChord())},
            {"NonChord", chord.IsUndef() ? Json(NonChordName(chord)) : Json(nullptr)},
            {"HashCode", chord.GetChordHashCode()}};
}

std::string KeyInStyle(const CKeyEnh& key, const std::optional<CChordNamePrefs>& style) {
    return style ? KeyNrAndEnhToName(key.mKeyNr, key.mEnh, *style) : KeyName(key);
}

}  // namespace

std::string ChordsJson(const std::vector<CReadChord>& chords,
                       const std::optional<CChordNamePrefs>& style) {
    Json list = Json::array();
    for (const CReadChord& chord : chords) {
        list.push_back(ChordToJson(chord));
        if (style) list.back()["Name"] = Printable(ChordSymbolInStyle(chord.mChord, *style));
    }
    return JsonText({{"Chords", list}});
}

std::string ChordsText(const std::vector<CReadChord>& chords, const CPaint& paint,
                       const std::optional<CChordNamePrefs>& style) {
    std::vector<std::string> titles{"chord", "name"};
    if (!style) titles.pop_back();
    for (const char* title : {"root", "bass", "basic chord", "semitones", " mask", "hash code"}) {
        titles.emplace_back(title);
    }
    CTable table(titles);
    for (const auto& [symbol, chord] : chords) {
        std::vector<std::string> row{symbol};
        if (style) row.push_back(Printable(ChordSymbolInStyle(chord, *style)));
        row.push_back(chord.IsUndef() ? NonChordName(chord) : KeyInStyle(chord.mRootKeyEnh, style));
        row.push_back(chord.HasBassNote() ? KeyInStyle(chord.mBassKeyEnh, style) : "-");
        row.emplace_back(BasicChordName(chord.BasicChord()));
        row.push_back(SemitonesText(chord.mSemitones));
        row.push_back(fmt::format("{}", chord.mSemitones.Mask()));
        row.push_back(HashCode(chord));
        table.AddRow(row);
    }
    return table.Text(paint);
}

}  // namespace brindle
