// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Handles.h"

#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/SeededRandom.h"
#include "brindle/present/MarkovText.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/LearnSong.h"

#include <fmt/format.h>

#include <cerrno>
#include <cmath>
#include <cstring>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

using namespace brindle::border;

struct brindle_markov {
    brindle::VariableLengthMarkovModel mModel;
};

namespace {

using TModelReader = brindle::VariableLengthMarkovModel::JSONDeserialization_Helper;

// Longer histories than this are no music but a damaged file.
constexpr std::size_t kLongestOrder = 64;
constexpr double kMostBeats = 10000.0;
constexpr std::size_t kMostSamples = 100'000;
constexpr std::size_t kMaxModelBytes = std::size_t{1} << 30;
// A second or two of search.
constexpr brindle::CMarkovSearchLimits kSearchLimits{10'000, 1'000'000};

brindle_status ReadModel(const std::string& text, brindle_markov** model) {
    auto result = std::make_unique<brindle_markov>();
    TModelReader::VariableLengthMarkovModelFromJSONString(text, result->mModel);
    const std::size_t order = result->mModel.mMaxHistoryLength;
    if (order == 0) return Fail(BRINDLE_ERROR_INPUT, "this is no model file");
    if (order > kLongestOrder) {
        return Fail(BRINDLE_ERROR_INPUT, "the model has histories that are too long");
    }
    if (!result->mModel.mTransitionMap.HasUsualCounts()) {
        return Fail(BRINDLE_ERROR_INPUT, "the model has counts that are 0 or too large");
    }
    *model = result.release();
    return BRINDLE_OK;
}

std::string TextOf(const brindle_markov& model) {
    std::ostringstream text;
    model.mModel.AppendJSONString(text);
    return text.str();
}

// What is wrong with options; null if nothing is.
const char* FaultOf(const brindle_markov_options& options) {
    const bool areBeats = std::isfinite(options.beats) && options.beats >= 1.0;
    if (!areBeats || options.beats > kMostBeats) return "a sequence has 1 to 10000 beats";
    const bool areSamples = options.samples >= 1 && options.samples <= kMostSamples;
    return areSamples ? nullptr : "there are 1 to 100000 samples";
}

brindle::TMarkovGenerateOptions OptionsFor(brindle::VariableLengthMarkovModel& model,
                                           const brindle_markov_options& options) {
    brindle::TMarkovGenerateOptions generate = UsualGenerateOptions(model, options.beats);
    if (options.max_order != 0) generate.mMaxHistoryLength = options.max_order;
    generate.mSampleCount = options.samples;
    generate.Validate(model);
    return generate;
}

}  // namespace

brindle_markov_options brindle_markov_options_default(void) {
    return {32.0, 0, 0, 10};
}

brindle_status brindle_markov_new(size_t order, brindle_markov** model) {
    if (model == nullptr) return FailForNull("model");
    *model = nullptr;
    return Guarded([&] {
        if (order < 1 || order > kLongestOrder) {
            return Fail(BRINDLE_ERROR_ARGUMENT, "an order is 1 to 64");
        }
        *model = std::make_unique<brindle_markov>(
                     brindle_markov{brindle::VariableLengthMarkovModel(order)})
                     .release();
        return BRINDLE_OK;
    });
}

void brindle_markov_free(brindle_markov* model) {
    delete model;
}

brindle_status brindle_markov_learn(brindle_markov* model, const brindle_song* song) {
    if (model == nullptr) return FailForNull("model");
    if (song == nullptr) return FailForNull("song");
    return Guarded([&] {
        if (song->mSong.HasFault()) {
            return Fail(BRINDLE_ERROR_INPUT, "the song has a fault");
        }
        if (LearnSong(model->mModel, song->mSong) == 0) {
            return Fail(BRINDLE_ERROR_INPUT, "the song has no chords");
        }
        return BRINDLE_OK;
    });
}

size_t brindle_markov_symbol_count(const brindle_markov* model) {
    return model == nullptr ? 0 : model->mModel.mObjects.size();
}

size_t brindle_markov_order(const brindle_markov* model) {
    return model == nullptr ? 0 : model->mModel.mMaxHistoryLength;
}

brindle_status brindle_markov_read(const char* text, brindle_markov** model) {
    if (model == nullptr) return FailForNull("model");
    *model = nullptr;
    if (text == nullptr) return FailForNull("text");
    return Guarded([&] { return ReadModel(text, model); });
}

brindle_status brindle_markov_read_file(const char* path, brindle_markov** model) {
    if (model == nullptr) return FailForNull("model");
    *model = nullptr;
    if (path == nullptr) return FailForNull("path");
    return Guarded([&] {
        const auto bytes = brindle::ReadWholeFile(path, kMaxModelBytes);
        if (!bytes) {
            return Fail(BRINDLE_ERROR_FILE, brindle::Printable(path) + " cannot be read");
        }
        return ReadModel(*bytes, model);
    });
}

brindle_status brindle_markov_write(const brindle_markov* model, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (model == nullptr) return FailForNull("model");
    return Guarded([&] { return GiveText(TextOf(*model), text); });
}

brindle_status brindle_markov_write_file(const brindle_markov* model, const char* path) {
    if (model == nullptr) return FailForNull("model");
    if (path == nullptr) return FailForNull("path");
    return Guarded([&] {
        if (model->mModel.SaveToFile(path)) return BRINDLE_OK;
        const int reason = errno;
        return Fail(BRINDLE_ERROR_FILE,
                    brindle::Printable(path) + " cannot be written: " + std::strerror(reason));
    });
}

brindle_status brindle_markov_generate(brindle_markov* model, const brindle_markov_options* options,
                                       char** chords) {
    if (chords == nullptr) return FailForNull("chords");
    *chords = nullptr;
    if (model == nullptr) return FailForNull("model");
    return Guarded([&] {
        const auto used = options != nullptr ? *options : brindle_markov_options_default();
        if (const char* const fault = FaultOf(used)) return Fail(BRINDLE_ERROR_ARGUMENT, fault);
        model->mModel.SetRandomSource(
            [random = brindle::SeededRandom(used.seed)]() mutable { return random.Next(); });
        model->mModel.SetSearchLimits(kSearchLimits);
        brindle::TMarkovSampledSequence chosen;
        std::vector<brindle::TMarkovSampledSequence> sequences;
        model->mModel.SampleSequenceWithLength(chosen, sequences, true,
                                               OptionsFor(model->mModel, used));
        if (chosen.mSymbols.empty()) {
            return Fail(BRINDLE_ERROR_NOT_FOUND, "the model has no sequence of this length");
        }
        const brindle::CMarkovSpelling spelling(chosen.mSymbols);
        return GiveText(ChordString(chosen.mSymbols, spelling), chords);
    });
}
