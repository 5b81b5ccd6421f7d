// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/CJsonWriter.h"
#include "brindle/song/CSong.h"

#include <span>
#include <string>

namespace brindle {

/// A song with what is known about its chords, to be written. All must outlive this.
struct CReadSong {
    const CSong& mSong;            ///< not owned
    const CSongReading& mReading;  ///< of its chords, one entry each
    /// A sentence for each chord; empty to leave them out.
    std::span<const std::string> mExplanations = {};
};

/// Writes the member "Reading" into an object; see docs/json.md.
void WriteReading(CJsonWriter& json, const CReadSong& song);

}  // namespace brindle
