// SPDX-License-Identifier: MIT
#include "brindle/present/ChordsText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"

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

}  // namespace

std::string ChordsJson(const std::vector<CReadChord>& chords) {
    Json list = Json::array();
    for (const CReadChord& chord : chords) list.push_back(ChordToJson(chord));
    return JsonText({{"Chords", list}});
}

std::string ChordsText(const std::vector<CReadChord>& chords, const CPaint& paint) {
    CTable table({"chord", "root", "bass", "basic chord", "semitones", " mask", "hash code"});
    for (const auto& [symbol, chord] : chords) {
        table.AddRow({symbol, chord.IsUndef() ? NonChordName(chord) : KeyName(chord.mRootKeyEnh),
                      chord.HasBassNote() ? KeyName(chord.mBassKeyEnh) : "-",
                      std::string(BasicChordName(chord.BasicChord())),
                      SemitonesText(chord.mSemitones), fmt::format("{}", chord.mSemitones.Mask()),
                      HashCode(chord)});
    }
    return table.Text(paint);
}

}  // namespace brindle
