// SPDX-License-Identifier: MIT
#include "Interface.h"

#include <array>
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

/// What a host may do with handles of its own, as one text; no check in it, since the tests' own
/// are not for threads.
std::string WorkOf(int number) {
    const auto text = [](brindle_status status, char* made) {
        std::string result = status == BRINDLE_OK ? made : brindle_last_error();
        brindle_free(made);
        return result + '\n';
    };
    const auto call = [&](const auto& function, auto... arguments) {
        char* made = nullptr;
        const brindle_status status = function(arguments..., &made);
        return text(status, made);
    };
    const std::array<std::string, 4> songs{"Dm7 G7 | C A7 | Dm7 G7 | C", "Am F | C G | x",
                                           "Cm7 F7 | Bb Eb | Am7b5 D7 | Gm", Score()};
    const std::string& bytes = songs[static_cast<std::size_t>(number) % songs.size()];
    brindle_song* song = nullptr;
    brindle_song_read(bytes.data(), bytes.size(), nullptr, &song);
    brindle_analysis* analysis = nullptr;
    const brindle_analysis_options options{{{-1, 127}, BRINDLE_MODE_NONE}, 7};
    brindle_analyse(song, &options, &analysis);
    std::string result = call(brindle_analysis_json, analysis);
    result += call(brindle_analysis_svg, analysis, BRINDLE_PICTURE_LEAD_SHEET);
    result += call(brindle_analysis_svg, analysis, BRINDLE_PICTURE_TIME_AXIS);
    result += call(brindle_score_json_lines, bytes.data(), bytes.size());
    brindle_markov* model = nullptr;
    brindle_markov_new(2, &model);
    brindle_markov_learn(model, song);
    result += call(brindle_markov_generate, model, nullptr);
    brindle_markov_free(model);
    const std::vector<int> notes{48 + number, 52 + number, 55 + number, 58};
    brindle_names* names = nullptr;
    brindle_names_of_notes(notes.data(), notes.size(), nullptr, &names);
    brindle_name name;
    brindle_names_get(names, 0, &name);
    result += name.symbol;
    brindle_names_free(names);
    brindle_grids* grids = nullptr;
    brindle_grids_of_frets(number % 2 == 0 ? "x02010" : "x0201", nullptr, 0, &grids);
    result += call(brindle_grids_json, grids);
    brindle_grids_free(grids);
    brindle_grid_package* package = nullptr;
    brindle_grid_package_read(BRINDLE_SOURCE_DIR "/data/Chord Grids/GuitarChords.gchdb", &package);
    brindle_grids_find(package, "Am7", nullptr, 0, &grids);
    result += call(brindle_grids_json, grids);
    brindle_grids_free(grids);
    brindle_grid_package_free(package);
    brindle_analysis_free(analysis);
    brindle_song_free(song);
    return result;
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
