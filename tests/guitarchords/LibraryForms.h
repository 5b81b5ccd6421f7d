// SPDX-License-Identifier: MIT
#pragma once

#include "tests/guitarchords/GridForms.h"

#include "brindle/guitarchords/GChDatabase.h"

#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

/// The forms in which the files of tests/data/expected write libraries.
namespace brindle::test {

inline std::string BytesOfHex(std::string_view hex) {
    std::string bytes;
    for (std::size_t i = 0; i + 1 < hex.size(); i += 2) {
        bytes += static_cast<char>(std::stoi(std::string(hex.substr(i, 2)), nullptr, 16));
    }
    return bytes;
}

inline std::string HexOfBytes(std::string_view bytes) {
    constexpr std::string_view digits = "0123456789abcdef";
    std::string hex;
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        hex += digits[byte >> 4];
        hex += digits[byte & 15];
    }
    return hex;
}

inline nlohmann::json FormOf(const GChBasicChord& chord) {
    return {{"difficultyLevel", chord.difficultyLevel()},
            {"rootNote", chord.rootNote()},
            {"bassNote", chord.bassNote()},
            {"chordType", chord.chordType()},
            {"isMutedMask", chord.isMutedMask()},
            {"isFavoriteMask", chord.isFavoriteMask()},
            {"userName", chord.userName()},
            {"dbChordID", chord.dbChordID()},
            {"chordElems", FormOf(chord.chordElems())}};
}

inline nlohmann::json FormOf(const GChLibrary& library) {
    nlohmann::json chords = nlohmann::json::array();
    for (const auto& chord : library.basicChords()) chords.push_back(FormOf(*chord));
    return {{"libraryName", library.libraryName()},
            {"isReadOnlyLibrary", library.isReadOnlyLibrary()},
            {"basicChords", chords},
            {"wholeLibraryFileContent", HexOfBytes(library.wholeLibraryFileContent())}};
}

inline nlohmann::json FormOf(const GChTuning& tuning) {
    nlohmann::json libraries = nlohmann::json::array();
    for (const auto& library : tuning.tuningLibraries()) libraries.push_back(FormOf(*library));
    return {{"tuningName", tuning.tuningName()},
            {"shortTuning", GChPitchArrayFromShortTuning(tuning.shortTuning())},
            {"libraries", libraries}};
}

inline nlohmann::json FormOf(const GChDatabase& database) {
    nlohmann::json tunings = nlohmann::json::array();
    for (const auto& tuning : database.tunings()) tunings.push_back(FormOf(*tuning));
    return tunings;
}

/// Fills a tuning with the library of a form; it may have values that no file can hold.
inline std::shared_ptr<GChLibrary> LibraryOf(const nlohmann::json& form,
                                             const std::shared_ptr<GChTuning>& tuning) {
    tuning->setTuningName(form.at("tuningName").get<std::string>());
    tuning->setCapodasterOffset(form.at("capodasterOffset"));
    const auto library = tuning->createLibraryWithPath({});
    library->setLibraryName(form.at("libraryName").get<std::string>());
    library->setIsReadOnlyLibrary(form.at("isReadOnlyLibrary"));
    for (const auto& chordForm : form.at("basicChords")) {
        const auto chord = std::make_shared<GChBasicChord>(tuning->shortTuning());
        chord->setRootNote(chordForm.at("rootNote"));
        chord->setBassNote(chordForm.at("bassNote"));
        chord->setChordType(chordForm.at("chordType"));
        chord->setDifficultyLevel(chordForm.at("difficultyLevel"));
        chord->setIsMutedMask(chordForm.at("isMutedMask"));
        chord->setIsFavoriteMask(chordForm.at("isFavoriteMask").get<std::uint32_t>());
        chord->setUserName(chordForm.at("userName").get<std::string>());
        AddElems(*chord, chordForm.at("chordElems"));
        library->addBasicChord(chord);
    }
    return library;
}

}  // namespace brindle::test
