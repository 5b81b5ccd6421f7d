// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ChordGrid.h"
#include "brindle/song/CSong.h"
#include "brindle/song/SongFingerings.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A place of the capodaster for a song, and what the hand then plays.
struct CShownCapo {
    int mCapo = 0;  ///< its fret, 0 for none
    /// Less is easier.
    int mCost = 0;
    double mDifficulty = 0.0;  ///< mean of the chords that are held, 0 to 9
    std::size_t mHoles = 0;    ///< chords that cannot be held
    /// Each different chord by the name of its shape, in the order of the song.
    std::vector<std::string> mShapes;
};

/// The fingerings of a song made ready for the eye.
struct CShownSongGrids {
    /// Each different one, in the order of the song. The name is that of the shape under the
    /// capodaster, the symbol that of the song.
    std::vector<CChordGrid> mGrids;
    /// Of each chord of the song its symbol.
    std::vector<std::string> mSymbols;
    /// Of each chord which of the grids it is; nothing for a rest and a hole.
    std::vector<std::optional<std::size_t>> mGridOfChord;
    /// The first one is drawn. The others were compared with it.
    std::vector<CShownCapo> mCapos;
};

/// `songs` hold the fingerings of the same chords, the ones to be drawn first.
[[nodiscard]] CShownSongGrids MakeSongGrids(std::span<const CChordLite> chords,
                                            std::span<const std::string> symbols,
                                            std::span<const CSongFingerings> songs);

/// Where the capodaster of a song lies.
enum class TSongCapo : std::uint8_t {
    Told,     ///< at the fret of the options
    Easiest,  ///< where the song is easiest, up to the highest fret of the options
};

/// The same for a song as it was read.
[[nodiscard]] CShownSongGrids MakeSongGrids(const CSong& song, const GChShortTuning& tuning,
                                            const CSongFingeringOptions& options, TSongCapo capo);

/// The grid that each symbol has most often.
[[nodiscard]] TChordGrids GridsBySymbol(const CShownSongGrids& song);

/// The capo and what it makes easier, the way of the chords, and the diagrams.
[[nodiscard]] std::string SongGridsText(const CShownSongGrids& song, const CPaint& paint,
                                        const CGridStyle& style);
/// The same as a picture.
[[nodiscard]] std::string SongGridsSvg(const CShownSongGrids& song, std::string_view title,
                                       const CGridStyle& style = {});
/// The same as JSON, with all places of the capo.
[[nodiscard]] std::string SongGridsJson(const CShownSongGrids& song, const CGridStyle& style = {});

}  // namespace brindle
