// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <optional>

namespace brindle {

/// Numbers of fingers: 0 to 5. FindFingerings takes 1 for the index finger to 4 for the little one.
inline constexpr int kGChFingers = 6;
/// Indexes of frets: 0 to 31.
inline constexpr int kGChFrets = 32;

/// Whether a point of a fingering sounds. A point that was read from a file and is not real has
/// the type 64, which is neither of these.
enum GChFingerPointType : std::uint8_t {
    GChFingerPointType_Real = 0,      ///< a finger that is put down
    GChFingerPointType_Optional = 1,  ///< an alternative that the player may add
};

/// One finger on one string, a single spot, or on several, a barre.
///
/// Fret 0 is the first fret of the neck. Strings are counted from 0.
class GChChordElem {
public:
    /// initWithFingerNumber:absFretIndex:coveredMinStr:coveredMaxStr:fingerPointType:
    ///
    /// Nothing unless the finger is 0 to 5, the fret 0 to 31, and the strings are 0 to 15 with the
    /// lower one first.
    [[nodiscard]] static std::optional<GChChordElem> make(
        int fingerNumber, int absFretIndex, int coveredMinStr, int coveredMaxStr,
        std::uint8_t fingerPointType = GChFingerPointType_Real);

    /// 0 to 5, see kGChFingers.
    [[nodiscard]] int fingerNumber() const { return mFingerNumber; }
    /// From 0, the first fret of the neck. Negative when it was shifted below the neck.
    [[nodiscard]] int absFretIndex() const { return mAbsFretIndex; }
    /// The string with the highest index that it holds.
    [[nodiscard]] int coveredMaxStr() const { return mCoveredMaxStr; }
    /// The string with the lowest index that it holds.
    [[nodiscard]] int coveredMinStr() const { return mCoveredMinStr; }
    /// A GChFingerPointType, or 64.
    [[nodiscard]] std::uint8_t fingerPointType() const { return mFingerPointType; }

    /// The string of a single spot, -1 for a barre.
    [[nodiscard]] int singleStringIndex() const;
    /// Whether it holds one string.
    [[nodiscard]] bool isSingleSpot() const { return mCoveredMinStr == mCoveredMaxStr; }
    /// Whether it holds several.
    [[nodiscard]] bool isBarre() const { return mCoveredMinStr < mCoveredMaxStr; }
    /// Whether it sounds: neither an alternative nor a point of type 64.
    [[nodiscard]] bool isReal() const { return mFingerPointType == GChFingerPointType_Real; }
    /// Whether it holds the string.
    [[nodiscard]] bool coversString(int stringIndex) const {
        return mCoveredMinStr <= stringIndex && stringIndex <= mCoveredMaxStr;
    }

    /// setCoveredMinStr:coveredMaxStr: without a check.
    void setCoveredMinStr(std::uint8_t minStr, std::uint8_t maxStr);
    /// shiftFretIndexBy: adds in one byte and never stops at the ends of the neck.
    void shiftFretIndexBy(int frets);

    /// isEqualToChordElem: all five fields.
    [[nodiscard]] bool isEqualToChordElem(const GChChordElem& other) const;

    /// All fields as unsigned bytes, by their names.
    [[nodiscard]] nlohmann::json propertyList() const;

private:
    GChChordElem() = default;

    std::uint8_t mFingerNumber = 0;
    std::int8_t mAbsFretIndex = 0;
    std::uint8_t mCoveredMaxStr = 0;
    std::uint8_t mCoveredMinStr = 0;
    std::uint8_t mFingerPointType = GChFingerPointType_Real;
};

static_assert(sizeof(GChChordElem) == 5);

/// The property list, for debugging.
std::ostream& operator<<(std::ostream& stream, const GChChordElem& elem);

}  // namespace brindle
