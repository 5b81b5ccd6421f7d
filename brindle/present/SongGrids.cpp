// SPDX-License-Identifier: MIT
#include "brindle/present/SongGrids.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/GridsText.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/internal/GridValues.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <nlohmann/json.hpp>
#include <set>

namespace brindle {
namespace {

/// What the hand plays of each chord, by name; without a capodaster as the song writes it.
std::vector<std::string> ShapeNames(std::span<const CChordLite> chords,
                                    std::span<const std::string> symbols, int capo) {
    std::vector<std::string> names(symbols.begin(), symbols.end());
    if (capo == 0) return names;
    const std::vector<CChordLite> shapes = ShapesUnderCapo(chords, capo);
    for (std::size_t i = 0; i < shapes.size(); ++i) names[i] = WriteChordSymbol(shapes[i]);
    return names;
}

CShownCapo ShownCapo(std::span<const CChordLite> chords, std::span<const std::string> names,
                     const CSongFingerings& song) {
    CShownCapo shown{song.mCapo, song.mCost, song.mDifficulty, song.mHoles, {}};
    std::set<std::string> seen;
    for (std::size_t i = 0; i < chords.size(); ++i) {
        if (chords[i].IsUndef() || !seen.insert(names[i]).second) continue;
        shown.mShapes.push_back(names[i]);
    }
    return shown;
}

constexpr std::size_t kShownCapos = 3;

std::string CapoText(const CShownCapo& capo) {
    const std::string holes =
        capo.mHoles == 0 ? ""
                         : fmt::format(", {} cannot be held",
                                       capo.mHoles == 1 ? std::string("1 chord")
                                                        : fmt::format("{} chords", capo.mHoles));
    return fmt::format("{}: {} (difficulty {:.1f}{})",
                       capo.mCapo == 0 ? "no capo" : fmt::format("capo {}", capo.mCapo),
                       fmt::join(capo.mShapes, " "), capo.mDifficulty, holes);
}

/// The places of the capodaster that are told, the best one first.
std::vector<std::string> CapoTexts(const CShownSongGrids& song) {
    std::vector<std::string> texts;
    for (std::size_t i = 0; i < std::min(song.mCapos.size(), kShownCapos); ++i) {
        texts.push_back(CapoText(song.mCapos[i]));
    }
    return texts;
}

Json CapoToJson(const CShownCapo& capo) {
    return {{"Capo", capo.mCapo},
            {"Cost", capo.mCost},
            {"Difficulty", capo.mDifficulty},
            {"Holes", capo.mHoles},
            {"Shapes", capo.mShapes}};
}

}  // namespace

CShownSongGrids MakeSongGrids(std::span<const CChordLite> chords,
                              std::span<const std::string> symbols,
                              std::span<const CSongFingerings> songs) {
    CShownSongGrids shown;
    shown.mSymbols.assign(symbols.begin(), symbols.end());
    shown.mGridOfChord.resize(chords.size());
    for (const CSongFingerings& song : songs) {
        const auto names = ShapeNames(chords, symbols, song.mCapo);
        shown.mCapos.push_back(ShownCapo(chords, names, song));
    }
    if (songs.empty()) return shown;
    const std::vector<std::string> names = ShapeNames(chords, symbols, songs.front().mCapo);
    std::map<std::pair<std::string, std::vector<int>>, std::size_t> gridOf;
    for (std::size_t i = 0; i < chords.size(); ++i) {
        const CFingering& fingering = songs.front().mFingerings[i];
        if (fingering.mStringCount == 0) continue;
        CChordGrid grid = GridOfFingering(symbols[i], fingering, chords[i]);
        grid.mName = names[i];
        if (grid.mCapo > 0) grid.mSounds = symbols[i];
        const auto [row, isNew] =
            gridOf.try_emplace({symbols[i], grid.mFrets}, shown.mGrids.size());
        if (isNew) shown.mGrids.push_back(std::move(grid));
        shown.mGridOfChord[i] = row->second;
    }
    return shown;
}

CShownSongGrids MakeSongGrids(const CSong& song, const GChShortTuning& tuning,
                              const CSongFingeringOptions& options, TSongCapo capo) {
    const std::size_t count = song.mChords.empty() ? 0 : song.mChords.size() - 1;
    const std::vector<CChordLite> chords(song.mChords.begin(),
                                         song.mChords.begin() + static_cast<std::ptrdiff_t>(count));
    std::vector<std::string> symbols;
    for (const std::string& symbol : song.mSymbols) symbols.push_back(Printable(symbol));
    symbols.resize(count);
    const auto found = capo == TSongCapo::Easiest
                           ? CompareCapos(chords, tuning, options)
                           : std::vector{ChooseFingerings(chords, tuning, options)};
    return MakeSongGrids(chords, symbols, found);
}

TChordGrids GridsBySymbol(const CShownSongGrids& song) {
    std::vector<std::size_t> uses(song.mGrids.size());
    for (const auto& grid : song.mGridOfChord) {
        if (grid) ++uses[*grid];
    }
    std::map<std::string, std::size_t> best;
    for (std::size_t i = 0; i < song.mGrids.size(); ++i) {
        const auto [row, isNew] = best.try_emplace(song.mGrids[i].mSymbol, i);
        if (!isNew && uses[i] > uses[row->second]) row->second = i;
    }
    TChordGrids grids;
    for (const auto& [symbol, at] : best) grids.emplace(symbol, song.mGrids[at]);
    return grids;
}

std::string SongGridsText(const CShownSongGrids& song, const CPaint& paint,
                          const CGridStyle& style) {
    std::string text;
    for (const std::string& line : CapoTexts(song)) {
        text += (text.empty() ? paint.Strong(line) : paint.Faint(line)) + '\n';
    }
    if (song.mGrids.empty()) return text;
    return text + '\n' + GridsText(song.mGrids, paint, style);
}

std::string SongGridsSvg(const CShownSongGrids& song, std::string_view title,
                         const CGridStyle& style) {
    return GridsSvg(song.mGrids, title, style, CapoTexts(song));
}

std::string SongGridsJson(const CShownSongGrids& song, const CGridStyle& style) {
    Json capos = Json::array();
    for (const CShownCapo& capo : song.mCapos) capos.push_back(CapoToJson(capo));
    Json chords = Json::array();
    for (std::size_t i = 0; i < song.mSymbols.size(); ++i) {
        const auto& grid = song.mGridOfChord[i];
        chords.push_back(
            {{"Symbol", song.mSymbols[i]}, {"Grid", grid ? Json(*grid) : Json(nullptr)}});
    }
    Json grids = Json::array();
    for (const CChordGrid& grid : song.mGrids) grids.push_back(GridToJson(grid));
    return JsonText({{"Capos", capos},
                     {"Chords", chords},
                     {"LeftHanded", style.mLeftHanded},
                     {"Grids", grids}});
}

}  // namespace brindle
