// SPDX-License-Identifier: MIT
// Model files and symbols that would make a careless reader crash, or work for hours.

#include "MarkovForms.h"

#include <doctest/doctest.h>

#include <limits>

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
