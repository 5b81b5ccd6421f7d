// SPDX-License-Identifier: MIT
#include "brindle/present/NextChordsText.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/TonalityName.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {

std::string NextChordsText(const CNextChords& next, const CPaint& paint) {
    CTable table({" probability", "chord", "numeral", "function"});
    for (const CNextChord& chord : next.mChords) {
        table.AddRow({fmt::format("{:.3f}", chord.mProbability), WriteChordSymbol(chord.mChord),
                      chord.mNumeral, std::string(NameOf(chord.mFunction))});
    }
    return fmt::format("in {}\n\n{}", TonalityName(next.mKey), table.Text(paint));
}

std::string NextChordsJson(const CNextChords& next) {
    Json chords = Json::array();
    for (const CNextChord& chord : next.mChords) {
        chords.push_back({{"Symbol", WriteChordSymbol(chord.mChord)},
                          {"Probability", NumberToJson(chord.mProbability)},
                          {"Numeral", chord.mNumeral},
                          {"Function", std::string(NameOf(chord.mFunction))}});
    }
    return JsonText({{"Key", TonalityName(next.mKey)}, {"Chords", chords}});
}

}  // namespace brindle
