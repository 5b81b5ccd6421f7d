// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Handles.h"
#include "brindle/c/internal/SongModels.h"
#include "brindle/c/internal/Values.h"

#include "brindle/present/NextChordsText.h"
#include "brindle/present/WrittenSongText.h"
#include "brindle/song/NextChords.h"
#include "brindle/song/SongRequest.h"

#include <memory>
#include <string>
#include <vector>

using namespace brindle::border;

namespace {

constexpr int kLastPlace = 5;
static_assert(kLastPlace == brindle::TBarPlace_Weak);

brindle::CNextChordOptions FromC(const brindle_next_options& options) {
    brindle::CNextChordOptions result;
    result.mKey = brindle::border::FromC(options.key);
    result.mCount = options.limit;
    result.mPlace = static_cast<brindle::TBarPlace>(options.place);
    result.mOrder = options.order;
    return result;
}

// What is wrong with options; null if nothing is.
const char* NextFaultOf(const brindle_next_options& options) {
    if (options.place < 0 || options.place > kLastPlace) return "a place is 0 to 5";
    static_assert(brindle::CSongModel::kLongestHistory == 5);
    return options.order >= 1 && options.order <= 5 ? nullptr : "an order is 1 to 5";
}

std::vector<brindle::CChordLite> FromC(const brindle_chord* chords, size_t count) {
    std::vector<brindle::CChordLite> result;
    result.reserve(count);
    for (size_t ix = 0; ix < count; ++ix) result.push_back(brindle::border::FromC(chords[ix]));
    return result;
}

std::string WishOf(const char* text) {
    return text == nullptr ? std::string() : std::string(text);
}

brindle::CSongRequestReading RequestFromC(const brindle_write_options& options) {
    brindle::CSongRequestReading reading = brindle::ReadSongRequest(
        {brindle::border::FromC(options.key), WishOf(options.form), options.bars,
         options.beats_per_bar, WishOf(options.sheet), WishOf(options.begins), WishOf(options.ends),
         WishOf(options.contains), WishOf(options.never)});
    reading.mOptions.mMostQuotedBars = options.most_quoted_bars;
    reading.mOptions.mOrder = options.order;
    reading.mOptions.mSeed = options.seed;
    return reading;
}

brindle_status FailForRequest(const brindle::CSongRequestReading& request) {
    const std::string range = RangeFaultOf(request.mOptions);
    if (!range.empty()) return Fail(BRINDLE_ERROR_ARGUMENT, range);
    if (request.mOptions.mKey.IsUndef()) return Fail(BRINDLE_ERROR_ARGUMENT, "the key is none");
    if (!request.mFault.empty()) return Fail(BRINDLE_ERROR_INPUT, request.mFault);
    return BRINDLE_OK;
}

}  // namespace

brindle_next_options brindle_next_options_default(void) {
    const brindle::CNextChordOptions usual;
    return {ToC(usual.mKey), usual.mCount, usual.mPlace, usual.mOrder};
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
        if (const char* const fault = NextFaultOf(used)) return Fail(BRINDLE_ERROR_ARGUMENT, fault);
        return GiveText(
            NextChordsJson(NextChords(model->mModel, FromC(chords, count), FromC(used))), text);
    });
}

brindle_write_options brindle_write_options_default(void) {
    const brindle::CWriteSongOptions usual;
    brindle_write_options options = {};
    options.key = ToC(usual.mKey);
    options.beats_per_bar = usual.mBeatsPerBar;
    options.most_quoted_bars = usual.mMostQuotedBars;
    options.order = usual.mOrder;
    options.seed = usual.mSeed;
    return options;
}

brindle_status brindle_song_model_write_song(const brindle_song_model* model,
                                             const brindle_write_options* options,
                                             brindle_song** song, char** json) {
    if (json != nullptr) *json = nullptr;
    if (song == nullptr) return FailForNull("song");
    *song = nullptr;
    if (model == nullptr) return FailForNull("model");
    return Guarded([&] {
        const auto used = options != nullptr ? *options : brindle_write_options_default();
        const brindle::CSongRequestReading request = RequestFromC(used);
        const brindle_status status = FailForRequest(request);
        if (status != BRINDLE_OK) return status;
        const brindle::CWrittenSong written = WriteRequestedSong(model->mModel, request);
        if (!written.mFault.empty()) {
            return Fail(BRINDLE_ERROR_NOT_FOUND, WrittenSongFault(written));
        }
        auto made = std::make_unique<brindle_song>(brindle_song{written.mSong});
        if (json != nullptr) {
            GiveText(WrittenSongJson(written, request.mOptions.mForm, used.seed), json);
        }
        *song = made.release();
        return BRINDLE_OK;
    });
}
