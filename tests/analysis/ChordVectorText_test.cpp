// SPDX-License-Identifier: MIT
#include "brindle/analysis/ChordVectorText.h"
#include "brindle/analysis/CHarmAnlsChordForMetro.h"

#include <doctest/doctest.h>
#include <sstream>
#include <string>

using namespace brindle;

namespace {

const std::string kCOverE = "000 100000000000 1000000 000000000000 000010000000";

}  // namespace

TEST_CASE("A vector is read from digits, from a JSON list and from the JSON text of a chord") {
    CHarmAnlsChordForMetro chord(CChordLite({0, TEnh_n}, {4, TEnh_n}, CSemitones{0, 4, 7}));
    const std::vector<float> vector = chord.GetChordVectorRepresentation();
    CHECK(WriteChordVector(vector) == kCOverE);
    std::string list = "[0,0,0,1.0";
    for (int place = 4; place < 46; ++place) list += place == 15 || place == 38 ? ",1" : ",0";
    chord.mWriteVectorRep = true;
    std::ostringstream json;
    json << chord;
    std::string lines = kCOverE;
    for (char& c : lines) c = c == ' ' ? '\n' : c;
    for (const std::string& text : {kCOverE, lines, " ,\t" + list + "]", json.str()}) {
        CAPTURE(text);
        const CChordVectorText read = ReadChordVector(text);
        CHECK(read.mError.empty());
        CHECK(read.mVector == vector);
    }
}

TEST_CASE("A text that is no vector tells what is wrong, and where") {
    struct CCase {
        std::string mText;
        const char* mError;
        std::size_t mColumn;
    };
    const CCase cases[] = {
        {"", "a vector has 46 places, here are 0", 0},
        {kCOverE + "1", "a vector has 46 places, here are 47", 0},
        {"000 12", "a place of a vector is 0 or 1", 5},
        {"[0, 0.5]", "a place of a vector is 0 or 1", 0},
        {"[\"1\"]", "a place of a vector is 0 or 1", 0},
        {"[[[[", "this is no JSON list of the places of a vector", 0},
        {"{\"VectorRep\": 7}", "this is no JSON list of the places of a vector", 0},
        {"{}", "this is no JSON list of the places of a vector", 0},
    };
    for (const auto& [text, error, column] : cases) {
        const auto& logged = text;
        CAPTURE(logged);
        const CChordVectorText read = ReadChordVector(text);
        CHECK(read.mVector.empty());
        CHECK(read.mError == error);
        CHECK(read.mColumn == column);
    }
}

TEST_CASE("A chord that was read from a vector gives this vector again") {
    for (std::uint64_t mask = 0; mask < 4096; ++mask) {
        const CHarmAnlsChordForMetro chord(CChordLite({7, TEnh_n}, {11, TEnh_n}, CSemitones(mask)));
        CHarmAnlsChordForMetro read;
        read.SetFromChordVectorRepresentation(chord.GetChordVectorRepresentation());
        CAPTURE(mask);
        REQUIRE(read.GetChordVectorRepresentation() == chord.GetChordVectorRepresentation());
    }
}

TEST_CASE("The groups of a vector may be words of their own, between chords and other vectors") {
    using TWords = std::vector<std::string>;
    const std::vector<std::string> groups{"000", "100000000000", "1000000", "000000000000",
                                          "000010000000"};
    TWords typed{"C/E"};
    for (int i = 0; i < 2; ++i) typed.insert(typed.end(), groups.begin(), groups.end());
    typed.emplace_back("G7");
    CHECK(JoinChordVectors(typed) == TWords{"C/E", kCOverE, kCOverE, "G7"});
    CHECK(JoinChordVectors(TWords{}).empty());
    CHECK(BeginsAsChordVector("[0,1]"));
    CHECK_FALSE(BeginsAsChordVector("C/E"));
    CHECK_FALSE(BeginsAsChordVector(""));
}
