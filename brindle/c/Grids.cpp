// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/platform/Resources.h"
#include "brindle/present/ChordGrid.h"
#include "brindle/present/GridsJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <vector>

using namespace brindle::border;

struct brindle_grid_package {
    brindle::GChDatabase mDatabase;
};

struct brindle_grids {
    std::vector<brindle::CChordGrid> mGrids;
};

namespace {

static_assert(BRINDLE_MAX_STRINGS == brindle::kGChMaxStrings);

constexpr int kMostCapo = 24;

// Checks a tuning and a capo as they were handed in, and reads the tuning.
brindle_status ReadStrings(const char* tuning, int capo, brindle::GChShortTuning& strings) {
    if (capo < 0 || capo > kMostCapo) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "a capo is a fret of 0 to 24");
    }
    const auto read = tuning == nullptr ? std::optional(brindle::kGChStandardGuitar)
                                        : brindle::ReadTuning(tuning);
    if (!read) {
        return Fail(BRINDLE_ERROR_INPUT, "a tuning is written as DADGAD or E2A2D3G3B3E4", 1);
    }
    strings = *read;
    return BRINDLE_OK;
}

void Give(std::vector<brindle::CChordGrid> found, brindle_grids** grids) {
    auto result = std::make_unique<brindle_grids>();
    result->mGrids = std::move(found);
    *grids = result.release();
}

void Fill(const std::vector<int>& numbers, int* out) {
    std::fill_n(out, BRINDLE_MAX_STRINGS, -1);
    const std::size_t count = std::min<std::size_t>(numbers.size(), BRINDLE_MAX_STRINGS);
    std::copy_n(numbers.begin(), count, out);
}

}  // namespace

brindle_status brindle_grid_package_read(const char* path, brindle_grid_package** package) {
    if (package == nullptr) return FailForNull("package");
    *package = nullptr;
    return Guarded([&] {
        const std::string used =
            path != nullptr
                ? path
                : (brindle::ResourceFolder() / brindle::kGChFactoryPackagePath).string();
        auto result = std::make_unique<brindle_grid_package>();
        if (!result->mDatabase.readFromDbPackageAtPath(used)) {
            return Fail(BRINDLE_ERROR_FILE, brindle::Printable(used) + " is no package of grids");
        }
        *package = result.release();
        return BRINDLE_OK;
    });
}

void brindle_grid_package_free(brindle_grid_package* package) {
    delete package;
}

brindle_status brindle_grids_find(brindle_grid_package* package, const char* symbol,
                                  const char* tuning, int capo, brindle_grids** grids) {
    if (grids == nullptr) return FailForNull("grids");
    *grids = nullptr;
    if (package == nullptr) return FailForNull("package");
    if (symbol == nullptr) return FailForNull("symbol");
    return Guarded([&] {
        brindle::GChShortTuning strings{};
        const brindle_status status = ReadStrings(tuning, capo, strings);
        if (status != BRINDLE_OK) return status;
        const auto reading = brindle::ReadChordText(symbol);
        if (reading.mKind != brindle::TChordText_Chord) {
            const std::string fault = reading.mFault.empty() ? "no chord" : reading.mFault;
            return Fail(BRINDLE_ERROR_INPUT, fault,
                        static_cast<std::size_t>(std::max(reading.mFaultPos, 1)));
        }
        brindle::CFingeringOptions options;
        options.mCapo = capo;
        Give(brindle::GridsForChord(package->mDatabase, brindle::Printable(symbol), reading.mChord,
                                    strings, options),
             grids);
        return BRINDLE_OK;
    });
}

brindle_status brindle_grids_of_frets(const char* frets, const char* tuning, int capo,
                                      brindle_grids** grids) {
    if (grids == nullptr) return FailForNull("grids");
    *grids = nullptr;
    if (frets == nullptr) return FailForNull("frets");
    return Guarded([&] {
        brindle::GChShortTuning strings{};
        const brindle_status status = ReadStrings(tuning, capo, strings);
        if (status != BRINDLE_OK) return status;
        const auto read = brindle::ReadFrets(frets);
        if (!read) return Fail(BRINDLE_ERROR_INPUT, "frets are written as x32010", 1);
        const auto count =
            static_cast<std::size_t>(brindle::GChNumberOfStringsInShortTuning(strings));
        if (read->size() != count) {
            return Fail(BRINDLE_ERROR_INPUT,
                        fmt::format("{} frets for {} strings", read->size(), count), 1);
        }
        auto grid = brindle::GridOfFrets(frets, *read, strings, capo);
        if (!grid) return Fail(BRINDLE_ERROR_INPUT, "at most 15 strings are fretted", 1);
        Give({std::move(*grid)}, grids);
        return BRINDLE_OK;
    });
}

void brindle_grids_free(brindle_grids* grids) {
    delete grids;
}

size_t brindle_grids_count(const brindle_grids* grids) {
    return grids == nullptr ? 0 : grids->mGrids.size();
}

brindle_status brindle_grids_get(const brindle_grids* grids, size_t index, brindle_grid* grid) {
    if (grid == nullptr) return FailForNull("grid");
    *grid = {};
    grid->name = grid->library = "";
    if (grids == nullptr) return FailForNull("grids");
    ForgetFault();
    if (index >= grids->mGrids.size()) return FailForIndex(index, grids->mGrids.size());
    const brindle::CChordGrid& found = grids->mGrids[index];
    grid->name = found.mName.c_str();
    grid->library = found.mLibrary.c_str();
    grid->capo = found.mCapo;
    grid->string_count = std::min<std::size_t>(found.mFrets.size(), BRINDLE_MAX_STRINGS);
    Fill(found.mFrets, grid->frets);
    Fill(found.mPitches, grid->pitches);
    return BRINDLE_OK;
}

brindle_status brindle_grids_json(const brindle_grids* grids, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (grids == nullptr) return FailForNull("grids");
    return Guarded([&] { return GiveText(brindle::GridsJson(grids->mGrids), text); });
}

brindle_status brindle_grids_svg(const brindle_grids* grids, const char* title, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (grids == nullptr) return FailForNull("grids");
    if (title == nullptr) return FailForNull("title");
    return Guarded([&] {
        return GiveText(brindle::GridsSvg(grids->mGrids, brindle::Printable(title)), text);
    });
}
