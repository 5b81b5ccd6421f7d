// SPDX-License-Identifier: MIT
#include "brindle/present/GridPackageJson.h"

#include "brindle/guitarchords/GChChordTypes.h"
#include "brindle/guitarchords/GChPitches.h"
#include "brindle/platform/FileNode.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/internal/GridValues.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <optional>

namespace brindle {
namespace {

constexpr std::int64_t kLargestMask = 0xFFFFFFFF;

Json ChordToJson(const GChBasicChord& chord) {
    Json muted = Json::array();
    for (int i = 0; i < chord.numberOfStrings(); ++i) {
        if (chord.isMutedForStringIndex(i)) muted.push_back(i);
    }
    return {{"RootKeyNr", KeyNrToJson(chord.rootNote())},
            {"BassKeyNr", KeyNrToJson(chord.bassNote())},
            {"ChordTypeId", chord.chordType()},
            {"ChordType", GChChordTypeNameForId(chord.chordType())},
            {"UserName", chord.userName()},
            {"Difficulty", chord.difficultyLevel()},
            {"FavoriteMask", chord.isFavoriteMask()},
            {"MutedStrings", muted},
            {"Elements", ElemsToJson(chord.chordElems())}};
}

/// Reads members of one JSON object; a missing one and one of another kind or range is a fault,
/// the first of which is kept.
class CReader {
public:
    CReader(const Json& object, std::string place) : mObject(object), mPlace(std::move(place)) {
        if (!object.is_object()) mFault = mPlace + " is no object";
    }

    int Integer(const char* name, std::int64_t min, std::int64_t max) {
        return static_cast<int>(LongInteger(name, min, max));
    }
    std::int64_t LongInteger(const char* name, std::int64_t min, std::int64_t max) {
        const Json& value = Member(name);
        const bool isFine = value.is_number_integer() && value >= min && value <= max;
        if (!isFine) return Fail(name, fmt::format("an integer from {} to {}", min, max));
        return value.get<std::int64_t>();
    }
    /// -1 for null.
    int KeyNr(const char* name) { return Member(name).is_null() ? -1 : Integer(name, 0, 11); }
    bool Flag(const char* name) {
        const Json& value = Member(name);
        return value.is_boolean() ? value.get<bool>() : Fail(name, "true or false") != 0;
    }
    std::string Text(const char* name) {
        const Json& value = Member(name);
        if (value.is_string()) return value.get<std::string>();
        Fail(name, "a text");
        return {};
    }
    const Json& List(const char* name) {
        static const Json none = Json::array();
        const Json& value = Member(name);
        if (value.is_array()) return value;
        Fail(name, "a list");
        return none;
    }
    [[nodiscard]] const std::string& Place() const { return mPlace; }
    [[nodiscard]] const std::string& Fault() const { return mFault; }

private:
    const Json& Member(const char* name) const {
        static const Json none(Json::value_t::discarded);
        const auto found = mObject.find(name);
        return mObject.is_object() && found != mObject.end() ? *found : none;
    }
    int Fail(const char* name, std::string_view wanted) {
        if (mFault.empty()) mFault = fmt::format("{}: {} must be {}", mPlace, name, wanted);
        return 0;
    }

    const Json& mObject;
    std::string mPlace;
    std::string mFault;
};

/// The integers of a list; nothing if one is of another kind or outside the range.
std::optional<std::vector<int>> IntegersOf(const Json& list, int min, int max) {
    std::vector<int> integers;
    for (const Json& value : list) {
        if (!value.is_number_integer() || value < min || value > max) return std::nullopt;
        integers.push_back(value.get<int>());
    }
    return integers;
}

std::string ReadElem(const Json& json, const std::string& place, GChBasicChord& chord) {
    CReader reader(json, place);
    const int finger = reader.Integer("Finger", 0, kGChFingers - 1);
    const int fret = reader.Integer("Fret", 1, kGChFrets);
    const auto strings = IntegersOf(reader.List("Strings"), 0, kGChMaxStrings - 1);
    const std::uint8_t type =
        reader.Flag("Optional") ? GChFingerPointType_Optional : GChFingerPointType_Real;
    if (!reader.Fault().empty()) return reader.Fault();
    if (!strings || strings->size() != 2 ||
        chord.addChordElem(nullptr, finger, fret - 1, strings->front(), strings->back(), type) ==
            nullptr) {
        return place + ": Strings must be the lowest and the highest string, from 0";
    }
    return {};
}

std::string ReadChord(const Json& json, const std::string& place, GChLibrary& library) {
    CReader reader(json, place);
    const auto chord = std::make_shared<GChBasicChord>(library.gchTuning()->shortTuning());
    chord->setRootNote(reader.KeyNr("RootKeyNr"));
    chord->setBassNote(reader.KeyNr("BassKeyNr"));
    chord->setChordType(reader.Integer("ChordTypeId", -128, 127));
    chord->setUserName(reader.Text("UserName"));
    chord->setDifficultyLevel(reader.Integer("Difficulty", 0, 7));
    chord->setIsFavoriteMask(
        static_cast<std::uint32_t>(reader.LongInteger("FavoriteMask", 0, kLargestMask)));
    const auto muted = IntegersOf(reader.List("MutedStrings"), 0, kGChMaxStrings - 1);
    const Json& elems = reader.List("Elements");
    if (!reader.Fault().empty()) return reader.Fault();
    if (!muted) return place + ": MutedStrings must be strings, from 0";
    for (const int string : *muted) chord->setMuted(true, string);
    for (std::size_t i = 0; i < elems.size(); ++i) {
        const std::string fault =
            ReadElem(elems[i], fmt::format("{}, element {}", place, i + 1), *chord);
        if (!fault.empty()) return fault;
    }
    library.addBasicChord(chord);
    return {};
}

std::string ReadLibrary(const Json& json, const std::string& place, GChTuning& tuning) {
    CReader reader(json, place);
    const auto library = tuning.createLibraryWithPath({});
    library->setLibraryName(reader.Text("Name"));
    library->setIsReadOnlyLibrary(reader.Flag("ReadOnly"));
    const Json& chords = reader.List("Chords");
    if (!reader.Fault().empty()) return reader.Fault();
    for (std::size_t i = 0; i < chords.size(); ++i) {
        const std::string fault =
            ReadChord(chords[i], fmt::format("{}, chord {}", place, i + 1), *library);
        if (!fault.empty()) return fault;
    }
    return {};
}

std::string ReadTuningOf(const Json& json, const std::string& place, GChDatabase& database) {
    CReader reader(json, place);
    const std::string name = reader.Text("Name");
    const auto pitches = IntegersOf(reader.List("OpenStrings"), 1, 127);
    const Json& libraries = reader.List("Libraries");
    if (!reader.Fault().empty()) return reader.Fault();
    GChShortTuning shortTuning{};
    if (pitches && pitches->size() <= kGChMaxStrings) {
        GChPitchArrayToShortTuning(*pitches, shortTuning);
    }
    const auto tuning = database.tuningWithShortTuning(shortTuning, name);
    if (tuning == nullptr) return place + ": OpenStrings must be 3 to 16 pitches from 1 to 127";
    for (std::size_t i = 0; i < libraries.size(); ++i) {
        const std::string fault =
            ReadLibrary(libraries[i], fmt::format("{}, library {}", place, i + 1), *tuning);
        if (!fault.empty()) return fault;
    }
    return {};
}

}  // namespace

Json DatabaseToJson(const GChDatabase& database) {
    Json tunings = Json::array();
    for (const auto& tuning : database.tunings()) {
        Json libraries = Json::array();
        for (const auto& library : tuning->tuningLibraries()) {
            Json chords = Json::array();
            for (const auto& chord : library->basicChords()) chords.push_back(ChordToJson(*chord));
            libraries.push_back({{"Name", library->libraryName()},
                                 {"ReadOnly", library->isReadOnlyLibrary()},
                                 {"Chords", chords}});
        }
        tunings.push_back({{"Name", tuning->tuningName()},
                           {"OpenStrings", GChPitchArrayFromShortTuning(tuning->shortTuning())},
                           {"Libraries", libraries}});
    }
    return {{"Tunings", tunings}};
}

std::string ReadDatabase(const Json& json, GChDatabase& database) {
    CReader reader(json, "the package");
    const Json& tunings = reader.List("Tunings");
    if (!reader.Fault().empty()) return reader.Fault();
    for (std::size_t i = 0; i < tunings.size(); ++i) {
        const std::string fault =
            ReadTuningOf(tunings[i], fmt::format("tuning {}", i + 1), database);
        if (!fault.empty()) return fault;
    }
    return {};
}

bool CanPackageKeep(const GChDatabase& database) {
    GChDatabase readBack;
    readBack.readFromDbPackageWrapper(database.writeLibrariesToDbPackageWrapper(false), {});
    return DatabaseToJson(readBack) == DatabaseToJson(database);
}

}  // namespace brindle
