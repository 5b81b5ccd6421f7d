// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChChordElem.h"
#include "brindle/guitarchords/GChShortTuning.h"

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class GChTuningDescr;

/// An element of a detached fingering: the same fields and checks as in a fingering of a library.
using GChChordElemDescr = GChChordElem;

/// Most elements of a detached fingering, as in a file.
inline constexpr int kGChMaxElements = 15;

/// A fingering as a plain value, for a host that has no database. What its strings sound is told by
/// a GChTuningDescr.
class GChChordDescr {
public:
    /// Makes it a fingering without elements, of no chord.
    void clearDataFields() { *this = {}; }
    /// The same as assigning.
    void setToChordDescr(const GChChordDescr& other) { *this = other; }

    /// addFingerNum:absFret:minStrIndex:maxStrIndex:fingerPointType: false, and nothing is added,
    /// for a 16th element and for one that cannot exist.
    bool addFingerNum(int fingerNum, int absFret, int minStrIndex, int maxStrIndex,
                      std::uint8_t fingerPointType);
    /// The same for a real point.
    bool addFingerNum(int fingerNum, int absFret, int minStrIndex, int maxStrIndex);
    /// A real point on one string.
    bool addFingerNum(int fingerNum, int absFret, int strIndex);

    /// 0 to kGChMaxElements.
    [[nodiscard]] int numberOfElements() const { return mNumberOfElements; }
    /// In the order in which they were added.
    [[nodiscard]] std::vector<GChChordElemDescr> chordElems() const;
    /// By fret alone; those on one fret keep their order.
    [[nodiscard]] std::vector<GChChordElemDescr> chordElemsSortedByFret() const;
    /// The least fret of the elements, 0 being the first of the neck; 0 without elements.
    [[nodiscard]] int lowestAbsFretIndex() const;

    /// 0 is the easiest.
    [[nodiscard]] int difficultyLevel() const { return mDifficultyLevel; }
    /// Cut to one byte.
    void setDifficultyLevel(int level) { mDifficultyLevel = static_cast<std::uint8_t>(level); }
    /// Carried for the host; nothing here reads it.
    [[nodiscard]] int transposeRange() const { return mTransposeRange; }
    /// Cut to one byte.
    void setTransposeRange(int range) { mTransposeRange = static_cast<std::uint8_t>(range); }
    /// Key number, 0 to 11; -1 for none.
    [[nodiscard]] int rootNote() const { return mRootNote; }
    /// Cut to one signed byte.
    void setRootNote(int root) { mRootNote = static_cast<std::int8_t>(root); }
    /// Key number, 0 to 11; -1 for none.
    [[nodiscard]] int bassNote() const { return mBassNote; }
    /// Cut to one signed byte.
    void setBassNote(int bass) { mBassNote = static_cast<std::int8_t>(bass); }
    /// A CChordTypeId; 0 at first.
    [[nodiscard]] std::int16_t chordType() const { return mChordType; }
    /// Cut to one signed byte.
    void setChordType(int chordType) { mChordType = static_cast<std::int8_t>(chordType); }
    /// False for a string outside 0 to 15.
    [[nodiscard]] bool isMutedForStringIndex(int stringIndex) const;
    /// setMuted:forStringIndex: for index 0 to 15.
    void setMuted(bool isMuted, int stringIndex);
    /// The favorites, a bit for each transpose index.
    [[nodiscard]] std::uint32_t isFavoriteMask() const { return mIsFavoriteMask; }
    /// Replaces them all.
    void setIsFavoriteMask(std::uint32_t mask) { mIsFavoriteMask = mask; }
    /// A name that the user has given, empty for none.
    [[nodiscard]] const std::string& userName() const { return mUserName; }
    /// An empty name takes it away.
    void setUserName(std::string_view name) { mUserName = name; }

    /// pitchForStringIndex1:tuningDescr: under the capodaster of the tuning; -1 for a muted string
    /// and outside the strings of the tuning.
    [[nodiscard]] int pitchForStringIndex1(int stringIndex, const GChTuningDescr& tuning) const;
    /// chordNameWithTuningDescr: the harmonic name over the stored root; nothing for a root above
    /// 11.
    [[nodiscard]] std::optional<std::string> chordNameWithTuningDescr(
        const GChTuningDescr& tuning) const;

private:
    using TBytes = std::array<std::uint8_t, kGChMaxElements>;

    [[nodiscard]] GChChordElemDescr _ElemAt(std::size_t index) const;

    TBytes mFingers{};
    TBytes mFrets{};
    TBytes mMinStrings{};
    TBytes mMaxStrings{};
    TBytes mTypes{};
    std::uint8_t mNumberOfElements = 0;
    std::uint8_t mDifficultyLevel = 0;
    std::uint8_t mTransposeRange = 0;
    std::int8_t mRootNote = -1;
    std::int8_t mBassNote = -1;
    std::int8_t mChordType = 0;
    std::uint16_t mMuteBits = 0;
    std::uint32_t mIsFavoriteMask = 0;
    std::string mUserName;
};

}  // namespace brindle
