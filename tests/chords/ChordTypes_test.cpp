// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include "brindle/chords/CChordTypes.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// [list, name of the row]
json FormOf(const CChordTypes::TFound& found) {
    const auto& [list, row] = found;
    return {static_cast<int>(list), list == TChordTypeVec_None ? std::string() : row->mName};
}

}  // namespace

TEST_CASE("The catalogue of chord types is found by name and by tones") {
    const CChordTypes& types = _s_chordTypes();
    CHECK(types.BuiltIn().size() == 30);
    CheckExpected(
        "chord_types",
        {{"CChordTypes",
          [&](const json& in) {
              const CChordType& row = types.BuiltIn().at(in.at(0).get<std::size_t>());
              return json{row.mId, row.mName, row.mIntvls};
          }},
         {"CChordTypes::ChordTypeFromId",
          [&](const json& in) { return FormOf(types.ChordTypeFromId(in.at(0).get<int>())); }},
         {"CChordTypes::FindChordTypeVecAndChordTypeFromIntvls",
          [&](const json& in) {
              return FormOf(types.FindChordTypeVecAndChordTypeFromIntvls(IntvlSetOf(in.at(0))));
          }},
         {"CChordTypes::FindChordTypeVecAndChordTypeFromChord", [&](const json& in) {
              return FormOf(types.FindChordTypeVecAndChordTypeFromChord(AnyChordOf(in.at(0))));
          }}});
}

TEST_CASE("Rows of the host are found after the built-in ones") {
    CChordTypes types;
    CHECK(FormOf(types.FindChordTypeVecAndChordTypeFromIntvls({})) == json{0, ""});
    types.User().emplace_back(4, "nothing", CIntvlSet());
    types.User().emplace_back(1, "my major", CIntvlSet(0, 4, 7));
    CHECK(FormOf(types.FindChordTypeVecAndChordTypeFromIntvls({})) == json{2, "nothing"});
    CHECK(FormOf(types.FindChordTypeVecAndChordTypeFromIntvls({0, 4, 7})) == json{1, "major"});
    CHECK(FormOf(types.ChordTypeFromId(4)) == json{2, "nothing"});
    CHECK(FormOf(types.ChordTypeFromId(1)) == json{1, "major"});
    CHECK(types.ChordTypeUserFromId(1)->mName == "my major");
    CHECK(types.ChordTypeUserFromId(9) == types.User().end());
    CHECK(types.ChordTypeBuiltInFromId(4) == types.BuiltIn().end());
}
