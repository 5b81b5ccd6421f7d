// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsProgressions.h"

#include <cstddef>
#include <span>
#include <vector>

namespace brindle {

/// Tries the rows of a table on one chord list again and again, without copying rows.
///
/// The rows are sorted once. Since the sort is stable, the rows that match at a place, taken in
/// that order, are the sorted list of the matching rows, so the search ends with the first group
/// of rows of equal length and priority that matches. Table and chords must outlive the finder
/// and stay as they are.
class CProgressionFinder {
public:
    /// Both are borrowed; rows without elements are left out.
    CProgressionFinder(const CHarmAnlsProgressions& table, const CHarmAnlsChords& chords);

    /// The best rows that match from the chord at index `at` on, in table order. Valid until the
    /// next call.
    [[nodiscard]] std::span<const CHarmAnlsProgression* const> BestRowsAt(std::size_t at);
    /// The first of them, or null.
    [[nodiscard]] const CHarmAnlsProgression* BestRowAt(std::size_t at);
    /// The best row at the first chord from `at` on where a row matches; `at` moves there, or to
    /// the end of the list if there is none.
    [[nodiscard]] const CHarmAnlsProgression* NextBestRow(std::size_t& at);

private:
    [[nodiscard]] bool Matches(const CHarmAnlsProgression& row, std::size_t at) const;

    const CHarmAnlsChords& mChords;
    /// Number of chords up to the last real one.
    std::size_t mRealCount = 0;
    std::vector<const CHarmAnlsProgression*> mSortedRows;
    std::vector<const CHarmAnlsProgression*> mBestRows;
};

}  // namespace brindle
