// SPDX-License-Identifier: MIT
#include "tests/guitarchords/LibraryForms.h"
#include "tests/support/Expected.h"

#include "brindle/platform/Localization.h"

#include <doctest/doctest.h>

#include <fstream>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

json Read(const json& in) {
    GChDatabase database;
    const bool answer = database.readOneRegularFile(BytesOfHex(in.at(0).get<std::string>()), {});
    return {{"readOneRegularFile", answer}, {"tunings", FormOf(database)}};
}

std::size_t CountChords(const json& tunings) {
    std::size_t count = 0;
    for (const json& tuning : tunings) {
        for (const json& library : tuning.at("libraries"))
            count += library.at("basicChords").size();
    }
    return count;
}

/// What a damaged file must give; members that are missing are left open.
void CheckDamaged(const json& expected, const json& got) {
    const std::size_t chords = CountChords(got.at("tunings"));
    for (const auto& [name, value] : expected.items()) {
        if (name == "numberOfChords") {
            CHECK(chords == value.get<std::size_t>());
        } else if (name == "chordsAtMost") {
            CHECK(chords <= value.get<std::size_t>());
        } else {
            CHECK(got.at(name) == value);
        }
    }
}

// A library of one guitar chord, "T" and "L" being the names: the head, and a chord chunk.
const std::string kHead =
    "676368540000000000000000"
    "0000001e0a05000034393e43474c00000008feff005400000008feff004c";
const std::string kChord = "000000160e0001030011000000000000081100000004";

}  // namespace

TEST_CASE("A library is written byte by byte in the layout of its file") {
    CheckExpected("guitar_library_written",
                  {{"wholeLibraryFileContent", [](const json& in) {
                        const json& form = in.at(0);
                        const auto tuning =
                            std::make_shared<GChTuning>(ShortTuningOf(form.at("shortTuning")));
                        return HexOfBytes(LibraryOf(form, tuning)->wholeLibraryFileContent());
                    }}});
}

TEST_CASE("What is read from a library file is written again, and damaged files are refused") {
    CheckExpected("guitar_library_files", {{"readOneRegularFile", Read}});
}

TEST_CASE("Of damaged library files all is kept that can be read") {
    std::ifstream stream(BRINDLE_TEST_DATA "/expected/guitar_malformed_files.jsonl");
    std::string line;
    REQUIRE(std::getline(stream, line));
    int cases = 0;
    while (std::getline(stream, line)) {
        const json test = json::parse(line);
        INFO(test.at("case").get<std::string>());
        CheckDamaged(test.at("out"), Read(test.at("in")));
        ++cases;
    }
    CHECK(cases == 26);
}

TEST_CASE("A file that is cut anywhere is read as far as it goes") {
    const std::string whole = BytesOfHex(kHead + kChord + kChord);
    for (std::size_t length = 0; length <= whole.size(); ++length) {
        GChDatabase database;
        database.readOneRegularFile(whole.substr(0, length), {});
        const auto libraries = database.allLibrariesForAnyTuning();
        const std::size_t chords = libraries.empty() ? 0 : libraries[0]->basicChords().size();
        CHECK(libraries.size() == (length >= BytesOfHex(kHead).size() ? 1 : 0));
        CHECK(chords == (length == whole.size() ? 2 : length >= whole.size() - 22 ? 1 : 0));
    }
}

TEST_CASE("A damaged name of the library leaves its tuning, one of the tuning leaves nothing") {
    std::string libraryName = BytesOfHex(kHead);
    libraryName[libraryName.size() - 5] = 3;
    std::string tuningName = BytesOfHex(kHead);
    tuningName[29] = 3;
    const auto tuningsOf = [](const std::string& bytes) {
        GChDatabase database;
        CHECK_FALSE(database.readOneRegularFile(bytes, {}));
        CHECK(database.allLibrariesForAnyTuning().empty());
        return database.tunings().size();
    };
    CHECK(tuningsOf(libraryName) == 1);
    CHECK(tuningsOf(tuningName) == 0);
    CHECK(tuningsOf("gchX" + libraryName.substr(4)) == 0);
}

TEST_CASE("Names in files have their translations") {
    GChDatabase database;
    database.setLocalizedDefaultTuningName("Standardstimmung");
    const auto tuning = std::make_shared<GChTuning>(kGChStandardGuitar);
    tuning->setTuningName(kGChDefaultTuningName);
    const auto library = tuning->createLibraryWithPath({});
    library->setLibraryName("6-String Guitar Normal Tuning");
    CHECK(database.readOneRegularFile(library->wholeLibraryFileContent(), {}));
    CHECK(database.tunings()[0]->tuningName() == "Standardstimmung");
    CHECK(database.allLibrariesForAnyTuning()[0]->libraryName() ==
          LocalizedString("GChStr_6StrgsGuitarRegTuning"));
    CHECK(database.tuningWithDefaultGuitarTuning() == database.tunings()[0]);
}

TEST_CASE("A chunk is written only where it fits, and a name that is no UTF-8 is left out") {
    const auto tuning = std::make_shared<GChTuning>(kGChStandardGuitar);
    const auto library = tuning->createLibraryWithPath({});
    library->setLibraryName("\xFF");
    CHECK(library->tuningChunkSize() == 4 + 10 + 4 + 4);
    std::vector<std::uint8_t> buffer(64);
    CHECK(library->writeTuningChunkToBuffer(buffer.data(), 21) == 0);
    CHECK(library->writeTuningChunkToBuffer(buffer.data(), 22) == 22);
    const auto chord = BasicChordOf({52, 57, 62}, 0, {{1, 0, 0, 0, 1}});
    chord->setUserName("a");
    CHECK(chord->chordChunkSize() == 4 + 14 + 8);
    CHECK(chord->writeChordChunkToBuffer(buffer.data(), 25) == 0);
    CHECK(chord->writeChordChunkToBuffer(buffer.data(), 26) == 26);
}
