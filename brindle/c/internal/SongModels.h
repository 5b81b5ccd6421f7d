// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/internal/Border.h"

#include "brindle/song/CSongModel.h"

#include <utility>

/// A model that never changes.
struct brindle_song_model {
    brindle::CSongModel mModel;
};

namespace brindle::border {

inline brindle_status GiveModel(CSongModel made, brindle_song_model** model) {
    *model = new brindle_song_model{std::move(made)};
    return BRINDLE_OK;
}

}  // namespace brindle::border
