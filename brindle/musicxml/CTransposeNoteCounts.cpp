// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CTransposeNoteCounts.h"

#include "brindle/musicxml/MuxmlLimits.h"

namespace brindle {

void CTransposeNoteCounts::Add(const CMuxmlTranspose& transpose, std::int32_t noteCount) {
    // By hand, since std::lower_bound asks for a list that the order divides in two.
    std::size_t begin = 0;
    std::size_t end = mEntries.size();
    while (begin < end) {
        const std::size_t middle = begin + (end - begin) / 2;
        if (mEntries[middle].first < transpose) {
            begin = middle + 1;
        } else {
            end = middle;
        }
    }
    if (begin == mEntries.size() || transpose < mEntries[begin].first) {
        if (mEntries.size() >= kMuxmlMaxTransposes) return;
        mEntries.insert(mEntries.begin() + static_cast<std::ptrdiff_t>(begin), {transpose, 0});
    }
    mEntries[begin].second += noteCount;
}

CMuxmlTranspose CTransposeNoteCounts::TransposeWithMostNotes() const {
    const TEntry* most = nullptr;
    for (const TEntry& entry : mEntries) {
        if (most == nullptr || entry.second > most->second) most = &entry;
    }
    return most == nullptr ? CMuxmlTranspose() : most->first;
}

}  // namespace brindle
