// SPDX-License-Identifier: MIT
#include "ReadingForms.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <sstream>
#include <vector>

namespace brindle::test {
namespace {

std::vector<CChordLite> ChordsOf(const std::string& bar) {
    std::vector<CChordLite> chords;
    std::istringstream words(bar);
    for (std::string word; words >> word;) chords.push_back(ReadChordText(word).mChord);
    return chords;
}

}  // namespace

CHarmAnlsChords BarsOf(std::string_view text) {
    CHarmAnlsChords chords;
    std::istringstream bars{std::string(text)};
    double position = 0.0;
    for (std::string bar; std::getline(bars, bar, '|'); position += 4.0) {
        const std::vector<CChordLite> inBar = ChordsOf(bar);
        for (std::size_t i = 0; i < inBar.size(); ++i) {
            const double part = static_cast<double>(i) / static_cast<double>(inBar.size());
            chords.emplace_back(inBar[i], position + 4.0 * part);
        }
    }
    chords.emplace_back(CChordLite_Undef, position);
    return chords;
}

std::string ShortKey(const CSignKeyLite& key) {
    if (key.IsUndef()) return {};
    std::string name = key.NameShort(ChordNamePrefsNonUTF8);
    if (key.mSignKeyType != TSignKeyType_Minor) return name;
    name.pop_back();
    name[0] = static_cast<char>(name[0] - 'A' + 'a');
    return name;
}

std::string ReadingText(const CSongReading& reading) {
    std::string text;
    CSignKeyLite key;
    for (const CChordReading& chord : reading.mChords) {
        if (chord.mKey.IsUndef()) continue;
        if (!text.empty()) text += ' ';
        if (!(chord.mKey == key)) text += ShortKey(chord.mKey) + ": ";
        key = chord.mKey;
        text += chord.mNumeral + '~' + std::string(NameOf(chord.mRelation));
        if (chord.mDeceptive) text += '!';
        if (chord.mResolvesTo >= 0) text += '>' + std::to_string(chord.mResolvesTo);
    }
    return text;
}

}  // namespace brindle::test
