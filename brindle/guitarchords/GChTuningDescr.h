// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChShortTuning.h"

#include <cstdint>
#include <iosfwd>
#include <nlohmann/json_fwd.hpp>

namespace brindle {

/// A tuning with its capodaster as a plain value, for a host that has no database.
class GChTuningDescr {
public:
    GChTuningDescr() = default;
    /// As many strings as the tuning has.
    explicit GChTuningDescr(const GChShortTuning& tuning, int capodasterOffset = 0);

    /// Makes it a tuning without strings.
    void clearDataFields() { *this = {}; }

    /// The fret of the capodaster in one byte; 0 and 255 are none.
    [[nodiscard]] int capodasterOffset() const { return mCapodasterOffset; }
    /// Cut to one byte.
    void setCapodasterOffset(int offset) { mCapodasterOffset = static_cast<std::uint8_t>(offset); }
    /// Told by setNumberOfStrings; it may be more than the 16 that have a pitch.
    [[nodiscard]] int numberOfStrings() const { return mNumberOfStrings; }
    /// Cut to one byte; the pitches stay.
    void setNumberOfStrings(int count) { mNumberOfStrings = static_cast<std::uint8_t>(count); }
    /// -1 outside the strings.
    [[nodiscard]] int openStringPitchForStringIndex(int stringIndex) const;
    /// setOpenStringPitch:forStringIndex: for index 0 to 15; the number of strings stays.
    void setOpenStringPitch(int pitch, int stringIndex);

    /// Capodaster below 32 or 255, at most 16 strings, each with a pitch of 1 to 127.
    [[nodiscard]] bool isValid() const;

    /// The same as assigning.
    void setToTuningDescr(const GChTuningDescr& other) { *this = other; }
    /// Same strings, pitches and capodaster.
    [[nodiscard]] bool isEqualToTuningDescr(const GChTuningDescr& other) const;
    /// Without the capodaster.
    [[nodiscard]] bool isEqualToTuningStrings(const GChTuningDescr& other) const;

    /// The pitches of the strings and the capodaster.
    [[nodiscard]] nlohmann::json propertyList() const;

private:
    [[nodiscard]] int _UsedStrings() const;

    std::uint8_t mCapodasterOffset = 0;
    std::uint8_t mNumberOfStrings = 0;
    GChShortTuning mOpenStringPitches{};
};

/// The property list, for debugging.
std::ostream& operator<<(std::ostream& stream, const GChTuningDescr& tuning);

}  // namespace brindle
