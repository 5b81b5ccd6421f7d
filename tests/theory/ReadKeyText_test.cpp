// SPDX-License-Identifier: MIT
#include "brindle/theory/ReadKeyText.h"

#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/ScaleCatalogue.h"

#include <doctest/doctest.h>

#include <string>

namespace brindle::test {
namespace {

std::string KeyOf(const char* text) {
    const CKeyText read = ReadKeyText(text);
    if (!read.mError.empty()) return "error at " + std::to_string(read.mColumn);
    return read.mSignKey.NameLong(ChordNamePrefsNonUTF8);
}

TEST_CASE("Keys are read in English and in German") {
    const struct {
        const char* mTyped;
        const char* mKey;
    } rows[] = {
        {"F# minor", "F# Minor"},   {"Bb", "Bb Major"},
        {"am", "A Minor"},          {"B", "B Major"},
        {"H", "B Major"},           {"B minor", "B Minor"},
        {"h-moll", "B Minor"},      {"B-Dur", "Bb Major"},
        {"b moll", "Bb Minor"},     {"Bb moll", "Bb Minor"},
        {"H-Dur", "B Major"},       {"fis-Moll", "F# Minor"},
        {"Es-Dur", "Eb Major"},     {" As dur ", "Ab Major"},
        {"cis MOLL", "C# Minor"},   {"Ces-Dur", "Cb Major"},
        {"Fis", "F# Major"},        {"Es", "Eb Major"},
        {"a-moll", "A Minor"},      {"Adur", "A Major"},
        {"f# moll", "F# Minor"},    {"fis", "F# Major"},
        {"Hes-Dur", "error at 1"},  {"Bis-Dur", "error at 3"},
        {"J-Dur", "error at 0"},    {"moll", "error at 0"},
        {"Aes-Dur", "error at 1"},  {"H# moll", "B# Minor"},
        {"D dorian", "error at 2"}, {"F♯ minor", "F# Minor"},
        {"B♭", "Bb Major"},         {"b♭m", "Bb Minor"},
        {"c♯ moll", "C# Minor"},    {"F♯ dorian", "error at 5"},
        {"E flat", "Eb Major"},     {"F Sharp minor", "F# Minor"},
        {"b-flat m", "Bb Minor"},   {"E flatter", "error at 2"},
        {"A sharps", "error at 2"}, {"E flat dorian", "error at 7"},
    };
    for (const auto& row : rows) {
        INFO(std::string(row.mTyped));
        CHECK(KeyOf(row.mTyped) == std::string(row.mKey));
    }
}

TEST_CASE("Every scale is read by the name that it is printed with") {
    for (const CScaleRow& row : kScaleCatalogue) {
        if (row.mName.empty()) continue;
        const std::string name = "Eb " + std::string(row.mName);
        INFO(name);
        const CScaleText read = ReadScaleText(name);
        CHECK(read.mError.empty());
        CHECK(CScaleLite(read.mScale) == CScaleLite(CKeyEnh_Eb, row.Semitones()));
    }
    CHECK(ReadScaleText("E♭ Dorian").mScale == ReadScaleText("Eb Dorian").mScale);
    CHECK(ReadScaleText("E♭ natural").mColumn == std::string("E♭ ").size());
    CHECK(ReadScaleText("Eb natural").mError == "no scale of this name is known");
}

}  // namespace
}  // namespace brindle::test
