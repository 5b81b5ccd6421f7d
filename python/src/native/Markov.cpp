// SPDX-License-Identifier: MIT
#include "Bind.h"
#include "Errors.h"
#include "SourceSong.h"

#include <nanobind/stl/shared_ptr.h>
#include <nanobind/stl/string.h>

#include <cstdint>
#include <memory>
#include <mutex>
#include <string>

namespace brindle::python {
namespace {

constexpr const char* kKind = "ModelError";

/// A model; its calls come one after the other, whatever thread they come from.
class CModel {
public:
    explicit CModel(brindle_markov* model) : mModel(model) {}
    CModel(const CModel&) = delete;
    CModel& operator=(const CModel&) = delete;
    ~CModel() { brindle_markov_free(mModel); }

    /// What `call` gives for the handle.
    template <class TCall>
    auto With(const TCall& call) const {
        const nb::gil_scoped_release released;
        const std::lock_guard lock(mMutex);
        return call(mModel);
    }

private:
    brindle_markov* mModel;
    mutable std::mutex mMutex;
};

using CModelPtr = std::shared_ptr<CModel>;

CModelPtr NewModel(std::size_t order) {
    brindle_markov* model = nullptr;
    if (order < 1 || order > 64) throw nb::value_error("an order is 1 to 64");
    Check(brindle_markov_new(order, &model), kKind);
    return std::make_shared<CModel>(model);
}

CModelPtr ModelOfText(const std::string& text) {
    brindle_markov* model = nullptr;
    {
        const nb::gil_scoped_release released;
        Check(brindle_markov_read(text.c_str(), &model), kKind);
    }
    return std::make_shared<CModel>(model);
}

struct CFreeSong {
    void operator()(brindle_song* song) const { brindle_song_free(song); }
};
using CSongHandle = std::unique_ptr<brindle_song, CFreeSong>;

// The song for the C interface, read and transposed again.
CSongHandle HandleOf(const CSourceSong& source) {
    brindle_song* song = nullptr;
    brindle_song_options options = brindle_song_options_default();
    options.format = source.mOptions.mFormat;
    options.beats_per_bar = source.mOptions.mBeatsPerBar;
    options.beats_per_chord = source.mOptions.mBeatsPerChord;
    options.even = source.mOptions.mEven ? 1 : 0;
    options.lenient = source.mOptions.mLenient ? 1 : 0;
    Check(brindle_song_read(source.mSource.data(), source.mSource.size(), &options, &song),
          "SongError");
    CSongHandle handle(song);
    for (const int step : source.mSteps) {
        Check(brindle_song_transpose(handle.get(), step, &song), "SongError");
        handle.reset(song);
    }
    return handle;
}

void Learn(const CModel& model, const CSourceSong& source) {
    CheckUnderstood(source);
    model.With([&](brindle_markov* handle) {
        Check(brindle_markov_learn(handle, HandleOf(source).get()), "SongError");
    });
}

std::string TextOf(const CModel& model) {
    char* text = nullptr;
    model.With([&](brindle_markov* handle) { Check(brindle_markov_write(handle, &text), kKind); });
    return CText(text).get();
}

std::string Generate(const CModel& model, std::uint64_t seed, double beats, std::size_t order,
                     std::size_t samples) {
    const brindle_markov_options options{beats, seed, order, samples};
    char* chords = nullptr;
    model.With([&](brindle_markov* handle) {
        Check(brindle_markov_generate(handle, &options, &chords), kKind);
    });
    return CText(chords).get();
}

}  // namespace

void BindMarkov(nb::module_& module) {
    nb::class_<CModel> model(module, "_Model", "The model behind MarkovModel.");
    model.def_static("new", NewModel, nb::arg("order"));
    model.def_static("of_text", ModelOfText, nb::arg("text"));
    model.def("learn", Learn, nb::arg("song"));
    model.def("text", TextOf);
    model.def("generate", Generate, nb::arg("seed"), nb::arg("beats"), nb::arg("order"),
              nb::arg("samples"));
    model.def_prop_ro("order", [](const CModel& self) {
        return self.With([](brindle_markov* handle) { return brindle_markov_order(handle); });
    });
    model.def_prop_ro("symbol_count", [](const CModel& self) {
        return self.With(
            [](brindle_markov* handle) { return brindle_markov_symbol_count(handle); });
    });
}

}  // namespace brindle::python
