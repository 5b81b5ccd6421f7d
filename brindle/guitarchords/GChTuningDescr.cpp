// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChTuningDescr.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstddef>

namespace brindle {

namespace {

constexpr int kCapodasterEnd = 32;
constexpr int kNoCapodaster = 255;

bool IsPitch(std::uint8_t byte) {
    return static_cast<std::int8_t>(byte) > 0;
}

}  // namespace

GChTuningDescr::GChTuningDescr(const GChShortTuning& tuning, int capodasterOffset)
    : mOpenStringPitches(tuning) {
    setCapodasterOffset(capodasterOffset);
    setNumberOfStrings(GChNumberOfStringsInShortTuning(tuning));
}

int GChTuningDescr::openStringPitchForStringIndex(int stringIndex) const {
    if (stringIndex < 0 || stringIndex >= _UsedStrings()) return -1;
    return mOpenStringPitches[static_cast<std::size_t>(stringIndex)];
}

void GChTuningDescr::setOpenStringPitch(int pitch, int stringIndex) {
    if (stringIndex < 0 || stringIndex >= kGChMaxStrings) return;
    mOpenStringPitches[static_cast<std::size_t>(stringIndex)] = static_cast<std::uint8_t>(pitch);
}

bool GChTuningDescr::isValid() const {
    const bool isCapodaster =
        mCapodasterOffset < kCapodasterEnd || mCapodasterOffset == kNoCapodaster;
    return isCapodaster && mNumberOfStrings <= kGChMaxStrings &&
           std::all_of(mOpenStringPitches.begin(), mOpenStringPitches.begin() + _UsedStrings(),
                       IsPitch);
}

bool GChTuningDescr::isEqualToTuningDescr(const GChTuningDescr& other) const {
    return mCapodasterOffset == other.mCapodasterOffset && isEqualToTuningStrings(other);
}

bool GChTuningDescr::isEqualToTuningStrings(const GChTuningDescr& other) const {
    return mNumberOfStrings == other.mNumberOfStrings &&
           std::equal(mOpenStringPitches.begin(), mOpenStringPitches.begin() + _UsedStrings(),
                      other.mOpenStringPitches.begin());
}

nlohmann::json GChTuningDescr::propertyList() const {
    nlohmann::json pitches = nlohmann::json::array();
    for (int i = 0; i < _UsedStrings(); ++i) pitches.push_back(openStringPitchForStringIndex(i));
    return {{"openStringPitches", std::move(pitches)}, {"capodasterOffset", mCapodasterOffset}};
}

int GChTuningDescr::_UsedStrings() const {
    return std::min<int>(mNumberOfStrings, kGChMaxStrings);
}

}  // namespace brindle
