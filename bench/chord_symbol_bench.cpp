// SPDX-License-Identifier: MIT
// How long a chord symbol takes to read: the mean over a fixed list of usual symbols, one symbol of
// each kind, and texts of growing length, whose cost per byte must not grow. A chord holds no heap
// data, so reading a usual symbol must not allocate: "allocations" is 0, and anything else is an
// error.

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <benchmark/benchmark.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <new>
#include <string>
#include <string_view>

using namespace brindle;

namespace {

std::int64_t gAllocations = 0;

}  // namespace

// Not inlined: GCC would see free() meet new and warn.
[[gnu::noinline]] void* operator new(std::size_t size) {
    ++gAllocations;
    if (void* memory = std::malloc(size == 0 ? 1 : size)) return memory;
    throw std::bad_alloc();
}

[[gnu::noinline]] void operator delete(void* memory) noexcept {
    std::free(memory);
}

[[gnu::noinline]] void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace {

constexpr auto kUsualSymbols = std::to_array<std::string_view>({
    "C",          "Am",        "F",     "G7",   "Dm7",  "Cmaj7",       "Bb",
    "Ebmaj7",     "F#m7b5",    "B7",    "Em",   "A7",   "Dsus4",       "Gsus",
    "C6",         "Am6",       "D9",    "G13",  "C7#9", "Fm7",         "Bb7",
    "Abmaj9",     "Gdim7",     "Caug",  "D/F#", "C/E",  "Am7/G",       "F/A",
    "Eb maj 7/G", "C7 b13",    "Cadd9", "E7#5", "G11",  "Dm9",         "C5",
    "Cm7 add 11", "F#maj7#11", "Bbm7",  "C♯m7", "E♭7",  "B♭maj7♯11/F",
});

void ReadUsualSymbols(benchmark::State& state) {
    const CChordNamePrefs prefs;
    CChordLite chord;
    std::size_t ix = 0;
    const std::int64_t allocationsBefore = gAllocations;
    for (auto _ : state) {
        chord.SetFromString(kUsualSymbols[ix], prefs);
        benchmark::DoNotOptimize(chord);
        if (chord.IsUndef()) state.SkipWithError("a usual symbol reads as no chord");
        ix = ix + 1 < kUsualSymbols.size() ? ix + 1 : 0;
    }
    const std::int64_t allocations = gAllocations - allocationsBefore;
    if (allocations != 0) state.SkipWithError("reading a usual symbol allocates");
    state.counters["allocations"] = static_cast<double>(allocations);
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}
BENCHMARK(ReadUsualSymbols);

template <std::size_t N>
void ReadTexts(benchmark::State& state, const std::array<std::string_view, N>& texts) {
    std::size_t ix = 0;
    for (auto _ : state) {
        const CChordTextReading reading = ReadChordText(texts[ix]);
        benchmark::DoNotOptimize(&reading);
        if (reading.mKind != TChordText_Chord) state.SkipWithError("a text is not understood");
        ix = ix + 1 < texts.size() ? ix + 1 : 0;
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}

void ReadUsualTexts(benchmark::State& state) {
    ReadTexts(state, kUsualSymbols);
}
BENCHMARK(ReadUsualTexts);

void ReadTextsOfOtherSpellings(benchmark::State& state) {
    constexpr auto kTexts = std::to_array<std::string_view>({
        "C-7",
        "CM7",
        "CΔ7",
        "Co7",
        "Cø7",
        "C+",
        "C7alt",
        "C:min7",
        "F♯m7♭5/B",
        "Csus24",
        "C7(b9,13)",
        "E flat major",
        "CmM7",
        "C half-diminished",
        "D/f+",
        "C7M(9)",
    });
    ReadTexts(state, kTexts);
}
BENCHMARK(ReadTextsOfOtherSpellings);

void ReadOneSymbol(benchmark::State& state, std::string_view symbol) {
    const CChordNamePrefs prefs;
    CChordLite chord;
    for (auto _ : state) {
        chord.SetFromString(symbol, prefs);
        benchmark::DoNotOptimize(chord);
    }
}
BENCHMARK_CAPTURE(ReadOneSymbol, triad, "C");
BENCHMARK_CAPTURE(ReadOneSymbol, half_diminished, "F#m7b5");
BENCHMARK_CAPTURE(ReadOneSymbol, spaced_slash_chord, "Eb maj 7/G");
BENCHMARK_CAPTURE(ReadOneSymbol, many_options, "Bb7 b9 #9 #11 b13 omit 3 / E");

void ReadLongText(benchmark::State& state) {
    const CChordNamePrefs prefs;
    std::string text = "C";
    while (text.size() < static_cast<std::size_t>(state.range(0))) text += "7 add ♯11 xyz maj/";
    CChordLite chord;
    for (auto _ : state) {
        chord.SetFromString(text, prefs);
        benchmark::DoNotOptimize(chord);
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations()) *
                            static_cast<std::int64_t>(text.size()));
}
BENCHMARK(ReadLongText)->Arg(1 << 10)->Arg(1 << 13)->Arg(1 << 16)->Arg(1 << 19);

void ReadLongChordText(benchmark::State& state) {
    std::string text = "C";
    while (text.size() < static_cast<std::size_t>(state.range(0))) text += "7 add ♯11 omit3,5/";
    text += 'E';
    for (auto _ : state) benchmark::DoNotOptimize(ReadChordText(text));
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations()) *
                            static_cast<std::int64_t>(text.size()));
}
BENCHMARK(ReadLongChordText)->Arg(1 << 10)->Arg(1 << 13)->Arg(1 << 16)->Arg(1 << 19);

}  // namespace

BENCHMARK_MAIN();
