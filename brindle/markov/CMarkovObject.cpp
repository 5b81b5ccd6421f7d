// SPDX-License-Identifier: MIT
#include "brindle/markov/CMarkovObject.h"

#include <cmath>
#include <functional>
#include <ostream>

namespace brindle {
namespace {

// What is not a number comes first: without a place of its own it would equal all numbers, and
// there would be no order.
bool NumberComesBefore(double a, double b) {
    return std::isnan(a) ? !std::isnan(b) : a < b;
}

bool ChordComesBefore(const CHarmAnlsChordWithLength& a, const CHarmAnlsChordWithLength& b) {
    if (a.mRootDistToHarmCenter != b.mRootDistToHarmCenter) {
        return a.mRootDistToHarmCenter < b.mRootDistToHarmCenter;
    }
    if (NumberComesBefore(a.mLength, b.mLength)) return true;
    if (NumberComesBefore(b.mLength, a.mLength)) return false;
    if (a.mBassDistToHarmCenter != b.mBassDistToHarmCenter) {
        return a.mBassDistToHarmCenter < b.mBassDistToHarmCenter;
    }
    return a.mSemitones.Mask() < b.mSemitones.Mask();
}

}  // namespace

std::size_t CMarkovObject::Hash() const {
    // The fields in which the symbols of real sequences differ; std::hash takes 0.0 and -0.0 for
    // one.
    std::size_t hash = std::hash<double>{}(mChord.mLength);
    const auto mix = [&hash](auto value) {
        hash = (hash ^ static_cast<std::size_t>(value)) * 0x9E3779B97F4A7C15U;
        hash ^= hash >> 29U;
    };
    mix(mType);
    mix(mIndex);
    mix(mNumber);
    mix(std::hash<double>{}(mValue));
    mix(mChord.mSemitones.Mask());
    mix(mChord.mRootKeyEnh.mKeyNr);
    mix(mChord.mRootKeyEnh.mEnh);
    mix(mChord.mBassKeyEnh.mKeyNr);
    mix(mChord.mBassKeyEnh.mEnh);
    mix(mChord.mRootDistToHarmCenter);
    mix(mChord.mBassDistToHarmCenter);
    return hash;
}

bool operator<(const CMarkovObject& a, const CMarkovObject& b) {
    if (a.mType != b.mType) return a.mType < b.mType;
    switch (a.mType) {
        case TMarkovObjectType_Chord:
            return ChordComesBefore(a.mChord, b.mChord);
        case TMarkovObjectType_Number:
            return a.mNumber < b.mNumber;
        case TMarkovObjectType_Value:
            return NumberComesBefore(a.mValue, b.mValue);
        case TMarkovObjectType_Indexed:
            return a.mIndex < b.mIndex;
    }
    return false;
}

std::ostream& operator<<(std::ostream& stream, const CMarkovObject& object) {
    return stream << "CMarkovObject: type " << object.mType << ", index " << object.mIndex << ", "
                  << object.mChord;
}

}  // namespace brindle
