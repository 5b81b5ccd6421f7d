// SPDX-License-Identifier: MIT
#include "brindle/present/VectorsText.h"

#include "brindle/analysis/ChordVectorText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"

#include <nlohmann/json.hpp>
#include <utility>

namespace brindle {
namespace {

std::string NameOfReadBack(const CHarmAnlsChordForMetro& chord) {
    if (chord.IsUndef() || chord.IsWildcard() || chord.IsEADGBE()) {
        return chord.NameForMetroExport(true);
    }
    return WriteChordSymbol(chord);
}

Json VectorToJson(const CShownVector& shown) {
    Json places = Json::array();
    for (const float place : shown.mVector) places.push_back(place == 1.0F ? 1 : 0);
    const CHarmAnlsChordForMetro& chord = shown.mReadBack;
    return {{"Symbol", shown.mSymbol.empty() ? Json(nullptr) : Json(shown.mSymbol)},
            {"VectorRep", places},
            {"ReadBack",
             {{"Name", NameOfReadBack(chord)},
              {"NameForExport", chord.NameForMetroExport(true)},
              {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
              {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
              {"Semitones", chord.mSemitones.Mask()},
              {"Intervals", IntervalsToJson(chord.mSemitones)}}}};
}

}  // namespace

CShownVector ShowVector(std::vector<float> vector) {
    CShownVector shown;
    shown.mVector = std::move(vector);
    shown.mReadBack.SetFromChordVectorRepresentation(shown.mVector);
    return shown;
}

CShownVector ShowVectorOfChord(std::string symbol, const CChordLite& chord) {
    CShownVector shown = ShowVector(CHarmAnlsChordForMetro(chord).GetChordVectorRepresentation());
    shown.mSymbol = std::move(symbol);
    return shown;
}

std::string VectorsText(std::span<const CShownVector> vectors, const CPaint& paint) {
    CTable table({"chord", "vector", "reads back"});
    for (const CShownVector& shown : vectors) {
        table.AddRow({shown.mSymbol.empty() ? "-" : shown.mSymbol, WriteChordVector(shown.mVector),
                      NameOfReadBack(shown.mReadBack)});
    }
    return table.Text(paint);
}

std::string VectorsJson(std::span<const CShownVector> vectors) {
    Json list = Json::array();
    for (const CShownVector& vector : vectors) list.push_back(VectorToJson(vector));
    return JsonText({{"Vectors", list}});
}

}  // namespace brindle
