// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// How a host draws a grid. -1 is "not set".
class GChDisplayOptions {
public:
    [[nodiscard]] std::int64_t numberOfFrets() const { return mNumberOfFrets; }
    void setNumberOfFrets(std::int64_t frets) { mNumberOfFrets = frets; }
    /// 1: the lowest string stands on the right. 0 or 1 once it is set, as the type of barres.
    [[nodiscard]] std::int8_t mirrorStrings() const { return mMirrorStrings; }
    void setMirrorStrings(bool mirrors) { mMirrorStrings = mirrors ? 1 : 0; }
    [[nodiscard]] std::int8_t barreType() const { return mBarreType; }
    void setBarreType(bool barreType) { mBarreType = barreType ? 1 : 0; }

private:
    std::int64_t mNumberOfFrets = -1;
    std::int8_t mMirrorStrings = -1;
    std::int8_t mBarreType = -1;
};

}  // namespace brindle
