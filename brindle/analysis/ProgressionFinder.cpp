// SPDX-License-Identifier: MIT
#include "brindle/analysis/ProgressionFinder.h"

#include <algorithm>
#include <cstdint>
#include <iterator>

namespace brindle {

namespace {

/// Semitones up from one root to the next, whole octaves left out.
std::int64_t Rise(std::int64_t from, std::int64_t to) {
    const std::int64_t rise = (to - from) % 12;
    return rise < 0 ? rise + 12 : rise;
}

}  // namespace

CProgressionFinder::CProgressionFinder(const CHarmAnlsProgressions& table,
                                       const CHarmAnlsChords& chords)
    : mChords(chords) {
    const auto last = chords.LastNonUndefChord();
    if (last != chords.end()) mRealCount = static_cast<std::size_t>(last - chords.begin()) + 1;
    for (const CHarmAnlsProgression& row : table) {
        if (!row.empty()) mSortedRows.push_back(&row);
    }
    std::stable_sort(mSortedRows.begin(), mSortedRows.end(), [](const auto* a, const auto* b) {
        return a->size() != b->size() ? a->size() > b->size() : a->mPriority > b->mPriority;
    });
}

std::span<const CHarmAnlsProgression* const> CProgressionFinder::BestRowsAt(std::size_t at) {
    mBestRows.clear();
    for (const CHarmAnlsProgression* row : mSortedRows) {
        if (!mBestRows.empty() && !row->MatchesAsGoodAs(*mBestRows.front())) break;
        if (Matches(*row, at)) mBestRows.push_back(row);
    }
    return mBestRows;
}

const CHarmAnlsProgression* CProgressionFinder::BestRowAt(std::size_t at) {
    const auto row = std::find_if(mSortedRows.begin(), mSortedRows.end(),
                                  [&](const auto* candidate) { return Matches(*candidate, at); });
    return row != mSortedRows.end() ? *row : nullptr;
}

const CHarmAnlsProgression* CProgressionFinder::NextBestRow(std::size_t& at) {
    for (; at < mRealCount; ++at) {
        if (const CHarmAnlsProgression* row = BestRowAt(at)) return row;
    }
    at = mChords.size();
    return nullptr;
}

bool CProgressionFinder::Matches(const CHarmAnlsProgression& row, std::size_t at) const {
    if (at >= mRealCount || mRealCount - at < row.size()) return false;
    for (std::size_t n = 0; n < row.size(); ++n) {
        const CHarmAnlsChord& chord = mChords[at + n];
        if (!row[n].mSemitonesMatch.Matches(chord.mSemitones)) return false;
        if (n == 0) continue;
        const auto wanted = Rise(row[n - 1].mRootDistToHarmCenter, row[n].mRootDistToHarmCenter);
        if (wanted != Rise(mChords[at + n - 1].mRootKeyEnh.mKeyNr, chord.mRootKeyEnh.mKeyNr)) {
            return false;
        }
    }
    return true;
}

}  // namespace brindle
