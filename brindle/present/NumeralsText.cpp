// SPDX-License-Identifier: MIT
#include "brindle/present/NumeralsText.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/ShownText.h"

namespace brindle {

std::string NumeralWordsText(const std::vector<CNumeralWord>& words, const CSignKeyLite& key,
                             bool toChords, const CNumeralOptions& options) {
    std::vector<std::string> numerals;
    if (!toChords) numerals = NumeralsOfWords(words, key, options);
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (i > 0) text += words[i].mLine == words[i - 1].mLine ? ' ' : '\n';
        if (words[i].mChord.IsUndef()) {
            text += Printable(words[i].mText);
        } else {
            text += toChords ? WriteChordSymbol(words[i].mChord) : numerals[i];
        }
    }
    return text + '\n';
}

}  // namespace brindle
