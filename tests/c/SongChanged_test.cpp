// SPDX-License-Identifier: MIT
#include "Interface.h"

#include <nlohmann/json.hpp>

#include <string>
#include <vector>

namespace brindle::test {
namespace {

TSong Transposed(const TSong& song, int semitones) {
    brindle_song* made = nullptr;
    REQUIRE(brindle_song_transpose(song.get(), semitones, &made) == BRINDLE_OK);
    return TSong(made);
}

std::string SymbolsOf(const TSong& song) {
    std::string symbols;
    for (std::size_t i = 0; i < brindle_song_chord_count(song.get()); ++i) {
        brindle_song_chord chord;
        REQUIRE(brindle_song_chord_at(song.get(), i, &chord) == BRINDLE_OK);
        symbols += (i > 0 ? " " : "") + std::string(chord.symbol);
    }
    return symbols;
}

TEST_CASE("A transposed song is spelled for its new key") {
    struct CCase {
        std::string mText;
        int mSemitones;
        std::string mSymbols;
    };
    const std::vector<CCase> cases{
        {"{key: C}\n[C] [E7] [Am] [D7/F#]", 3, "Eb G7 Cm F7/A"},
        {"{key: C}\n[C] [E7] [Am] [D7/F#]", -1, "B D#7 G#m C#7/E#"},
        {"{key: F}\n[F] [Bb] [Gm]", 1, "Gb Cb Abm"},
        {"{key: D}\n[D] [G] [Bm]", 4, "F# B D#m"},
        {"{key: Am}\n[Am] [E7]", 6, "D#m A#7"},
        {"{key: C}\n[Cmaj7] N.C. [G]", 12, "Cmaj7 G"},
        {"Dm7 N.C. | G7", 2, "Em7 N.C. A7"},
    };
    for (const auto& [text, semitones, symbols] : cases) {
        const std::string logged = text;
        CAPTURE(logged);
        CHECK(SymbolsOf(Transposed(ReadSongOf(text), semitones)) == symbols);
    }
}

TEST_CASE("A song is renamed and written as ChordPro and as MIDI") {
    const TSong plain = ReadSongOf("Bb7 . . . | C . . B7 | G .");
    const brindle_style german{BRINDLE_NAMING_GERMAN, 0};
    brindle_song* made = nullptr;
    REQUIRE(brindle_song_rename(plain.get(), &german, &made) == BRINDLE_OK);
    CHECK(SymbolsOf(TSong(made)) == "B7 C H7 G");
    CHECK(TextOf(brindle_song_chord_pro, plain.get()) ==
          "{time: 4/4}\n{start_of_grid}\n| Bb7 . . . | C . . B7 | G . . . |\n{end_of_grid}\n");
    char* midi = nullptr;
    size_t size = 0;
    REQUIRE(brindle_song_midi(plain.get(), 0.0, &midi, &size) == BRINDLE_OK);
    CHECK(std::string(midi, 4) == "MThd");
    brindle_free(midi);
    CHECK(brindle_song_midi(plain.get(), -1.0, &midi, &size) == BRINDLE_ERROR_ARGUMENT);
    CHECK(midi == nullptr);
}

TEST_CASE("Chords between beats are written in smaller steps") {
    const TSong song = ReadSongOf("(1.5,C);(2.5,G7)");
    CHECK(TextOf(brindle_song_chord_pro, song.get()) ==
          "{time: 8/8}\n{start_of_grid}\n| C . . G7 . . . . |\n{end_of_grid}\n");
}

TEST_CASE("A lead sheet shows its chords under any name") {
    const TSong song = ReadSongOf("Dm7 G7 | C . A7 .");
    const TAnalysis analysis = AnalysisOf(song);
    const auto symbols = [&](int naming) {
        return TextOf(brindle_analysis_symbols, analysis.get(), naming, nullptr);
    };
    CHECK(symbols(BRINDLE_CHORDS_AS_WRITTEN) == "Dm7\nG7\nC\nA7\n");
    CHECK(symbols(BRINDLE_CHORDS_NASHVILLE) == "2-7\n57\n1\n67\n");
    CHECK(symbols(BRINDLE_CHORDS_ROMAN) == "ii7\nV7\nI\nV7/ii\n");
    CHECK(symbols(4) == "[there is no such naming]");
    brindle_sheet_options options = brindle_sheet_options_default();
    options.naming = BRINDLE_CHORDS_NASHVILLE;
    const std::string sheet = TextOf(brindle_analysis_sheet, analysis.get(), &options);
    CHECK(sheet != TextOf(brindle_analysis_svg, analysis.get(), int{BRINDLE_PICTURE_LEAD_SHEET}));
    CHECK(sheet.find(">5<") != std::string::npos);
}

TEST_CASE("What may come next is ranked in the key that is asked for") {
    brindle_song_model* made = nullptr;
    CHECK(brindle_song_model_built_in("polka", &made) == BRINDLE_ERROR_NOT_FOUND);
    REQUIRE(brindle_song_model_built_in(nullptr, &made) == BRINDLE_OK);
    const std::unique_ptr<brindle_song_model, CFree<brindle_song_model_free>> model(made);
    brindle_chord chord;
    REQUIRE(brindle_chord_read("G7", 0, &chord) == BRINDLE_OK);
    brindle_next_options options = brindle_next_options_default();
    REQUIRE(brindle_key_read("C", &options.key) == BRINDLE_OK);
    options.limit = 3;
    const auto next = nlohmann::json::parse(
        TextOf(brindle_song_model_next_json, model.get(), &chord, size_t{1}, &options));
    CHECK(next["Key"] == "C major");
    REQUIRE(next["Chords"].size() == 3);
    CHECK(next["Chords"][0]["Symbol"] == "C");
    options.place = 6;
    CHECK(TextOf(brindle_song_model_next_json, model.get(), &chord, size_t{1}, &options) ==
          "[a place is 0 to 5]");
}

TEST_CASE("A host sets symbols and numerals as the sheet does") {
    const auto runs = [](const char* text, int isNumeral) {
        return nlohmann::json::parse(TextOf(brindle_text_runs_json, text, isNumeral));
    };
    CHECK(runs("Ger6", 1).front()[0] == "Ger");
    CHECK(runs("Gm7", 0).front()[0] == "G");
    char* text = nullptr;
    CHECK(brindle_text_runs_json(nullptr, 0, &text) == BRINDLE_ERROR_ARGUMENT);
    CHECK(text == nullptr);
}

TEST_CASE("A chord of a thousand million beats is no grid in ChordPro") {
    for (const char* const text : {"(1e9,C);(4,G)", "(1e300,C);(4,G)", "(4,C);(1000001,G)"}) {
        INFO(text);
        const TSong song = ReadSongOf(text);
        CHECK(TextOf(brindle_song_chord_pro, song.get()).empty());
    }
    CHECK(TextOf(brindle_song_chord_pro, ReadSongOf("(4,C);(100000,G)").get()).size() > 100000);
}

}  // namespace
}  // namespace brindle::test
