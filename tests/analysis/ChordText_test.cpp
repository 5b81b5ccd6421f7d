// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"
#include "brindle/analysis/TChordStringParse.h"

#include <doctest/doctest.h>

#include <cmath>
#include <random>
#include <regex>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

using TPieces = std::vector<std::string>;

/// [text, beats per bar, beats per chord, bar tokens, hold tokens]
json Parse(const json& in) {
    TChordStringParse parse;
    parse.mBeatsPerBar = in.at(1);
    parse.mBeatsPerChord = in.at(2);
    parse.mBarTokens = in.at(3).get<TPieces>();
    parse.mHoldTokens = in.at(4).get<TPieces>();
    auto form = json::array();
    for (const auto& chord : CHarmAnlsChords(in.at(0).get<std::string>(), parse)) {
        CHECK(chord.mRootDistToHarmCenter == -1);
        CHECK(chord.mBassDistToHarmCenter == -1);
        form.push_back({chord.mPosition, test::FormOf(chord.mRootKeyEnh),
                        test::FormOf(chord.mBassKeyEnh), chord.mSemitones.Mask()});
    }
    return form;
}

json Correct(const json& in) {
    auto tokens = in.at(0).get<TPieces>();
    ParseStringIntoHarmAnlsChords::_CorrectTokenizationOf(tokens);
    return tokens;
}

/// The pieces as the standard library splits the whole text in one go.
TPieces SplitByTokenIterator(const std::string& text, const std::regex& regex) {
    return {std::sregex_token_iterator(text.begin(), text.end(), regex, -1), {}};
}

std::string RandomText(std::mt19937& random, std::string_view characters, std::size_t length) {
    std::string text;
    while (text.size() < length) {
        // Runs, so that separators get long.
        const char c = characters[random() % characters.size()];
        text.append(1 + random() % 6, c);
    }
    return text;
}

}  // namespace

TEST_CASE("A chord text becomes chords in time") {
    CheckExpected("chord_strings",
                  {{"ParseStringIntoHarmAnlsChords::ParseIntoChords", Parse},
                   {"ParseStringIntoHarmAnlsChords::_CorrectTokenizationOf", Correct}});
}

TEST_CASE("A separator splits a text as the regular expression does, the default by hand too") {
    std::mt19937 random(20240611);
    for (const char* pattern :
         {"\\s+", " ", "[ ,]+", "\\s*,\\s*", "a|ab", "x*", "\\b", "^C", "m$", ""}) {
        const std::regex regex(pattern);
        for (const std::size_t length : {1U, 3U, 40U, 700U, 3000U}) {
            for (int i = 0; i < 8; ++i) {
                const std::string text = RandomText(random, " \t\n,Cabmx\xC2\xA0", length);
                INFO("pattern " << pattern << " text \"" << text << "\"");
                const TPieces expected = SplitByTokenIterator(text, regex);
                CHECK(CSeparatorPattern(pattern).Split(text) == expected);
                CHECK(CSeparatorPattern(regex).Split(text) == expected);
            }
        }
    }
}

TEST_CASE("A separator pattern that cannot be read, or is hard to match, does no harm") {
    const std::string text = "C F G";
    for (const char* pattern : {"[", "(", "*", "a{2,1}", static_cast<const char*>(nullptr)}) {
        CHECK(CSeparatorPattern(pattern).Split(text) == TPieces{text});
    }
    // Matched in one go, these would recurse once for each comma, or take the square of their
    // number.
    const std::string commas(30'000, ',');
    CHECK(CSeparatorPattern("(,|;)+").Split(commas + "C").back() == "C");
    CHECK(CSeparatorPattern(",+;").Split(commas) == TPieces{commas});
}

TEST_CASE("A text of a hundred thousand chords, or of as many blanks, is read in one pass") {
    std::string text;
    for (int i = 0; i < 50'000; ++i) text += "C maj7 F7 |\n";
    TChordStringParse parse;
    const CHarmAnlsChords chords(text, parse);
    REQUIRE(chords.size() == 100'001);
    CHECK(chords.back().mPosition == 200'000.0);
    CHECK(CHarmAnlsChords(std::string(1'000'000, ' '), parse).empty());
    parse.mSeparator = std::regex("[ \\n]+");
    CHECK(CHarmAnlsChords(text, parse) == chords);
}

TEST_CASE("Bars and steps without length keep the reader going") {
    TChordStringParse parse;
    parse.mBeatsPerBar = 0.0;
    parse.mBeatsPerChord = -1.0;
    const CHarmAnlsChords chords("C F | G", parse);
    REQUIRE(chords.size() == 4);
    CHECK(chords[1].mPosition == -1.0);
    CHECK(std::isnan(chords[2].mPosition));
}
