// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/CPaint.h"
#include "brindle/song/CSong.h"

#include <cstddef>
#include <string>

namespace brindle {

/// How a reading is shown.
struct CReadingTextOptions {
    /// Characters of a line. A song has four bars a line where they fit, else two or one.
    std::size_t mWidth = 80;
    /// Instead of the song by bars a table with a line for each chord.
    bool mIsLong = false;
};

/// A reading as a teacher pencils it over a lead sheet: title, key, the chords by bars with their
/// numerals below and the names of the keys above where they change, then which bars repeat
/// earlier ones, and notes. `reading` is that of the chords of the song.
///
/// Keys that contradict are told under the key. n log n in the chords.
[[nodiscard]] std::string ReadingText(const CSong& song, const CSongReading& reading,
                                      const CReadingTextOptions& options, const CPaint& paint);

/// Title and key, and under them each region with all its numerals.
[[nodiscard]] std::string RegionsText(const CSong& song, const CSongReading& reading,
                                      const CReadingTextOptions& options, const CPaint& paint);

/// "clear", "likely", "doubtful" or "hardly shown by the chords", for a confidence from 1 to 0.
[[nodiscard]] std::string_view ConfidenceInWords(double confidence);

}  // namespace brindle
