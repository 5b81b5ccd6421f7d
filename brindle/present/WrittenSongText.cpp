// SPDX-License-Identifier: MIT
#include "brindle/present/WrittenSongText.h"

#include "brindle/present/CJsonWriter.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/MarkovText.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/TonalityName.h"
#include "brindle/song/ReadSongHarmony.h"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr int kBarsPerLine = 4;

double SectionEnd(const CSong& song, std::size_t section) {
    return section + 1 < song.mSections.size() ? song.mSections[section + 1].mPosition
                                               : song.mChords.back().mPosition;
}

/// The chords that begin in a passage.
std::string PassageText(const CSong& song, double begin, double end) {
    CMarkovObjects store;
    MarkovSequence sequence;
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const CHarmAnlsChordWithPos& chord = song.mChords[ix];
        if (chord.mPosition < begin || chord.mPosition >= end) continue;
        CMarkovObject object;
        object.mChord =
            CHarmAnlsChordWithLength(chord, song.mChords[ix + 1].mPosition - chord.mPosition);
        sequence.push_back(store.insertObjectIfUnique(object));
    }
    return BarsText(sequence, CMarkovSpelling(CSignKeyLite_Undef),
                    static_cast<int>(song.mBeatsPerBar), kBarsPerLine) +
           '\n';
}

std::string SectionAt(const CSong& song, double position) {
    std::string name;
    for (const CSongSection& section : song.mSections) {
        if (section.mPosition <= position) name = section.mName;
    }
    return name;
}

Json QuoteToJson(const CWrittenQuote& quote) {
    if (quote.mBars <= 0.0) return nullptr;
    return Json{{"Title", quote.mTitle},
                {"SourceBar", quote.mSourceBar},
                {"Bar", quote.mBar},
                {"Bars", quote.mBars}};
}

}  // namespace

std::string WrittenSongText(const CSong& song) {
    if (song.mChords.empty()) return {};
    if (song.mSections.empty()) return PassageText(song, 0.0, song.mChords.back().mPosition);
    std::string text;
    for (std::size_t ix = 0; ix < song.mSections.size(); ++ix) {
        text += fmt::format("{}[{}]\n", ix == 0 ? "" : "\n", song.mSections[ix].mName);
        text += PassageText(song, song.mSections[ix].mPosition, SectionEnd(song, ix));
        // Without a bar line the next part would go on in this bar.
        if (ix + 1 < song.mSections.size()) text.insert(text.size() - 1, " |");
    }
    return text;
}

std::string QuoteText(const CWrittenQuote& quote) {
    if (quote.mBars <= 0.0) return {};
    return fmt::format("the longest quote: {} {} from bar {} on, in {} from bar {} on",
                       ShortNumber(quote.mBars), quote.mBars == 1.0 ? "bar" : "bars",
                       ShortNumber(std::floor(quote.mBar)),
                       quote.mTitle.empty() ? "a song without a title" : quote.mTitle,
                       ShortNumber(std::floor(quote.mSourceBar)));
}

std::string WrittenSongFault(const CWrittenSong& written, std::string_view sign) {
    const auto& wishes = written.mContradiction;
    if (wishes.empty()) return written.mFault;
    const std::string between = fmt::format("; {}", sign);
    return fmt::format(
        "{}: {}{}",
        wishes.size() == 1 ? "this wish cannot be met" : "these wishes cannot be met together",
        sign, Printable(fmt::format("{}", fmt::join(wishes, between))));
}

std::string WrittenSongJson(const CWrittenSong& written, const std::string& form,
                            std::uint64_t seed) {
    const CSong& song = written.mSong;
    const CSongReading reading = ReadSongHarmony(song);
    Json chords = Json::array();
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const CHarmAnlsChordWithPos& chord = song.mChords[ix];
        chords.push_back({{"Symbol", song.mSymbols[ix]},
                          {"Position", chord.mPosition},
                          {"Length", song.mChords[ix + 1].mPosition - chord.mPosition},
                          {"Section", SectionAt(song, chord.mPosition)},
                          {"Numeral", reading.mChords[ix].mNumeral},
                          {"Function", std::string(NameOf(reading.mChords[ix].mFunction))}});
    }
    return JsonText({{"Key", TonalityName(*song.mStatedKey)},
                     {"Form", form},
                     {"Bars", song.mBars.size()},
                     {"BeatsPerBar", song.mBeatsPerBar},
                     {"Seed", seed},
                     {"Text", WrittenSongText(song)},
                     {"Chords", chords},
                     {"LongestQuote", QuoteToJson(written.mLongestQuote)}});
}

}  // namespace brindle
