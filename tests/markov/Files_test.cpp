// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "tests/support/Expected.h"

#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <sstream>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;

/// A file that is gone at the end of the test.
class CScratchFile {
public:
    CScratchFile()
        : mPath((std::filesystem::temp_directory_path() / "brindle_markov_test.json").string()) {}
    CScratchFile(const CScratchFile&) = delete;
    CScratchFile& operator=(const CScratchFile&) = delete;
    ~CScratchFile() { std::filesystem::remove(mPath); }

    [[nodiscard]] const std::string& Path() const { return mPath; }
    [[nodiscard]] std::string Content() const { return ReadWholeFile(mPath).value_or("no file"); }

private:
    std::string mPath;
};

json Saved(const json& in) {
    const CScratchFile file;
    ModelOf(in).SaveToFile(file.Path());
    return file.Content();
}

json LoadedAndSaved(const json& in) {
    const CScratchFile file;
    const auto saved = ModelOf(in);
    saved.SaveToFile(file.Path());
    VariableLengthMarkovModel loaded;
    Helper::VariableLengthMarkovModelFromJSONFile(file.Path(), loaded);
    loaded.SaveToFile(file.Path());
    return {{"text", file.Content()}, {"equal", loaded == saved}};
}

}  // namespace

TEST_CASE("A saved model is read back with its symbols, counts and window") {
    CheckExpected("markov_files", {
                                      {"VariableLengthMarkovModel::SaveToFile", Saved},
                                      {"LoadAndSave", LoadedAndSaved},
                                  });
}

TEST_CASE("A text that is no model file gives an empty model") {
    const std::vector<std::string> texts{
        "",
        "{",
        "[]",
        "12",
        "{}",
        R"({"VariableLengthMarkovModel":[1]})",
        R"({"VariableLengthMarkovModel":{"MaxHistoryLength":2,"CMarkovObjects":[{"Type":4})",
        R"({"VariableLengthMarkovModel":{"CMarkovObjects":{},"TransitionMap":7,"History":null}})",
        R"({"VariableLengthMarkovModel":{"MaxHistoryLength":[],"CMarkovObjects":"x"}})",
        R"({"VariableLengthMarkovModel":{"MaxHistoryLength":-3}})",
        std::string(100000, '['),
    };
    for (const std::string& text : texts) {
        INFO(text.substr(0, 100));
        VariableLengthMarkovModel model(3);
        Learn(model, "(4,C);(4,G)");
        Helper::VariableLengthMarkovModelFromJSONString(text, model);
        CHECK(model == VariableLengthMarkovModel());
    }
}

TEST_CASE("Entries that name no symbol are left out, and the order of members does not matter") {
    const std::string text = R"({"Else":{"TransitionMap":[[[0],[[0,9]]]]},
        "VariableLengthMarkovModel":{"History":[1,"x",7,-1,0],
        "TransitionMap":[[[0],[[0,99]]]],
        "TransitionMap":[
            [[0,1],[[1,2],[9,5],[0],7,["x",1],[-1,3],[0,1]]], [[0,9],[[0,1]]], [[0,-1],[[0,1]]],
            [[1,0],[]], [[1,0]], [], 5, {"a":1}, [[99999999999999999999,0],[[0,1]]],
            [[1,1],[[1,4294967295]]]],
        "CMarkovObjects":[{"Type":4},{"Type":5}],
        "MaxHistoryLength":2}})";
    VariableLengthMarkovModel model;
    Helper::VariableLengthMarkovModelFromJSONString(text, model);
    CHECK(model.mMaxHistoryLength == 2);
    CHECK(test::FormOf(model.mHistory) == json{1, 0});
    auto transitions = json::array();
    for (const CMarkovTransitions* const entry : model.mTransitionMap.InOrder()) {
        transitions.push_back({test::FormOf(entry->mHistory), TableForm(entry->mCounts)});
    }
    // Counts of 32 bits: 2 + 4294967295 is 1.
    CHECK(transitions == json::parse("[[[0],[]],[[0,1],[[0,1],[1,2]]],[[1],[[0,1],[1,1]]],"
                                     "[[1,0],[]],[[1,1],[[1,4294967295]]]]"));

    VariableLengthMarkovModel fromDictionary;
    Helper::VariableLengthMarkovModelFromJSONDictionary(
        json::parse(text).at("VariableLengthMarkovModel"), fromDictionary);
    CHECK(fromDictionary == model);
}

TEST_CASE("A history without a valid successor keeps its empty table") {
    for (const char* const entry : {"[[0,1],[]]", "[[0,1],[[9,1],[-1,2],\"x\"]]", "[[0,1]]"}) {
        CAPTURE(entry);
        VariableLengthMarkovModel model;
        Helper::VariableLengthMarkovModelFromJSONString(
            std::string(R"({"VariableLengthMarkovModel":{"MaxHistoryLength":2,)"
                        R"("CMarkovObjects":[{"Type":4},{"Type":5}],"History":[],)"
                        R"("TransitionMap":[)") +
                entry + "]}}",
            model);
        auto histories = json::array();
        for (const CMarkovTransitions* const known : model.mTransitionMap.InOrder()) {
            CHECK(known->mCounts.empty());
            histories.push_back(test::FormOf(known->mHistory));
        }
        CHECK(histories == json::parse("[[0,1],[1]]"));
        const std::string written = JSONStringOf(model);
        CHECK(written.find("[\n[   0,   1],[]\n]") != std::string::npos);
        MarkovProbabilities table;
        model.ProbabilitiesForNextSymbol(std::uint64_t{1}, table);
        CHECK(table.empty());
    }
}

TEST_CASE("Symbols read as they were written, but for gaps") {
    const auto again = [](const CMarkovObject& object) {
        std::ostringstream stream;
        object.AppendJSONString(stream);
        return CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONString(stream.str());
    };
    const CMarkovObject chord = SymbolsOf("(1.5,Ebm7/Db)").at(0);
    CHECK(again(chord) == chord);
    CHECK(again(CMarkovObject_Start) == CMarkovObject_Start);
    CHECK(again(CMarkovObject_End) == CMarkovObject_End);
    CHECK(again(CMarkovObject_Gap) == CMarkovObject());
    CHECK(CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONString(
              R"({"Type":7,"Index":12})")
              .mIndex == 12);
    // What has a chord without values has one of values 0.
    const auto empty =
        CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONString(R"({"Type":1})");
    CHECK(empty.mChord.mLength == 0.0);
    CHECK(empty.mChord.mRootDistToHarmCenter == 0);
    CHECK(empty.mChord.mRootKeyEnh.mKeyNr == 0);
    CMarkovObject indexed;
    indexed.mType = TMarkovObjectType_Indexed;
    indexed.mIndex = 3;
    CHECK(JSONStringOf(indexed) == "{\"Type\":7,\n\"Index\":3,\n}");
    indexed.mType = TMarkovObjectType_Number;
    CHECK(JSONStringOf(indexed) == "{\"Type\":2,\n}");
}

TEST_CASE("A model that cannot be read or written changes nothing") {
    VariableLengthMarkovModel model(2);
    Learn(model, "(4,C);(4,G)");
    const std::string before = JSONStringOf(model);
    CHECK_FALSE(Helper::VariableLengthMarkovModelFromJSONFile("/no/such/file.json", model));
    CHECK(JSONStringOf(model) == before);
    CHECK_FALSE(model.SaveToFile("/no/such/folder/model.json"));
}

TEST_CASE(
    "A file of a hundred thousand symbols behind one another in falling order is read at once") {
    constexpr int count = 100000;
    std::string objects = R"({"Type":4})";
    std::string entries;
    for (int ix = 1; ix <= count; ++ix) {
        objects += R"(,{"Type":7,"Index":)" + std::to_string(-ix) + "}";
        entries += (ix == 1 ? "[[0],[[" : ",[") + std::to_string(ix) + ",1]";
    }
    VariableLengthMarkovModel model;
    Helper::VariableLengthMarkovModelFromJSONString(
        R"({"VariableLengthMarkovModel":{"MaxHistoryLength":1,"CMarkovObjects":[)" + objects +
            R"(],"TransitionMap":[)" + entries + "]]],\"History\":[0]}}",
        model);
    MarkovProbabilities table;
    model.ProbabilitiesForNextSymbol(table);
    CHECK(table.size() == count);
    CHECK(table.begin()->first->mIndex == -count);
}
