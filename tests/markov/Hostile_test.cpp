// SPDX-License-Identifier: MIT
// Model files and symbols that would make a careless reader crash, or work for hours.

#include "MarkovForms.h"

#include <doctest/doctest.h>

#include <limits>
#include <map>
#include <utility>

using namespace brindle;
using namespace brindle::test;

namespace {

using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;

VariableLengthMarkovModel Read(const std::string& members) {
    VariableLengthMarkovModel model;
    Helper::VariableLengthMarkovModelFromJSONString(
        R"({"VariableLengthMarkovModel":{)" + members + "}}", model);
    return model;
}

std::string Repeated(const std::string& text, int count) {
    std::string repeated;
    for (int n = 0; n < count; ++n) repeated += text;
    return repeated;
}

}  // namespace

TEST_CASE("Deeply nested and long lists in a model file are read in linear time") {
    const std::string nested = Repeated("[", 300000) + Repeated("]", 300000);
    const auto model = Read(R"("CMarkovObjects":[{"Type":1,"CHarmAnlsChordWithLength":)" + nested +
                            R"(},)" + Repeated("{},", 200000) +
                            R"({"Type":4}],"TransitionMap":[[[2],[[1,5]]]],"MaxHistoryLength":1)");
    REQUIRE(model.mObjects.size() == 3);
    CHECK(model.mObjects.begin()->mChord.mLength == 0.0);
    const auto* const counts = model.mTransitionMap.Find(MarkovSequence{model.mObjects.At(2)});
    REQUIRE(counts != nullptr);
    CHECK(TableForm(*counts) == nlohmann::json::parse("[[1,5]]"));
}

TEST_CASE("A model file cannot ask for histories without end") {
    const auto model = Read(R"("MaxHistoryLength":2147483647,"CMarkovObjects":[{"Type":4}],)"
                            R"("TransitionMap":[[[0)" +
                            Repeated(",0", 300) + R"(],[[0,1]]],[[0],[[0,2]]]])");
    CHECK(model.mMaxHistoryLength == 256);
    CHECK(model.mTransitionMap.size() == 1);
}

TEST_CASE("Counts that learning does not give are read as they are, and told") {
    struct CRow {
        const char* mCounts;
        const char* mRead;
        bool mIsUsual;
    };
    const CRow rows[] = {
        {"[[0,1],[1,3]]", "[[0,1],[1,3]]", true},
        {"[[0,2147483647]]", "[[0,2147483647]]", true},
        {"[[0,2147483647],[1,1]]", "[[0,2147483647],[1,1]]", false},
        {"[[0,0],[1,3]]", "[[0,0],[1,3]]", false},
        {"[[0,1],[1,-1]]", "[[0,1],[1,4294967295]]", false},
        {"[[0,4294967295]]", "[[0,4294967295]]", false},
        {"[[0,1.5],[1,\"3\"],[1,null]]", "[]", true},
        {"[]", "[]", true},
    };
    for (const CRow& row : rows) {
        INFO(row.mCounts);
        const auto model =
            Read(R"("CMarkovObjects":[{"Type":4},{"Type":5}],"TransitionMap":[[[1,0],)" +
                 std::string(row.mCounts) + "]]");
        const auto* const counts = model.mTransitionMap.Find(MarkovSequence{model.mObjects.At(0)});
        REQUIRE(counts != nullptr);
        CHECK(TableForm(*counts) == nlohmann::json::parse(row.mRead));
        CHECK(model.mTransitionMap.HasUsualCounts() == row.mIsUsual);
    }
}

TEST_CASE("A transition map that is no list is none") {
    CHECK(Read(R"("CMarkovObjects":[{"Type":4}],"TransitionMap":{"a":[[0],[[0,2]]]})")
              .mTransitionMap.empty());
}

TEST_CASE("Symbols whose length is no number have a place of their own") {
    constexpr double noNumber = std::numeric_limits<double>::quiet_NaN();
    VariableLengthMarkovModel model;
    MarkovProbabilities table;
    for (const double length : {2.0, noNumber, 4.0}) {
        CMarkovObject chord = SymbolsOf("(1,C)").at(0);
        chord.mChord.mLength = length;
        table[model.mObjects.insertObjectIfUnique(chord)] = 1.0;
    }
    CHECK(TableForm(table) == nlohmann::json::parse("[[1,1.0],[0,1.0],[2,1.0]]"));
    CHECK(VariableLengthMarkovModel::GetMaxLengthFromProbabilities(table) == 4);
}

TEST_CASE("Symbols that follow in descending order are counted in order, without n squared steps") {
    constexpr int count = 100'000;
    CMarkovObjects symbols;
    CMarkovObject chord = SymbolsOf("(1,C)").at(0);
    MarkovSequence sequence;
    for (int length = 1; length <= count; ++length) {
        chord.mChord.mLength = length;
        sequence.push_back(symbols.insertObjectIfUnique(chord));
    }
    MarkovCounts counts;
    for (int ix = count; ix-- > 0;) counts[sequence[static_cast<std::size_t>(ix)]] += 2;
    CHECK(counts.begin()->first == sequence.front());
    for (int ix = count - 3; ix >= 0; ix -= 3) ++counts[sequence[static_cast<std::size_t>(ix)]];

    REQUIRE(counts.size() == count);
    std::size_t place = 0;
    for (const auto& [symbol, times] : counts) {
        if (symbol != sequence[place] || times != (place % 3 == (count - 3) % 3 ? 3 : 2)) break;
        ++place;
    }
    CHECK(place == count);
}

TEST_CASE("Symbols in any order, some of them alike, are counted as in a map") {
    CMarkovObjects symbols;
    CMarkovObject chord = SymbolsOf("(1,C)").at(0);
    MarkovCounts counts;
    std::map<MarkovIterator, std::uint32_t, CMarkovLess> wanted;
    std::uint32_t number = 1;
    for (int step = 0; step < 5000; ++step) {
        number = number * 1664525 + 1013904223;
        chord.mChord.mLength = number >> 21;
        const MarkovIterator symbol = symbols.insertObjectIfUnique(chord);
        counts[symbol] += number & 3;
        wanted[symbol] += number & 3;
        const bool isRead = step % 97 == 0 || step % 64 == 1;
        if (isRead) REQUIRE(TableForm(counts) == TableForm(wanted));
    }
    CHECK(TableForm(counts) == TableForm(wanted));
}

TEST_CASE("A model that was moved from is empty and can learn again") {
    VariableLengthMarkovModel model(2);
    Learn(model, "(1,C);(1,F)");
    const MarkovSequence history{model.mObjects.At(1)};
    const VariableLengthMarkovModel moved = std::move(model);
    CHECK(moved.mTransitionMap.Find(history) != nullptr);
    CHECK(model.mTransitionMap.empty());
    CHECK(model.mTransitionMap.Find(history) == nullptr);
    model = VariableLengthMarkovModel(2);
    Learn(model, "(1,C);(1,F)");
    CHECK(model == moved);
}
