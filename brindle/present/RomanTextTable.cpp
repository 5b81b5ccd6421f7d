// SPDX-License-Identifier: MIT
#include "brindle/present/RomanTextTable.h"

#include "brindle/analysis/ReadRomanText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <algorithm>
#include <iterator>

namespace brindle {
namespace {

// The bar that a position lies in; bars lie one behind the other.
const CRomanTextBar& BarAt(const CRomanTextReading& reading, double position) {
    const auto behind = std::upper_bound(
        reading.mBars.begin(), reading.mBars.end(), position,
        [](double place, const CRomanTextBar& bar) { return place < bar.mPosition; });
    return *std::prev(behind);
}

}  // namespace

std::string RomanTextText(const CRomanTextReading& reading, const CPaint& paint) {
    CTable table({" bar", " position", " length", "key", "numeral", "chord"});
    for (const CRomanTextChord& chord : reading.mChords) {
        std::string numeral = Printable(chord.mNumeral);
        if (!chord.mNumeralBefore.empty()) numeral += " = " + Printable(chord.mNumeralBefore);
        table.AddRow({std::to_string(BarAt(reading, chord.mPosition).mNumber),
                      ShortNumber(chord.mPosition), ShortNumber(chord.mLength),
                      KeyInWords(chord.mKey), numeral, WriteChordSymbol(chord.mChord)});
    }
    return table.Text(paint);
}

}  // namespace brindle
