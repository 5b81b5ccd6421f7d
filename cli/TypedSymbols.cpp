// SPDX-License-Identifier: MIT
#include "cli/TypedSymbols.h"

#include "cli/Input.h"
#include "cli/Message.h"
#include "cli/TypedChords.h"

#include "brindle/platform/Ascii.h"
#include "brindle/song/ReadSong.h"

#include <algorithm>

namespace brindle::cli {
namespace {

// What a song has between its symbols, and what is no symbol itself.
bool IsBarLineOrHold(const std::string& word) {
    return !word.empty() && (word == "." || word.find_first_not_of("|:") == word.npos);
}

// Whether a text is a song in a form that no list of symbols looks like.
bool IsNoList(TSongFormat format) {
    return IsScore(format) || format == TSongFormat_ChordPro || format == TSongFormat_ChartLink ||
           format == TSongFormat_ChartPage;
}

std::optional<std::vector<std::string>> SymbolsOfSong(std::string_view text,
                                                      const std::string& name) {
    const CSong song = ReadSong(text);
    PrintFaults(text, song.mFaults, false, name);
    if (song.HasFault()) return std::nullopt;
    std::vector<std::string> symbols;
    for (std::size_t i = 0; i + 1 < song.mChords.size() && i < song.mSymbols.size(); ++i) {
        if (!song.mSymbols[i].empty()) symbols.push_back(song.mSymbols[i]);
    }
    return symbols;
}

// The symbols of an input, be it a list of them or a song in any form.
std::optional<std::vector<std::string>> ReadSymbolsFrom(const std::string& input) {
    const auto text = ReadTextInput(input);
    if (!text) return std::nullopt;
    auto symbols =
        IsNoList(SongFormatOf(*text)) ? SymbolsOfSong(*text, InputName(input)) : SymbolsOf(*text);
    if (!symbols || !symbols->empty()) return symbols;
    Fail(TStatus::BadInput, Message("{name} has no chord symbols", {{"name", InputName(input)}}));
    return std::nullopt;
}

}  // namespace

std::vector<std::string> SymbolsOf(std::string_view text) {
    std::vector<std::string> symbols = WordsOf(text);
    std::erase_if(symbols, IsBarLineOrHold);
    return symbols;
}

std::optional<std::vector<std::string>> TypedSymbols(const std::vector<std::string>& words) {
    std::vector<std::string> symbols;
    for (const std::string& word : words) {
        // Between chords "-" is one of their signs.
        const bool isInput = word == "-" ? words.size() == 1 : AreInputs({word});
        if (!isInput) {
            symbols.push_back(word);
            continue;
        }
        const auto read = ReadSymbolsFrom(word);
        if (!read) return std::nullopt;
        symbols.insert(symbols.end(), read->begin(), read->end());
    }
    std::erase_if(symbols, IsBarLineOrHold);
    const bool hasAny = std::any_of(symbols.begin(), symbols.end(), [](const std::string& symbol) {
        return !Ascii::Trimmed(symbol).empty();
    });
    if (hasAny) return symbols;
    Fail(TStatus::BadInput, Message("there are no chord symbols"));
    return std::nullopt;
}

}  // namespace brindle::cli
