// SPDX-License-Identifier: MIT
// The debugging prints of the analysis records: their JSON text, except for the copy, which has
// none.

#include "brindle/analysis/CHarmCopy.h"
#include "brindle/analysis/CHarmonicAnalyse.h"

#include <ostream>

namespace brindle {

namespace {

template <class T>
std::ostream& Print(std::ostream& stream, const T& value) {
    value.AppendJSONString(stream);
    return stream;
}

}  // namespace

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChord& chord) {
    return Print(stream, chord);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChordWithPos& chord) {
    return Print(stream, chord);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChordWithLength& chord) {
    return Print(stream, chord);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChords& chords) {
    return Print(stream, chords);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsCenter& center) {
    return Print(stream, center);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsCenters& centers) {
    return Print(stream, centers);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsSignKey& signKey) {
    return Print(stream, signKey);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsSignKeys& signKeys) {
    return Print(stream, signKeys);
}

std::ostream& operator<<(std::ostream& stream, const CHarmonicAnalyse& analyse) {
    return Print(stream, analyse);
}

std::ostream& operator<<(std::ostream& stream, const CHarmCopy& copy) {
    return stream << "CHarmCopy: TargetPos " << copy.mTargetPos << " Source OffsetBars "
                  << copy.mSourceOffsetBars << " Chords " << copy.mChords << ", Length Bars "
                  << copy.mLengthBars << " Chords " << copy.mChords;
}

}  // namespace brindle
