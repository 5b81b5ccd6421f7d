// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/brindle.h"

#include <doctest/doctest.h>

#include <memory>
#include <string>
#include <string_view>

/// Handles of C that free themselves, and what is asked of them as values.
namespace brindle::test {

template <auto Free>
struct CFree {
    template <class T>
    void operator()(T* handle) const {
        Free(handle);
    }
};

using TSong = std::unique_ptr<brindle_song, CFree<brindle_song_free>>;
using TAnalysis = std::unique_ptr<brindle_analysis, CFree<brindle_analysis_free>>;
using TNames = std::unique_ptr<brindle_names, CFree<brindle_names_free>>;
using TPackage = std::unique_ptr<brindle_grid_package, CFree<brindle_grid_package_free>>;
using TGrids = std::unique_ptr<brindle_grids, CFree<brindle_grids_free>>;
using TModel = std::unique_ptr<brindle_markov, CFree<brindle_markov_free>>;

inline TSong ReadSongOf(std::string_view text, const brindle_song_options* options = nullptr) {
    brindle_song* song = nullptr;
    REQUIRE(brindle_song_read(text.data(), text.size(), options, &song) == BRINDLE_OK);
    return TSong(song);
}

inline TAnalysis AnalysisOf(const TSong& song, const brindle_analysis_options* options = nullptr) {
    brindle_analysis* analysis = nullptr;
    REQUIRE(brindle_analyse(song.get(), options, &analysis) == BRINDLE_OK);
    return TAnalysis(analysis);
}

/// The text that a call gives, or its error in brackets.
template <class TCall, class... TArguments>
std::string TextOf(const TCall& call, TArguments... arguments) {
    char* text = nullptr;
    if (call(arguments..., &text) != BRINDLE_OK) {
        CHECK(text == nullptr);
        return std::string("[") + brindle_last_error() + "]";
    }
    std::string result = text;
    brindle_free(text);
    return result;
}

/// "C Eb Gb"
inline std::string NamesOf(const brindle_tone* tones, std::size_t count) {
    std::string names;
    for (std::size_t i = 0; i < count; ++i) {
        names += (i > 0 ? " " : "") + TextOf(brindle_tone_write, tones + i, nullptr);
    }
    return names;
}

}  // namespace brindle::test
