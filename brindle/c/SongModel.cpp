// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Values.h"

#include "brindle/present/NextChordsText.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/NextChords.h"

#include <memory>
#include <vector>

using namespace brindle::border;

struct brindle_song_model {
    brindle::CSongModel mModel;
};

namespace {

constexpr int kLastPlace = 5;
static_assert(kLastPlace == brindle::TBarPlace_Weak);

brindle::CNextChordOptions FromC(const brindle_next_options& options) {
    brindle::CNextChordOptions result;
    result.mKey = brindle::border::FromC(options.key);
    result.mCount = options.limit;
    result.mPlace = static_cast<brindle::TBarPlace>(options.place);
    return result;
}

std::vector<brindle::CChordLite> FromC(const brindle_chord* chords, size_t count) {
    std::vector<brindle::CChordLite> result;
    result.reserve(count);
    for (size_t ix = 0; ix < count; ++ix) result.push_back(brindle::border::FromC(chords[ix]));
    return result;
}

}  // namespace

brindle_next_options brindle_next_options_default(void) {
    const brindle::CNextChordOptions usual;
    return {ToC(usual.mKey), usual.mCount, usual.mPlace};
}

brindle_status brindle_song_model_built_in(const char* style, brindle_song_model** model) {
    if (model == nullptr) return FailForNull("model");
    *model = nullptr;
    return Guarded([&] {
        auto result = std::make_unique<brindle_song_model>();
        result->mModel = brindle::BuiltInSongModel(style == nullptr ? "" : style);
        if (result->mModel.IsEmpty()) {
            return Fail(BRINDLE_ERROR_NOT_FOUND, "no built-in song has this style");
        }
        *model = result.release();
        return BRINDLE_OK;
    });
}

void brindle_song_model_free(brindle_song_model* model) {
    delete model;
}

brindle_status brindle_song_model_next_json(const brindle_song_model* model,
                                            const brindle_chord* chords, size_t count,
                                            const brindle_next_options* options, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (model == nullptr) return FailForNull("model");
    if (chords == nullptr && count > 0) return FailForNull("chords");
    return Guarded([&] {
        const auto used = options != nullptr ? *options : brindle_next_options_default();
        if (used.place < 0 || used.place > kLastPlace) {
            return Fail(BRINDLE_ERROR_ARGUMENT, "a place is 0 to 5");
        }
        return GiveText(
            NextChordsJson(NextChords(model->mModel, FromC(chords, count), FromC(used))), text);
    });
}
