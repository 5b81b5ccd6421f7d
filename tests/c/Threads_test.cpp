// SPDX-License-Identifier: MIT
#include "Interface.h"

#include <array>
#include <cstdint>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

namespace brindle::test {
namespace {

const std::string& Score() {
    static const std::string bytes = [] {
        std::ifstream file(BRINDLE_SOURCE_DIR "/examples/scores/frere-jacques.musicxml",
                           std::ios::binary);
        return std::string(std::istreambuf_iterator<char>(file), {});
    }();
    return bytes;
}

// What a host may do with handles of its own, as text; no check in it, since the tests' own are not
// for threads.

/// The text that a function makes of its arguments, or its error.
template <class TFunction, class... TArguments>
std::string TextBy(const TFunction& function, TArguments... arguments) {
    char* made = nullptr;
    const brindle_status status = function(arguments..., &made);
    std::string result = status == BRINDLE_OK ? made : brindle_last_error();
    brindle_free(made);
    return result + '\n';
}

std::string WithValues(int number) {
    const brindle_style style{number % 3, number % 2};
    brindle_key key{};
    brindle_key_read(number % 2 == 0 ? "F# minor" : "Bb", &key);
    brindle_scale scale{};
    brindle_scale_read(number % 2 == 0 ? "D dorian" : "Ab blues minor", &scale);
    brindle_chord chord{};
    brindle_chord_read(number % 2 == 0 ? "F#m7b5/C" : "Dbmaj9", 0, &chord);
    return TextBy(brindle_key_write, &key) + TextBy(brindle_scale_write, &scale) +
           TextBy(brindle_chord_write, &chord, &style) +
           TextBy(brindle_tone_write, &chord.root, &style);
}

std::string WithNames(int number) {
    const std::vector<int> notes{48 + number, 52 + number, 55 + number, 58};
    brindle_names* names = nullptr;
    brindle_names_of_notes(notes.data(), notes.size(), nullptr, &names);
    brindle_name name{};
    brindle_names_get(names, 0, &name);
    std::string result = name.symbol;
    brindle_names_free(names);
    return result;
}

std::string WithMarkov(int number, const brindle_song* song) {
    brindle_markov* model = nullptr;
    brindle_markov_new(2, &model);
    brindle_markov_learn(model, song);
    std::string result = TextBy(brindle_markov_write, model);
    brindle_markov* again = nullptr;
    brindle_markov_read(result.c_str(), &again);
    brindle_markov_options options = brindle_markov_options_default();
    options.seed = static_cast<std::uint64_t>(number);
    result += TextBy(brindle_markov_generate, again, &options);
    brindle_markov_free(again);
    brindle_markov_free(model);
    return result;
}

std::string WithSong(int number) {
    const std::array<std::string, 4> songs{"Dm7 G7 | C A7 | Dm7 G7 | C", "Am F | C G | x",
                                           "Cm7 F7 | Bb Eb | Am7b5 D7 | Gm", Score()};
    const std::string& bytes = songs[static_cast<std::size_t>(number) % songs.size()];
    brindle_song* song = nullptr;
    brindle_song_read(bytes.data(), bytes.size(), nullptr, &song);
    brindle_analysis* analysis = nullptr;
    const brindle_analysis_options options{{{-1, 127}, BRINDLE_MODE_NONE}, 7};
    brindle_analyse(song, &options, &analysis);
    std::string result = TextBy(brindle_analysis_json, analysis);
    result += TextBy(brindle_analysis_text, analysis);
    result += TextBy(brindle_analysis_svg, analysis, BRINDLE_PICTURE_LEAD_SHEET);
    result += TextBy(brindle_analysis_svg, analysis, BRINDLE_PICTURE_TIME_AXIS);
    result += TextBy(brindle_score_json_lines, bytes.data(), bytes.size());
    result += WithMarkov(number, song);
    brindle_analysis_free(analysis);
    brindle_song_free(song);
    return result;
}

std::string TextOfGrids(brindle_grids* grids) {
    std::string result =
        TextBy(brindle_grids_json, grids) + TextBy(brindle_grids_svg, grids, "title");
    brindle_grids_free(grids);
    return result;
}

std::string WithGrids(int number) {
    brindle_grids* grids = nullptr;
    brindle_grids_of_frets(number % 2 == 0 ? "x02010" : "x0201", nullptr, 0, &grids);
    std::string result = TextOfGrids(grids);
    brindle_grid_package* package = nullptr;
    brindle_grid_package_read(BRINDLE_SOURCE_DIR "/data/Chord Grids/GuitarChords.gchdb", &package);
    // The package has no chords of the second tuning, so they are searched for.
    for (const char* const tuning : {static_cast<const char*>(nullptr), "DADGAD"}) {
        grids = nullptr;
        brindle_grids_find(package, "Am7", tuning, 0, &grids);
        result += TextOfGrids(grids);
    }
    brindle_grid_package_free(package);
    return result;
}

std::string WorkOf(int number) {
    return WithSong(number) + WithValues(number) + WithNames(number) + WithGrids(number);
}

TEST_CASE("Threads with handles of their own get what one thread gets, and their own errors") {
    constexpr int kThreads = 8;
    // The threads come first, so that what is made once is made by them.
    std::array<std::string, kThreads> found;
    std::vector<std::thread> threads;
    for (int i = 0; i < kThreads; ++i) {
        threads.emplace_back([i, &found] { found[static_cast<std::size_t>(i)] = WorkOf(i); });
    }
    for (std::thread& thread : threads) thread.join();
    for (int i = 0; i < kThreads; ++i) {
        INFO(i);
        CHECK(found[static_cast<std::size_t>(i)] == WorkOf(i));
    }
}

TEST_CASE("One analysis is read by many threads") {
    const TAnalysis analysis = AnalysisOf(ReadSongOf("Dm7 G7 | C A7 | Dm7 G7 | C"));
    std::array<std::string, 4> found;
    std::vector<std::thread> threads;
    for (std::string& text : found) {
        threads.emplace_back([&] {
            char* made = nullptr;
            if (brindle_analysis_json(analysis.get(), &made) == BRINDLE_OK) text = made;
            brindle_free(made);
        });
    }
    for (std::thread& thread : threads) thread.join();
    for (const std::string& text : found) CHECK(text == found.front());
    CHECK(found.front().size() > 100);
}

}  // namespace
}  // namespace brindle::test
