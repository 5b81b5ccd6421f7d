// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Grids.h"
#include "brindle/c/internal/Handles.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/SongGrids.h"

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <utility>

namespace brindle::border {

brindle_status ReadStrings(const char* tuning, int capo, GChShortTuning& strings) {
    if (capo < 0 || capo > kFingeringMostFrets) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "a capo is a fret of 0 to 24");
    }
    const auto read = tuning == nullptr ? std::optional(kGChStandardGuitar) : ReadTuning(tuning);
    if (!read) {
        return Fail(BRINDLE_ERROR_INPUT, "a tuning is written as DADGAD or E2A2D3G3B3E4", 1);
    }
    strings = *read;
    return BRINDLE_OK;
}

brindle_status ReadSoundingChord(const char* symbol, CChordLite& chord) {
    const auto reading = ReadChordText(symbol);
    if (reading.mKind != TChordText_Chord) {
        const std::string fault = reading.mFault.empty() ? "no chord" : reading.mFault;
        return Fail(BRINDLE_ERROR_INPUT, fault,
                    static_cast<std::size_t>(std::max(reading.mFaultPos, 1)));
    }
    chord = reading.mChord;
    return BRINDLE_OK;
}

void Give(std::vector<CChordGrid> found, brindle_grids** grids) {
    auto result = std::make_unique<brindle_grids>();
    result->mGrids = std::move(found);
    *grids = result.release();
}

namespace {

constexpr int kNarrowestSpan = 2;
constexpr int kWidestSpan = 6;
constexpr std::size_t kMostWanted = 1000;
constexpr int kMostCapoOfSong = 12;
constexpr int kToldCapo = -1;

/// The tuning and the options of a caller, or what is wrong with them.
brindle_status ReadOptions(const brindle_fingering_options* told, GChShortTuning& strings,
                           CFingeringOptions& options) {
    const brindle_fingering_options from =
        told == nullptr ? brindle_fingering_options_default() : *told;
    const auto isIn = [](int value, int least, int most) {
        return value >= least && value <= most;
    };
    if (!isIn(from.highest_fret, 1, kFingeringMostFrets)) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "the highest fret is 1 to 24");
    }
    if (!isIn(from.span, kNarrowestSpan, kWidestSpan)) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "a span is 2 to 6 frets");
    }
    if (!isIn(from.lowest, BRINDLE_LOWEST_USUAL, BRINDLE_LOWEST_FREE)) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "the lowest note is one of brindle_lowest");
    }
    if (from.limit < 1 || from.limit > kMostWanted) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "a limit is 1 to 1000");
    }
    options.mCapo = from.capo;
    options.mHighestFret = from.highest_fret;
    options.mSpan = from.span;
    options.mSpanUpTheNeck = from.span + 1;
    options.mBass = static_cast<TFingeringBass>(from.lowest);
    options.mMayOmitTones = from.whole == 0;
    options.mMayOmitRoot = from.rootless != 0;
    options.mLimit = from.limit;
    return ReadStrings(from.tuning, from.capo, strings);
}

/// Chooses the grids of a song and hands them to `give`.
template <class TGive>
brindle_status WithSongGrids(const brindle_song* song, const brindle_fingering_options* told,
                             int highestCapo, const TGive& give) {
    if (song == nullptr) return FailForNull("song");
    if (highestCapo < kToldCapo || highestCapo > kMostCapoOfSong) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "the highest capo is -1 to 12");
    }
    return Guarded([&] {
        GChShortTuning strings{};
        CSongFingeringOptions options;
        const brindle_status status = ReadOptions(told, strings, options.mFingering);
        if (status != BRINDLE_OK) return status;
        options.mHighestCapo = std::max(highestCapo, 0);
        const auto capo = highestCapo == kToldCapo ? TSongCapo::Told : TSongCapo::Easiest;
        return give(MakeSongGrids(song->mSong, strings, options, capo));
    });
}

}  // namespace
}  // namespace brindle::border

using namespace brindle::border;

brindle_fingering_options brindle_fingering_options_default(void) {
    const brindle::CFingeringOptions usual;
    constexpr size_t kUsuallyWanted = 10;
    return {nullptr, 0, usual.mHighestFret, usual.mSpan, BRINDLE_LOWEST_USUAL,
            0,       0, kUsuallyWanted};
}

brindle_status brindle_grids_search(const char* symbol, const brindle_fingering_options* options,
                                    brindle_grids** grids) {
    if (grids == nullptr) return FailForNull("grids");
    *grids = nullptr;
    if (symbol == nullptr) return FailForNull("symbol");
    return Guarded([&] {
        brindle::GChShortTuning strings{};
        brindle::CFingeringOptions search;
        brindle::CChordLite chord;
        brindle_status status = ReadOptions(options, strings, search);
        if (status == BRINDLE_OK) status = ReadSoundingChord(symbol, chord);
        if (status != BRINDLE_OK) return status;
        Give(brindle::FoundGrids(brindle::Printable(symbol), chord, strings, search), grids);
        return BRINDLE_OK;
    });
}

brindle_status brindle_grids_of_song(const brindle_song* song,
                                     const brindle_fingering_options* options, int highest_capo,
                                     brindle_grids** grids) {
    if (grids == nullptr) return FailForNull("grids");
    *grids = nullptr;
    return WithSongGrids(song, options, highest_capo, [&](brindle::CShownSongGrids shown) {
        Give(std::move(shown.mGrids), grids);
        return BRINDLE_OK;
    });
}

brindle_status brindle_song_grids_json(const brindle_song* song,
                                       const brindle_fingering_options* options, int highest_capo,
                                       char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    return WithSongGrids(song, options, highest_capo, [&](const brindle::CShownSongGrids& shown) {
        return GiveText(brindle::SongGridsJson(shown), text);
    });
}
