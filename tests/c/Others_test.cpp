// SPDX-License-Identifier: MIT
#include "Interface.h"
#include "tests/support/ScratchFolder.h"

#include <nlohmann/json.hpp>

#include <fstream>
#include <iterator>
#include <string>

namespace brindle::test {
namespace {

TModel ModelOf(std::string_view chords, std::size_t order = 2) {
    brindle_markov* model = nullptr;
    REQUIRE(brindle_markov_new(order, &model) == BRINDLE_OK);
    REQUIRE(brindle_markov_learn(model, ReadSongOf(chords).get()) == BRINDLE_OK);
    return TModel(model);
}

std::string Bytes(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

TEST_CASE("A model learns, writes, reads and repeats itself for a seed") {
    const TModel model = ModelOf("C F | G7 C | Am F | G7 C");
    const CScratchFolder folder;
    const std::string path = folder.File("model.json");
    REQUIRE(brindle_markov_write_file(model.get(), path.c_str()) == BRINDLE_OK);
    brindle_markov* read = nullptr;
    REQUIRE(brindle_markov_read_file(path.c_str(), &read) == BRINDLE_OK);
    const TModel again(read);
    CHECK(brindle_markov_order(read) == 2);
    CHECK(TextOf(brindle_markov_write, read) == Bytes(path));

    brindle_markov_options options = brindle_markov_options_default();
    options.beats = 8.0;
    options.seed = 7;
    const std::string made = TextOf(brindle_markov_generate, model.get(), &options);
    CHECK(brindle_song_chord_count(ReadSongOf(made).get()) > 1);
    CHECK(TextOf(brindle_markov_generate, model.get(), &options) == made);
    CHECK(TextOf(brindle_markov_generate, read, &options) == made);
}

TEST_CASE("What a model cannot do is told") {
    const TModel model = ModelOf("C F | G7 C");
    brindle_markov* made = nullptr;
    CHECK(brindle_markov_new(0, &made) == BRINDLE_ERROR_ARGUMENT);
    CHECK(brindle_markov_new(65, &made) == BRINDLE_ERROR_ARGUMENT);
    CHECK(brindle_markov_read("{}", &made) == BRINDLE_ERROR_INPUT);
    CHECK(brindle_markov_read("no json", &made) == BRINDLE_ERROR_INPUT);
    CHECK(brindle_markov_read_file("/nothing/here", &made) == BRINDLE_ERROR_FILE);
    CHECK(brindle_markov_write_file(model.get(), "/nothing/here") == BRINDLE_ERROR_FILE);
    CHECK(made == nullptr);
    CHECK(brindle_markov_learn(model.get(), ReadSongOf("xyz").get()) == BRINDLE_ERROR_INPUT);
    brindle_markov_options options = brindle_markov_options_default();
    options.beats = 1.0 / 0.0;
    CHECK(TextOf(brindle_markov_generate, model.get(), &options).front() == '[');
    brindle_markov* empty = nullptr;
    REQUIRE(brindle_markov_new(1, &empty) == BRINDLE_OK);
    const TModel owner(empty);
    char* chords = nullptr;
    CHECK(brindle_markov_generate(empty, nullptr, &chords) == BRINDLE_ERROR_NOT_FOUND);
}

TEST_CASE("Fingerings are found and typed ones named") {
    REQUIRE(brindle_set_data_folder(BRINDLE_SOURCE_DIR "/data") == BRINDLE_OK);
    brindle_grid_package* made = nullptr;
    REQUIRE(brindle_grid_package_read(nullptr, &made) == BRINDLE_OK);
    const TPackage package(made);
    brindle_grids* found = nullptr;
    REQUIRE(brindle_grids_find(made, "Am7", nullptr, 0, &found) == BRINDLE_OK);
    const TGrids grids(found);
    REQUIRE(brindle_grids_count(found) > 0);
    brindle_grid grid;
    for (std::size_t i = 0; i < brindle_grids_count(found); ++i) {
        REQUIRE(brindle_grids_get(found, i, &grid) == BRINDLE_OK);
        CHECK(grid.string_count == 6);
        for (std::size_t string = 0; string < 6; ++string) {
            const int pitch = grid.pitches[string];
            const bool isOfChord = pitch % 12 == 9 || pitch % 12 == 0 || pitch % 12 == 4 ||
                                   pitch % 12 == 7 || pitch == -1;
            CHECK(isOfChord);
            CHECK((pitch == -1) == (grid.frets[string] == -1));
        }
    }
    CHECK(nlohmann::json::accept(TextOf(brindle_grids_json, found)));
    CHECK(TextOf(brindle_grids_svg, found, "Am7").find("</svg>") != std::string::npos);

    REQUIRE(brindle_grids_of_frets("x02010", nullptr, 0, &found) == BRINDLE_OK);
    const TGrids typed(found);
    REQUIRE(brindle_grids_get(found, 0, &grid) == BRINDLE_OK);
    CHECK(grid.name == std::string("Am7"));
    CHECK(grid.frets[0] == -1);
    CHECK(grid.frets[2] == 2);
}

TEST_CASE("Fingerings are searched as a hand and its player allow") {
    const auto first = [](const char* symbol, const brindle_fingering_options& options) {
        brindle_grids* found = nullptr;
        REQUIRE(brindle_grids_search(symbol, &options, &found) == BRINDLE_OK);
        const TGrids grids(found);
        CHECK(brindle_grids_count(found) <= options.limit);
        brindle_grid grid;
        if (brindle_grids_get(found, 0, &grid) != BRINDLE_OK) return std::string("none");
        std::string frets;
        for (std::size_t i = 0; i < grid.string_count; ++i) {
            frets += grid.frets[i] < 0 ? "x" : std::to_string(grid.frets[i]);
        }
        return frets;
    };
    const auto with = [](auto change) {
        brindle_fingering_options options = brindle_fingering_options_default();
        change(options);
        return options;
    };
    using O = brindle_fingering_options;
    CHECK(first("C", with([](O&) {})) == "x32010");
    CHECK(first("C", with([](O& o) { o.tuning = "ukulele"; })) == "0003");
    CHECK(first("C", with([](O& o) { o.capo = 3; })) == "x02220");
    CHECK(first("C7", with([](O& o) { o.whole = 1; })) != first("C7", with([](O&) {})));
    CHECK(first("F#m", with([](O& o) { o.highest_fret = 1; })) == "none");
    CHECK(first("F", with([](O& o) { o.span = 2; })) != first("F", with([](O&) {})));
    CHECK(first("G", with([](O& o) {
                    o.lowest = BRINDLE_LOWEST_REQUIRED;
                    o.tuning = "ukulele-low-g";
                })) == "0232");
    O options = brindle_fingering_options_default();
    options.limit = 3;
    options.rootless = 1;
    CHECK(first("C9", options) != "none");
    brindle_grids* found = nullptr;
    for (const auto& wrong : {with([](O& o) { o.capo = 25; }), with([](O& o) { o.span = 7; }),
                              with([](O& o) { o.highest_fret = 0; }),
                              with([](O& o) { o.limit = 0; }), with([](O& o) { o.lowest = 3; })}) {
        CHECK(brindle_grids_search("C", &wrong, &found) == BRINDLE_ERROR_ARGUMENT);
    }
    CHECK(brindle_grids_search("N.C.", nullptr, &found) == BRINDLE_ERROR_INPUT);
    CHECK(found == nullptr);
}

TEST_CASE("A song has fingerings under the capo that makes it easiest") {
    const TSong song = ReadSongOf("Bb F | Gm Eb");
    const auto shapes = [&](const brindle_fingering_options* options, int highest) {
        brindle_grids* found = nullptr;
        REQUIRE(brindle_grids_of_song(song.get(), options, highest, &found) == BRINDLE_OK);
        const TGrids grids(found);
        std::string names;
        brindle_grid grid;
        for (std::size_t i = 0; brindle_grids_get(found, i, &grid) == BRINDLE_OK; ++i) {
            names += std::to_string(grid.capo) + grid.name + " ";
        }
        return names;
    };
    CHECK(shapes(nullptr, 7) == "3G 3D 3Em 3C ");
    CHECK(shapes(nullptr, -1) == "0Bb 0F 0Gm 0Eb ");
    brindle_fingering_options options = brindle_fingering_options_default();
    options.capo = 1;
    CHECK(shapes(&options, -1) == "1A 1E 1F#m 1D ");
    const auto json =
        nlohmann::json::parse(TextOf(brindle_song_grids_json, song.get(), &options, 7));
    CHECK(json["Capos"].size() == 8);
    CHECK(json["Capos"][0]["Capo"] == 3);
    CHECK(json["Chords"].size() == 4);
    brindle_grids* found = nullptr;
    CHECK(brindle_grids_of_song(song.get(), nullptr, 13, &found) == BRINDLE_ERROR_ARGUMENT);
    REQUIRE(brindle_grids_of_song(song.get(), nullptr, 0, &found) == BRINDLE_OK);
    const TGrids grids(found);
    const std::string plain = TextOf(brindle_grids_draw, found, "Song", BRINDLE_DOTS_FINGERS, 0);
    CHECK(plain == TextOf(brindle_grids_svg, found, "Song"));
    CHECK(plain != TextOf(brindle_grids_draw, found, "Song", BRINDLE_DOTS_FINGERS, 1));
    CHECK(TextOf(brindle_grids_draw, found, "Song", BRINDLE_DOTS_NOTES, 0).find(">Bb<") !=
          std::string::npos);
    CHECK(TextOf(brindle_grids_draw, found, "Song", 3, 0) == "[dots are one of brindle_dots]");
}

TEST_CASE("Faults of fingerings are told") {
    brindle_grids* found = nullptr;
    CHECK(brindle_grids_of_frets("x0201", nullptr, 0, &found) == BRINDLE_ERROR_INPUT);
    CHECK(std::string(brindle_last_error()) == "5 frets for 6 strings");
    CHECK(brindle_grids_of_frets("hello", nullptr, 0, &found) == BRINDLE_ERROR_INPUT);
    CHECK(brindle_grids_of_frets("x02010", "Q", 0, &found) == BRINDLE_ERROR_INPUT);
    CHECK(brindle_grids_of_frets("x02010", nullptr, 25, &found) == BRINDLE_ERROR_ARGUMENT);
    brindle_grid_package* package = nullptr;
    CHECK(brindle_grid_package_read("/nothing/here", &package) == BRINDLE_ERROR_FILE);
    CHECK(brindle_grid_package_read("/", &package) == BRINDLE_ERROR_FILE);
    CHECK(package == nullptr);
}

TEST_CASE("A score is told as JSON lines and as MIDI, plain and compressed") {
    const std::string score = Bytes(BRINDLE_SOURCE_DIR "/examples/scores/frere-jacques.musicxml");
    const auto lines = [](const std::string& bytes) {
        char* text = nullptr;
        REQUIRE(brindle_score_json_lines(bytes.data(), bytes.size(), &text) == BRINDLE_OK);
        std::string result = text;
        brindle_free(text);
        return result;
    };
    const std::string text = lines(score);
    CHECK(text.find("\"didEncounterNote\"") != std::string::npos);
    CHECK(nlohmann::json::accept(text.substr(0, text.find('\n'))));
    char* midi = nullptr;
    std::size_t size = 0;
    REQUIRE(brindle_score_midi(score.data(), score.size(), &midi, &size) == BRINDLE_OK);
    CHECK(std::string(midi, midi + 4) == "MThd");
    CHECK(size > 100);
    brindle_free(midi);
    CHECK(brindle_score_midi("<a", 2, &midi, &size) == BRINDLE_ERROR_INPUT);
    CHECK(midi == nullptr);
    CHECK(brindle_score_json_lines(nullptr, 0, &midi) == BRINDLE_ERROR_INPUT);
}

TEST_CASE("NULL is an error and never a crash") {
    brindle_chord chord;
    std::size_t count = 0;
    brindle_tone tones[12];
    char* text = nullptr;
    brindle_song* song = nullptr;
    const brindle_status statuses[] = {
        brindle_chord_read(nullptr, 0, &chord),
        brindle_chord_read("C", 0, nullptr),
        brindle_chord_write(nullptr, nullptr, &text),
        brindle_chord_write(&chord, nullptr, nullptr),
        brindle_chord_tones(nullptr, tones, &count),
        brindle_chord_tones(&chord, nullptr, &count),
        brindle_tone_write(nullptr, nullptr, &text),
        brindle_key_read(nullptr, nullptr),
        brindle_key_write(nullptr, &text),
        brindle_key_relative(nullptr, nullptr),
        brindle_key_scale(nullptr, nullptr),
        brindle_scale_read("C", nullptr),
        brindle_scale_write(nullptr, &text),
        brindle_scale_tones(nullptr, tones, &count),
        brindle_names_of_notes(nullptr, 1, nullptr, nullptr),
        brindle_names_get(nullptr, 0, nullptr),
        brindle_song_read(nullptr, 1, nullptr, &song),
        brindle_song_read("C", 1, nullptr, nullptr),
        brindle_song_read_file(nullptr, nullptr, &song),
        brindle_song_fault(nullptr, 0, nullptr),
        brindle_song_stated_key(nullptr, nullptr),
        brindle_song_chord_at(nullptr, 0, nullptr),
        brindle_song_bar(nullptr, 0, nullptr),
        brindle_song_section(nullptr, 0, nullptr),
        brindle_analyse(nullptr, nullptr, nullptr),
        brindle_analysis_key(nullptr, nullptr),
        brindle_analysis_chord(nullptr, 0, nullptr),
        brindle_analysis_region(nullptr, 0, nullptr),
        brindle_analysis_center(nullptr, 0, nullptr),
        brindle_analysis_json(nullptr, &text),
        brindle_analysis_text(nullptr, nullptr),
        brindle_analysis_svg(nullptr, BRINDLE_PICTURE_LEAD_SHEET, &text),
        brindle_grid_package_read(nullptr, nullptr),
        brindle_grids_find(nullptr, "C", nullptr, 0, nullptr),
        brindle_grids_of_frets(nullptr, nullptr, 0, nullptr),
        brindle_grids_get(nullptr, 0, nullptr),
        brindle_grids_json(nullptr, &text),
        brindle_grids_svg(nullptr, "", &text),
        brindle_grids_draw(nullptr, "", 0, 0, &text),
        brindle_grids_search(nullptr, nullptr, nullptr),
        brindle_grids_of_song(nullptr, nullptr, 0, nullptr),
        brindle_song_grids_json(nullptr, nullptr, 0, &text),
        brindle_markov_new(1, nullptr),
        brindle_markov_learn(nullptr, nullptr),
        brindle_markov_read(nullptr, nullptr),
        brindle_markov_read_file(nullptr, nullptr),
        brindle_markov_write(nullptr, &text),
        brindle_markov_write_file(nullptr, "x"),
        brindle_markov_generate(nullptr, nullptr, &text),
        brindle_score_json_lines(nullptr, 1, &text),
        brindle_score_midi(nullptr, 1, nullptr, nullptr),
        brindle_set_locale_folder(nullptr),
    };
    for (std::size_t i = 0; i < std::size(statuses); ++i) {
        INFO(i);
        CHECK(statuses[i] == BRINDLE_ERROR_ARGUMENT);
    }
    CHECK(text == nullptr);
    CHECK(brindle_song_chord_count(nullptr) == 0);
    CHECK(brindle_song_title(nullptr) == std::string());
    CHECK(brindle_analysis_chord_count(nullptr) == 0);
    CHECK(brindle_function_name(77) == std::string());
    brindle_song_free(nullptr);
    brindle_analysis_free(nullptr);
    brindle_names_free(nullptr);
    brindle_grids_free(nullptr);
    brindle_grid_package_free(nullptr);
    brindle_markov_free(nullptr);
    brindle_free(nullptr);
}

TEST_CASE("The version is that of the header") {
    CHECK(brindle_api_version() == BRINDLE_API_VERSION);
    CHECK(brindle_version() == std::string("0.1.0"));
}

}  // namespace
}  // namespace brindle::test
