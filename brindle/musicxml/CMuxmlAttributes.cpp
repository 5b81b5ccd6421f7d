// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlAttributes.h"

namespace brindle {

CMuxmlAttributes::CMuxmlAttributes(
    std::initializer_list<std::pair<const std::string_view, std::string_view>> attributes)
    : mCount(attributes.size()) {
    for (const auto& [name, value] : attributes) mAttributes.emplace_back(name, value);
}

void CMuxmlAttributes::Assign(const XmlAttributes& attributes) {
    mCount = static_cast<std::size_t>(attributes.size());
    if (mAttributes.size() < mCount) mAttributes.resize(mCount);
    for (std::size_t n = 0; n < mCount; ++n) {
        const auto [name, value] = attributes.At(static_cast<int>(n));
        mAttributes[n].first = name;
        mAttributes[n].second = value;
    }
}

std::optional<std::string_view> CMuxmlAttributes::Find(std::string_view name) const {
    for (std::size_t n = 0; n < mCount; ++n) {
        if (mAttributes[n].first == name) return mAttributes[n].second;
    }
    return std::nullopt;
}

}  // namespace brindle
