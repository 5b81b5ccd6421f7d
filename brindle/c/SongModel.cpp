// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Handles.h"
#include "brindle/c/internal/SongModels.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/present/ModelSongsText.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/SongScoresText.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/ScoreSongs.h"
#include "brindle/song/SongModelFile.h"
#include "brindle/song/SongStyles.h"

#include <fmt/format.h>

#include <cerrno>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

using namespace brindle::border;

namespace {

constexpr std::size_t kMaxSongModelBytes = std::size_t{1} << 30;

// Teaches all songs, of which each has to have chords.
brindle_status TeachAll(const brindle_song* const* songs, size_t count,
                        std::vector<brindle::CTaughtSong>& taught) {
    if (songs == nullptr && count > 0) return FailForNull("songs");
    for (size_t ix = 0; ix < count; ++ix) {
        if (songs[ix] == nullptr) return FailForNull(fmt::format("song {}", ix));
        const brindle::CSong& song = songs[ix]->mSong;
        if (song.HasFault()) {
            return Fail(BRINDLE_ERROR_INPUT, fmt::format("song {} has a fault", ix));
        }
        taught.push_back(brindle::TeachSong(song));
        if (taught.back().mChords.empty()) {
            return Fail(BRINDLE_ERROR_INPUT, fmt::format("song {} has no chords", ix));
        }
    }
    return BRINDLE_OK;
}

brindle_status ReadSongModelText(std::string_view what, std::string_view text,
                                 brindle_song_model** model) {
    brindle::CSongModelReading reading = brindle::ReadSongModel(text);
    if (reading.mFault.empty()) return GiveModel(std::move(reading.mModel), model);
    return Fail(BRINDLE_ERROR_INPUT, fmt::format("{} {}", what, reading.mFault));
}

// What is wrong with the place for a model and with what the model is made of; both are handles.
template <class... TInputs>
brindle_status CheckMaking(brindle_song_model** made, const TInputs*... inputs) {
    if (made == nullptr) return FailForNull("the place for a model");
    *made = nullptr;
    return ((inputs == nullptr) || ...) ? FailForNull("model, style, text or path") : BRINDLE_OK;
}

}  // namespace

brindle_status brindle_song_model_built_in(const char* style, brindle_song_model** model) {
    if (CheckMaking(model) != BRINDLE_OK) return BRINDLE_ERROR_ARGUMENT;
    return Guarded([&] {
        brindle::CSongModel made = brindle::BuiltInSongModel(style == nullptr ? "" : style);
        if (made.IsEmpty()) {
            return Fail(BRINDLE_ERROR_NOT_FOUND, "no built-in song has this style");
        }
        return GiveModel(std::move(made), model);
    });
}

brindle_status brindle_song_model_learn(const brindle_song* const* songs, size_t count,
                                        brindle_song_model** model) {
    if (CheckMaking(model) != BRINDLE_OK) return BRINDLE_ERROR_ARGUMENT;
    return Guarded([&] {
        std::vector<brindle::CTaughtSong> taught;
        const brindle_status status = TeachAll(songs, count, taught);
        if (status != BRINDLE_OK) return status;
        if (taught.empty()) return Fail(BRINDLE_ERROR_INPUT, "there is no song to learn");
        return GiveModel(brindle::CSongModel(std::move(taught)), model);
    });
}

brindle_status brindle_song_model_join(const brindle_song_model* model,
                                       const brindle_song_model* other,
                                       brindle_song_model** joined) {
    if (CheckMaking(joined, model, other) != BRINDLE_OK) return BRINDLE_ERROR_ARGUMENT;
    return Guarded([&] {
        std::vector<brindle::CTaughtSong> songs = model->mModel.Songs();
        const auto& more = other->mModel.Songs();
        songs.insert(songs.end(), more.begin(), more.end());
        return GiveModel(brindle::CSongModel(std::move(songs)), joined);
    });
}

brindle_status brindle_song_model_of_style(const brindle_song_model* model, const char* style,
                                           brindle_song_model** of_style) {
    if (CheckMaking(of_style, model, style) != BRINDLE_OK) return BRINDLE_ERROR_ARGUMENT;
    return Guarded([&] {
        auto made = brindle::ModelOfStyle(model->mModel, style);
        if (made) return GiveModel(std::move(*made), of_style);
        return Fail(BRINDLE_ERROR_NOT_FOUND, "no song of the model has this style");
    });
}

void brindle_song_model_free(brindle_song_model* model) {
    delete model;
}

size_t brindle_song_model_song_count(const brindle_song_model* model) {
    return model == nullptr ? 0 : model->mModel.Songs().size();
}

size_t brindle_song_model_chord_count(const brindle_song_model* model) {
    return model == nullptr ? 0 : model->mModel.ChordCount();
}

brindle_status brindle_song_model_songs_json(const brindle_song_model* model, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (model == nullptr) return FailForNull("model");
    return Guarded([&] { return GiveText(ModelSongsJson(model->mModel), text); });
}

brindle_status brindle_song_model_score_json(const brindle_song_model* model,
                                             const brindle_song* const* songs, size_t count,
                                             char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (model == nullptr) return FailForNull("model");
    return Guarded([&] {
        std::vector<brindle::CTaughtSong> taught;
        const brindle_status status = TeachAll(songs, count, taught);
        if (status != BRINDLE_OK) return status;
        if (taught.empty()) taught = model->mModel.Songs();
        const auto scores = ScoresByOrder(model->mModel, taught);
        return GiveText(brindle::SongScoresJson(scores, taught.size()), text);
    });
}

brindle_status brindle_song_model_read(const char* text, brindle_song_model** model) {
    if (CheckMaking(model, text) != BRINDLE_OK) return BRINDLE_ERROR_ARGUMENT;
    return Guarded([&] { return ReadSongModelText("the text", text, model); });
}

brindle_status brindle_song_model_read_file(const char* path, brindle_song_model** model) {
    if (CheckMaking(model, path) != BRINDLE_OK) return BRINDLE_ERROR_ARGUMENT;
    return Guarded([&] {
        const auto bytes = brindle::ReadWholeFile(path, kMaxSongModelBytes);
        const std::string name = brindle::Printable(path);
        if (!bytes) return Fail(BRINDLE_ERROR_FILE, name + " cannot be read");
        return ReadSongModelText(name, *bytes, model);
    });
}

brindle_status brindle_song_model_write(const brindle_song_model* model, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (model == nullptr) return FailForNull("model");
    return Guarded([&] { return GiveText(SongModelText(model->mModel), text); });
}

brindle_status brindle_song_model_write_file(const brindle_song_model* model, const char* path) {
    if (model == nullptr) return FailForNull("model");
    if (path == nullptr) return FailForNull("path");
    return Guarded([&] {
        if (brindle::WriteFileAtomically(path, SongModelText(model->mModel))) return BRINDLE_OK;
        const int reason = errno;
        return Fail(BRINDLE_ERROR_FILE,
                    brindle::Printable(path) + " cannot be written: " + std::strerror(reason));
    });
}
