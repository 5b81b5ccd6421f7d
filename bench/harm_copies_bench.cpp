// SPDX-License-Identifier: MIT
// How long it takes to find the repeated passages of a chord list, and how that grows with the
// length of the list: for songs, and for lists that are hard on purpose.

#include "brindle/analysis/CHarmonicAnalyse.h"

#include <benchmark/benchmark.h>
#include <array>
#include <cstddef>
#include <random>
#include <vector>

namespace {

using namespace brindle;

using TSymbols = std::vector<int>;

/// Number n stands for a chord on key n % 12.
CHarmonicAnalyse AnalysisOf(const TSymbols& symbols) {
    CHarmonicAnalyse analyse;
    double position = 0.0;
    for (const int symbol : symbols) {
        const auto tones = 145 + static_cast<std::uint64_t>(symbol / 12) % 1024 * 2;
        analyse.mChords.emplace_back(
            CChordLite({symbol % 12, TEnh_n}, CKeyEnh_Undef, CSemitones(tones)), position);
        position += 1.0;
    }
    analyse.mChords.emplace_back(CChordLite_Undef, position);
    return analyse;
}

/// Verses and choruses of eight or sixteen chords, with a new one now and then.
TSymbols Song(std::size_t count) {
    std::mt19937 random(1);
    std::vector<TSymbols> sections;
    TSymbols song;
    while (song.size() < count) {
        if (sections.size() < 3 || random() % 32 == 0) {
            TSymbols& section = sections.emplace_back(random() % 2 == 0 ? 8 : 16);
            for (int& chord : section) chord = static_cast<int>(random() % 24);
        }
        const TSymbols& section = sections[random() % sections.size()];
        song.insert(song.end(), section.begin(), section.end());
    }
    song.resize(count);
    return song;
}

template <int kPeriod>
TSymbols Periodic(std::size_t count) {
    TSymbols symbols(count);
    for (std::size_t n = 0; n < count; ++n) symbols[n] = static_cast<int>(n) % kPeriod;
    return symbols;
}

template <int kKinds>
TSymbols Random(std::size_t count) {
    std::mt19937 random(1);
    TSymbols symbols(count);
    for (int& symbol : symbols) symbol = static_cast<int>(random() % kKinds);
    return symbols;
}

/// Each beginning is the last one and the one before: full of repetitions of all lengths.
TSymbols Fibonacci(std::size_t count) {
    TSymbols before = {1};
    TSymbols symbols = {0};
    while (symbols.size() < count) {
        TSymbols longer = symbols;
        longer.insert(longer.end(), before.begin(), before.end());
        before.swap(symbols);
        symbols.swap(longer);
    }
    symbols.resize(count);
    return symbols;
}

/// Rows of one chord with another between, of lengths that drift.
TSymbols Rows(std::size_t count) {
    TSymbols symbols;
    for (std::size_t row = 0; symbols.size() < count; ++row) {
        symbols.insert(symbols.end(), 100 + row % 7, 0);
        symbols.push_back(1);
    }
    symbols.resize(count);
    return symbols;
}

/// Ever longer beginnings of one list, each followed by a chord of its own: the most starts.
TSymbols Beginnings(std::size_t count) {
    TSymbols symbols;
    for (int length = 2; symbols.size() < count; ++length) {
        for (int n = 0; n < length; ++n) symbols.push_back(n);
        symbols.push_back(6000 + length);
    }
    symbols.resize(count);
    return symbols;
}

void FindCopies(benchmark::State& state, TSymbols (*makeSymbols)(std::size_t)) {
    const auto analyse = AnalysisOf(makeSymbols(static_cast<std::size_t>(state.range(0))));
    CHarmCopies copies;
    for (auto _ : state) {
        analyse.FindHarmCopies(copies);
        benchmark::DoNotOptimize(copies.data());
    }
    if (copies.empty()) state.SkipWithError("no copies were found");
    state.counters["copies"] = static_cast<double>(copies.size());
    state.SetComplexityN(state.range(0));
}

constexpr std::array<std::pair<const char*, TSymbols (*)(std::size_t)>, 9> kLists = {{
    {"song", Song},
    {"one chord", Periodic<1>},
    {"four chords", Periodic<4>},
    {"random, 2 kinds", Random<2>},
    {"random, 24 kinds", Random<24>},
    {"random, 1000 kinds", Random<1000>},
    {"fibonacci", Fibonacci},
    {"rows", Rows},
    {"beginnings", Beginnings},
}};

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    for (const auto& [name, makeSymbols] : kLists) {
        benchmark::RegisterBenchmark(name, FindCopies, makeSymbols)
            ->Arg(2000)
            ->Arg(10000)
            ->Arg(50000)
            ->Arg(100000)
            ->Complexity(benchmark::oNLogN)
            ->Unit(benchmark::kMillisecond);
    }
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
