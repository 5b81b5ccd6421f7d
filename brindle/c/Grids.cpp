// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Grids.h"

#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/platform/Resources.h"
#include "brindle/present/ChordGrid.h"
#include "brindle/present/GridsJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

using namespace brindle::border;

struct brindle_grid_package {
    brindle::GChDatabase mDatabase;
};

namespace {

static_assert(BRINDLE_MAX_STRINGS == brindle::kGChMaxStrings);

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
        const bool isPackage = path == nullptr || brindle::GChIsDbPackageAtPath(used);
        if (!isPackage || !result->mDatabase.readFromDbPackageAtPath(used)) {
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
        brindle::CChordLite chord;
        const brindle_status read = ReadSoundingChord(symbol, chord);
        if (read != BRINDLE_OK) return read;
        brindle::CFingeringOptions options;
        options.mCapo = capo;
        Give(brindle::GridsForChord(package->mDatabase, brindle::Printable(symbol), chord, strings,
                                    options),
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

brindle_status brindle_grids_draw(const brindle_grids* grids, const char* title, int dots,
                                  int left_handed, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (grids == nullptr) return FailForNull("grids");
    if (title == nullptr) return FailForNull("title");
    if (dots < BRINDLE_DOTS_FINGERS || dots > BRINDLE_DOTS_INTERVALS) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "dots are one of brindle_dots");
    }
    return Guarded([&] {
        const brindle::CGridStyle style{static_cast<brindle::TGridDots>(dots), left_handed != 0};
        return GiveText(brindle::GridsSvg(grids->mGrids, brindle::Printable(title), style), text);
    });
}
