// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// How a host draws a grid. -1 is "not set".
class GChDisplayOptions {
public:
    /// How many frets are drawn; -1 leaves it to the host.
    [[nodiscard]] std::int64_t numberOfFrets() const { return mNumberOfFrets; }
    /// Any number; it is not checked.
    void setNumberOfFrets(std::int64_t frets) { mNumberOfFrets = frets; }
    /// 1: the lowest string stands on the right. 0 or 1 once it is set, as the type of barres.
    [[nodiscard]] std::int8_t mirrorStrings() const { return mMirrorStrings; }
    /// Sets it to 1 or 0.
    void setMirrorStrings(bool mirrors) { mMirrorStrings = mirrors ? 1 : 0; }
    /// For the host: one of its two ways to draw a barre.
    [[nodiscard]] std::int8_t barreType() const { return mBarreType; }
    /// Sets it to 1 or 0.
    void setBarreType(bool barreType) { mBarreType = barreType ? 1 : 0; }

private:
    std::int64_t mNumberOfFrets = -1;
    std::int8_t mMirrorStrings = -1;
    std::int8_t mBarreType = -1;
};

}  // namespace brindle
