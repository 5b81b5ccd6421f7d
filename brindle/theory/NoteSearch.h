// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

// The note of a given key next to a given note. All give -1 when the key is 15 or the note is
// undefined. The results are limited to 0 to 127, where the limit may change the key; only the
// strict forms leave the keyboard, so that callers see that there is no such note.

/// The lowest note of the key at or above `noteNr`.
[[nodiscard]] std::int64_t NoteNrOfKeyNrLargerOrEqualTo(int keyNr, std::int64_t noteNr);
/// The note of the key strictly above `noteNr`, up to 139.
[[nodiscard]] std::int64_t NoteNrOfKeyNrLargerThan(int keyNr, std::int64_t noteNr);
/// The highest note of the key at or below `noteNr`.
[[nodiscard]] std::int64_t NoteNrOfKeyNrSmallerOrEqualTo(int keyNr, std::int64_t noteNr);
/// The note of the key strictly below `noteNr`; 0 when there is none, or -12 below note 0.
[[nodiscard]] std::int64_t NoteNrOfKeyNrSmallerThan(int keyNr, std::int64_t noteNr);

/// The lowest note at or above `noteNr` that has the key of `model`.
[[nodiscard]] std::int64_t NoteNrWithSameKeyNrLargerOrEqualTo(std::int64_t model,
                                                              std::int64_t noteNr);
/// The note strictly above `noteNr` that has the key of `model`.
[[nodiscard]] std::int64_t NoteNrWithSameKeyNrLargerThan(std::int64_t model, std::int64_t noteNr);

}  // namespace brindle
