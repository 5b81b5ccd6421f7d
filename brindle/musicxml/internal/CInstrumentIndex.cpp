// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/CInstrumentIndex.h"

#include "brindle/musicxml/MuxmlLimits.h"

#include <algorithm>
#include <utility>

namespace brindle::muxml {

CInstrumentIndex::CInstrumentIndex(std::vector<std::string> ids) : mIds(std::move(ids)) {
    if (mIds.size() > kMuxmlMaxInstruments) mIds.resize(kMuxmlMaxInstruments);
    for (std::uint32_t id = 0; id < mIds.size(); ++id) {
        if (mIds[id].size() > kMuxmlMaxInstrumentIdLength) {
            mIds[id].resize(kMuxmlMaxInstrumentIdLength);
        }
        // The end without any letter finds identifiers by the empty text.
        for (std::uint32_t begin = 0; begin <= mIds[id].size(); ++begin) {
            mEnds.push_back({id, begin});
        }
    }
    std::sort(mEnds.begin(), mEnds.end(),
              [this](const CEnd& a, const CEnd& b) { return TextOf(a) < TextOf(b); });
}

std::vector<std::size_t> CInstrumentIndex::Holding(std::string_view text, std::size_t limit) const {
    std::vector<std::size_t> found;
    auto end = std::lower_bound(
        mEnds.begin(), mEnds.end(), text,
        [this](const CEnd& entry, std::string_view sought) { return TextOf(entry) < sought; });
    for (; end != mEnds.end() && found.size() < limit && TextOf(*end).starts_with(text); ++end) {
        found.push_back(end->mId);
    }
    std::sort(found.begin(), found.end());
    found.erase(std::unique(found.begin(), found.end()), found.end());
    return found;
}

}  // namespace brindle::muxml
