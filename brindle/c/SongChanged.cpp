// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Handles.h"
#include "brindle/c/internal/Values.h"

#include "brindle/present/ChordProText.h"
#include "brindle/present/SongSymbols.h"
#include "brindle/present/WrittenSongText.h"
#include "brindle/song/TransposeSong.h"

#include <memory>
#include <utility>

using namespace brindle::border;

namespace {

// `change` gives a song for that of the handle.
template <class TChange>
brindle_status GiveSong(const brindle_song* song, brindle_song** changed, const TChange& change) {
    if (changed == nullptr) return FailForNull("the place for a song");
    *changed = nullptr;
    if (song == nullptr) return FailForNull("song");
    return Guarded([&] {
        *changed = std::make_unique<brindle_song>(brindle_song{change(song->mSong)}).release();
        return BRINDLE_OK;
    });
}

brindle::CSong Renamed(const brindle::CSong& song, const brindle::CChordSymbolStyle& style) {
    brindle::CSong result = song;
    for (size_t ix = 0; ix < result.mSymbols.size() && ix < result.mChords.size(); ++ix) {
        const brindle::CChordLite& chord = result.mChords[ix];
        if (!chord.IsUndef()) result.mSymbols[ix] = WriteChordSymbol(chord, style);
    }
    return result;
}

}  // namespace

brindle_status brindle_song_transpose(const brindle_song* song, int semitones,
                                      brindle_song** transposed) {
    return GiveSong(song, transposed, [&](const brindle::CSong& from) {
        return brindle::TransposeSong(from, semitones);
    });
}

brindle_status brindle_song_rename(const brindle_song* song, const brindle_style* style,
                                   brindle_song** renamed) {
    return GiveSong(song, renamed,
                    [&](const brindle::CSong& from) { return Renamed(from, FromC(style)); });
}

brindle_status brindle_song_chord_pro(const brindle_song* song, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (song == nullptr) return FailForNull("song");
    return Guarded([&] { return GiveText(brindle::ChordProText(song->mSong), text); });
}

brindle_status brindle_song_midi(const brindle_song* song, double tempo, char** midi,
                                 size_t* midi_size) {
    if (midi == nullptr || midi_size == nullptr) return FailForNull("midi or midi_size");
    *midi = nullptr;
    *midi_size = 0;
    if (song == nullptr) return FailForNull("song");
    const double used = tempo == 0.0 ? song->mSong.mTempo.value_or(brindle::kUsualTempo) : tempo;
    return Guarded([&] {
        if (!brindle::IsPlayableTempo(used)) {
            return Fail(BRINDLE_ERROR_ARGUMENT, "a tempo is 1 to 1000 beats a minute");
        }
        return GiveText(MidiFileBytes(MidiPieceOfSong(song->mSong, used)), midi, midi_size);
    });
}
