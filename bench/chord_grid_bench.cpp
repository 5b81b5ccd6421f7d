// SPDX-License-Identifier: MIT
// How long a library of 100,000 fingerings takes to write and to read, and to look through for
// those of one root and type. Each run checks its own result.

#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/guitarchords/GChFilterParameter.h"
#include "brindle/guitarchords/GChHarmonyStrings.h"

#include <benchmark/benchmark.h>

#include <memory>
#include <string>
#include <variant>

using namespace brindle;

namespace {

constexpr int kChords = 100'000;

std::shared_ptr<GChTuning> MakeTuning() {
    const auto tuning = std::make_shared<GChTuning>(kGChStandardGuitar);
    const auto library = tuning->createLibraryWithPath({});
    for (int i = 0; i < kChords; ++i) {
        const auto chord = std::make_shared<GChBasicChord>(kGChStandardGuitar);
        chord->setRootNote(i % 12);
        chord->setChordType(i / 12 % 30);
        if (i % 10 == 0) chord->setUserName("grid " + std::to_string(i));
        const int fret = i % 12;
        chord->addChordElem(nullptr, 1, fret, 0, 5);
        chord->addChordElem(nullptr, 3, fret + 2, 1);
        chord->addChordElem(nullptr, 4, fret + 2, 2);
        chord->addChordElem(nullptr, 2, fret + 1, 3);
        library->addBasicChord(chord);
    }
    return tuning;
}

void WriteLibrary(benchmark::State& state) {
    const auto tuning = MakeTuning();
    for (auto _ : state) {
        const std::string bytes = tuning->tuningLibraries()[0]->wholeLibraryFileContent();
        if (bytes.size() < kChords) state.SkipWithError("the library was not written");
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kChords);
}
BENCHMARK(WriteLibrary)->Unit(benchmark::kMillisecond);

void ReadLibrary(benchmark::State& state) {
    const auto tuning = MakeTuning();
    const std::string bytes = tuning->tuningLibraries()[0]->wholeLibraryFileContent();
    for (auto _ : state) {
        GChDatabase database;
        database.readOneRegularFile(bytes, {});
        if (database.tunings()[0]->numberOfChords() != kChords) {
            state.SkipWithError("the library was not read");
        }
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kChords);
}
BENCHMARK(ReadLibrary)->Unit(benchmark::kMillisecond);

void LookUpByRootAndType(benchmark::State& state) {
    const auto tuning = MakeTuning();
    GChFilterParameter filter;
    filter.setRootNoteToFilter(9, 0);
    filter.setChordTypeToFilter(11);
    for (auto _ : state) {
        std::size_t found = 0;
        for (const auto& library : tuning->tuningLibraries()) {
            for (const auto& chord : library->basicChords()) found += filter.Accepts(*chord);
        }
        if (found < kChords / 360 || found > kChords / 360 + 1) {
            state.SkipWithError("the look-up missed chords");
        }
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kChords);
}
BENCHMARK(LookUpByRootAndType)->Unit(benchmark::kMillisecond);

void NameAndProposeRoot(benchmark::State& state) {
    const auto tuning = MakeTuning();
    const auto& chords = tuning->tuningLibraries()[0]->basicChords();
    std::size_t ix = 0;
    for (auto _ : state) {
        const auto chord = GChChord::make(chords[ix], 0);
        if (GChProposedRootNoteFromChord(&*chord, 0) < 0) state.SkipWithError("no root");
        ix = ix + 1 < chords.size() ? ix + 1 : 0;
    }
}
BENCHMARK(NameAndProposeRoot);

}  // namespace

BENCHMARK_MAIN();
