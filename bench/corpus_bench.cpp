// SPDX-License-Identifier: MIT
// Many songs at once: songs per second of wall time and of the time of all cores, by threads. The
// rounds of different threads alternate and the fastest of each counts, since others may use the
// machine. Growth: twice the songs take twice the time.
#include "brindle/present/SongLines.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <ctime>
#include <limits>
#include <optional>
#include <string>
#include <utility>

namespace brindle::bench {
namespace {

struct CTimes {
    double mWall = std::numeric_limits<double>::infinity();
    double mCpu = std::numeric_limits<double>::infinity();
};

std::string TextOfSong() {
    std::string text;
    for (int i = 0; i < 8; ++i) text += "Dm7 G7 | C^7 A7 | F^7 Bb7 | Em7 A7 |\n";
    return text;
}

/// Analyses `count` songs; the bytes of the lines are what has to be the same each time.
CTimes Analyse(std::size_t count, std::size_t jobs, std::size_t& bytes) {
    const std::string text = TextOfSong();
    std::size_t begun = 0;
    bytes = 0;
    CSongLineSteps steps;
    steps.mNext = [&]() -> std::optional<CSourceOfSong> {
        if (begun == count) return std::nullopt;
        ++begun;
        return CSourceOfSong{"song.txt", {}, 1, 1, std::move(SplitSongs(text).front()), {}};
    };
    steps.mTake = [&](CSongLine&& line) {
        bytes += line.mText.size();
        return true;
    };
    const auto begin = std::chrono::steady_clock::now();
    const std::clock_t cpu = std::clock();
    WriteSongLines(steps, {.mJobs = jobs});
    return {std::chrono::duration<double>(std::chrono::steady_clock::now() - begin).count(),
            static_cast<double>(std::clock() - cpu) / CLOCKS_PER_SEC};
}

void Print(const char* what, std::size_t count, const CTimes& times) {
    const auto songs = static_cast<double>(count);
    std::printf("%-28s %9.0f songs/s  %9.0f songs/s of a core\n", what, songs / times.mWall,
                songs / times.mCpu);
}

int Run() {
    constexpr std::size_t count = 500;
    constexpr int rounds = 5;
    std::array<CTimes, 3> best;
    std::array<std::size_t, 3> bytes{};
    for (int round = 0; round < rounds; ++round) {
        for (std::size_t kind = 0; kind < best.size(); ++kind) {
            const CTimes times =
                Analyse(kind == 2 ? 2 * count : count, kind == 1 ? 2 : 1, bytes[kind]);
            best[kind].mWall = std::min(best[kind].mWall, times.mWall);
            best[kind].mCpu = std::min(best[kind].mCpu, times.mCpu);
        }
    }
    Print("one thread", count, best[0]);
    Print("two threads", count, best[1]);
    Print("one thread, twice the songs", 2 * count, best[2]);
    std::printf(
        "two threads / one thread      %.2f times as fast, %.2f times the time of the cores\n",
        best[0].mWall / best[1].mWall, best[1].mCpu / best[0].mCpu);
    std::printf("twice the songs               %.2f times the time\n", best[2].mCpu / best[0].mCpu);
    return bytes[0] == bytes[1] && bytes[2] == 2 * bytes[0] ? 0 : 1;
}

}  // namespace
}  // namespace brindle::bench

int main() {
    return brindle::bench::Run();
}
