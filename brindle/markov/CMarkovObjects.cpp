// SPDX-License-Identifier: MIT
#include "brindle/markov/CMarkovObjects.h"

#include <algorithm>

namespace brindle {

MarkovIterator CMarkovObjects::insertObjectIfUnique(const CMarkovObject& object) {
    const MarkovIterator found = getIteratorToObject(object);
    if (found != end()) return found;
    CMarkovStoredObject& stored =
        mList.emplace_back(CMarkovStoredObject{object, static_cast<std::uint32_t>(size()), 0});
    const MarkovIterator added = std::prev(end());
    const auto nextClass = static_cast<std::uint32_t>(mOrderClasses.size());
    stored.mOrderClass = mOrderClasses.emplace(added, nextClass).first->second;
    mByPlace.push_back(added);
    mByHash.emplace(object.Hash(), added);
    return added;
}

MarkovIterator CMarkovObjects::getIteratorToObject(const CMarkovObject& object) const {
    const auto [first, last] = mByHash.equal_range(object.Hash());
    const auto found = std::find_if(first, last, [&object](const auto& entry) {
        return static_cast<const CMarkovObject&>(*entry.second) == object;
    });
    return found == last ? end() : found->second;
}

MarkovIterator CMarkovObjects::At(std::int64_t place) const {
    if (place < 0 || static_cast<std::uint64_t>(place) >= mByPlace.size()) return end();
    return mByPlace[static_cast<std::size_t>(place)];
}

void CMarkovObjects::Clear() {
    *this = CMarkovObjects();
}

bool operator==(const CMarkovObjects& a, const CMarkovObjects& b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](const CMarkovObject& x, const CMarkovObject& y) { return x == y; });
}

}  // namespace brindle
